// The records of a title: defaults, deep copies, comparisons and full paths.
#include "document/Archive.h"
#include "document/ArchiveOrder.h"
#include "document/DocumentConstants.h"
#include "document/FontStyle.h"
#include "document/TText.h"

#include <QtTest/QTest>
#include <cmath>
#include <limits>
#include <memory>

namespace
{

TextStyle* newStyle(const std::string& text)
{
    auto* style = new TextStyle;
    style->setText(text);
    return style;
}

TText twoRuns()
{
    TText text;
    text.setTextItems({newStyle("a"), newStyle("中")});
    return text;
}

} // namespace

class tst_archive : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void defaults()
    {
        const TText text;
        QCOMPARE(text.getTextObjectID(), 0);
        QCOMPARE(text.getText(), std::string("Title Goes Here"));
        QCOMPARE(text.getXValue(), -1.0f);
        QCOMPARE(text.getYValue(), -1.0f);
        QCOMPARE(text.getZValue(), -1.0f);
        QCOMPARE(text.getTextAlign(), -1);
        QCOMPARE(text.getShadowStyle(), 0);
        QVERIFY(text.getTextItems().empty());
        QCOMPARE(text.getTextShadow()->getShadowColor(), std::string("#123123"));
        QCOMPARE(text.getTextShadow()->getShadowDirectionX(), 0);
        QCOMPARE(text.getTextShadow()->getShadowDirectionY(), 0);
        QCOMPARE(text.getTextShadow()->getShadowBlurRadius(), 18.3);

        const TextStyle style;
        QCOMPARE(style.getText(), DEFAULT_TEXT);
        QCOMPARE(style.getFontFamily(), std::string("KST"));
        QCOMPARE(style.getFontColor(), std::string("#FFFFFF"));
        QCOMPARE(style.getAlphaDefaultFontOfInputLanguage(), std::string("KST"));
        QCOMPARE(style.getFontSize(), 96);
        QCOMPARE(style.isFontBold(), 0);
        QCOMPARE(style.isTextItalic(), 0);
        QCOMPARE(style.getTextKerning(), 100);
        QCOMPARE(style.isTextEdge(), 0);
        QCOMPARE(style.getTextEdge().getEdgeColor(), std::string("#000000"));
        QCOMPARE(style.getTextEdge().getEdgeWidth(), 2);

        FontStyle font;
        QCOMPARE(font.getSize(), 96);
        QCOMPARE(font.getBold(), 0);
        QCOMPARE(font.getItalic(), 0);
        QCOMPARE(font.getShadowStyle(), 0);
        QCOMPARE(font.getEdge(), 0);
        QCOMPARE(font.getKerning(), 100);
        QCOMPARE(font.getAlign(), -1);
        QCOMPARE(font.getFamily(), std::string("KST"));
        QCOMPARE(font.getColor(), std::string("#FFFFFF"));
        QCOMPARE(font.getEdgePoint()->getEdgeWidth(), 2);
        QCOMPARE(font.getShadowPoint()->getShadowBlurRadius(), 18.3);

        const ArchiveOrder row;
        QCOMPARE(row.getArchiveIndex(), -1);
        QVERIFY(row.getArchivePath().empty());

        const Archive archive;
        QCOMPARE(archive.getOrder(), std::string(1, '\xff'));
        QCOMPARE(archive.getClip(), std::string("0"));
        QCOMPARE(archive.getGain(), std::string("0"));
        QCOMPARE(archive.getDensity(), std::string("100"));
        QCOMPARE(archive.getBgPointX(), 0.0f);
        QCOMPARE(archive.getBgPointZ(), -1.0f);
        for (const std::string& text2 :
             {archive.getName(), archive.getPath(), archive.getVersion(), archive.getCategory(),
              archive.getThumbnailSmall(), archive.getThumbnailBlack(), archive.getThumbnailBig(),
              archive.getThumbnailMiddle(), archive.getBgResource(), archive.getBgResourceBig()})
            QVERIFY(text2.empty());
        QVERIFY(archive.getText().empty());
        QVERIFY(!archive.isPreset());
    }

    void shadowsCountOnlyWithAStyle()
    {
        TText a, b;
        b.getTextShadow()->setShadowDirectionX(5);
        QVERIFY(a == b);
        a.setShadowStyle(-3);
        b.setShadowStyle(-3);
        QVERIFY(a == b);
        a.setShadowStyle(1);
        b.setShadowStyle(1);
        QVERIFY(!(a == b));
        QVERIFY(!a.shadowIsTheSame(b));
        b.setTextShadow(*a.getTextShadow());
        QVERIFY(a == b);
        b.setShadowStyle(2);
        QVERIFY(!(a == b));
        TShadow nan;
        nan.setShadowBlurRadius(std::numeric_limits<double>::quiet_NaN());
        QVERIFY(nan == nan);
        QVERIFY(!(nan == TShadow(nan)));
    }

    void edgesCountOnlyWhenOn()
    {
        TextStyle a, b;
        TEdge edge;
        edge.setEdgeWidth(9);
        b.setTextEdge(edge);
        QVERIFY(a == b && a.edgeIsTheSame(b));
        a.setIsTextEdge(-1);
        b.setIsTextEdge(-1);
        QVERIFY(!(a == b));
        QVERIFY(!a.edgeIsTheSame(b));
        a.setTextEdge(edge);
        QVERIFY(a == b);
        b.setIsTextEdge(1);
        QVERIFY(!(a == b));
    }

    void whatComparisonsLookAt()
    {
        TextStyle a, b;
        b.setAlphaDefaultFontOfInputLanguage("other");
        QVERIFY(a == b);
        b.setTextKerning(90);
        QVERIFY(a.fontIsTheSame(b) && !(a == b));
        b = a;
        b.setText("x");
        QVERIFY(a.fontIsTheSame(b) && !(a == b));
        const auto differs = [&](auto change) {
            b = a;
            change(b);
            return !a.fontIsTheSame(b) && !(a == b);
        };
        QVERIFY(differs([](TextStyle& s) { s.setFontFamily("F"); }));
        QVERIFY(differs([](TextStyle& s) { s.setFontSize(1); }));
        QVERIFY(differs([](TextStyle& s) { s.setFontColor("#000001"); }));
        QVERIFY(differs([](TextStyle& s) { s.setFontBold(1); }));
        QVERIFY(differs([](TextStyle& s) { s.setIsTextItalic(1); }));

        const TText text = twoRuns();
        const auto textDiffers = [&](auto change) {
            TText other(text);
            const bool isEqual = other == text;
            change(other);
            return isEqual && !(other == text);
        };
        QVERIFY(textDiffers([](TText& t) { t.setXValue(0); }));
        QVERIFY(textDiffers([](TText& t) { t.setYValue(0); }));
        QVERIFY(textDiffers([](TText& t) { t.setZValue(std::nanf("")); }));
        QVERIFY(textDiffers([](TText& t) { t.setTextObjectID(4); }));
        QVERIFY(textDiffers([](TText& t) { t.setText("x"); }));
        QVERIFY(textDiffers([](TText& t) { t.setTextAlign(1); }));
        QVERIFY(textDiffers([](TText& t) { t.getTextItems()[1]->setText("b"); }));
        QVERIFY(textDiffers([](TText& t) { t.releaseVectorTextStyle(); }));
        TText nan;
        nan.setXValue(std::nanf(""));
        QVERIFY(nan == nan && !(nan == TText(nan)));
    }

    void copiesAreDeep()
    {
        TText source = twoRuns();
        TText copy;
        copy = source;
        const TText constructed(source);
        QVERIFY(copy == source && constructed == source);
        QVERIFY(copy.getTextItems()[0] != source.getTextItems()[0]);
        QVERIFY(copy.getTextShadow() != source.getTextShadow());
        source.getTextItems()[0]->setText("changed");
        source.getTextShadow()->setShadowColor("#FFFFFF");
        QCOMPARE(copy.getTextItems()[0]->getText(), std::string("a"));
        QCOMPARE(copy.getTextShadow()->getShadowColor(), std::string("#123123"));

        TText& self = copy;
        copy = self;
        QCOMPARE(copy.getTextItems().size(), std::size_t(2));
        QCOMPARE(copy.getTextItems()[1]->getText(), std::string("中"));

        TextStyle style;
        TextStyle styleCopy(style);
        TEdge edge = style.getTextEdge();
        edge.setEdgeWidth(7);
        QCOMPARE(style.getTextEdge().getEdgeWidth(), 2);
        style.setTextEdge(edge);
        QCOMPARE(styleCopy.getTextEdge().getEdgeWidth(), 2);

        FontStyle font;
        FontStyle fontCopy(font);
        font.getEdgePoint()->setEdgeWidth(3);
        font.getShadowPoint()->setShadowBlurRadius(1);
        QCOMPARE(fontCopy.getEdgePoint()->getEdgeWidth(), 2);
        QCOMPARE(fontCopy.getShadowPoint()->getShadowBlurRadius(), 18.3);
    }

    void vectorsSharePointers()
    {
        TText text = twoRuns();
        std::vector<TextStyle*> items = text.getTextItems();
        items[0]->setText("in place");
        items.clear();
        QCOMPARE(text.getTextItems()[0]->getText(), std::string("in place"));
        const std::vector<TextStyle*> old = text.getTextItems();
        text.setTextItems({newStyle("new")});
        QCOMPARE(text.getTextItems().size(), std::size_t(1));
        QCOMPARE(old[1]->getText(), std::string("中")); // replaced, not freed
        for (const TextStyle* style : old)
            delete style;
        text.releaseVectorTextStyle();
        QVERIFY(text.getTextItems().empty());
    }

    void archivesAreDeepCopies()
    {
        Archive source;
        source.setName("name");
        source.setPath("/p/t.xml");
        source.setOrder("3");
        source.setCategory("category");
        source.setBgPointZ(-7);
        source.setDensity("50");
        source.setText({new TText(twoRuns()), new TText});
        auto copy = std::make_unique<Archive>(source);
        QCOMPARE(copy->getName(), std::string("name"));
        QCOMPARE(copy->getOrder(), std::string("3"));
        QCOMPARE(copy->getCategory(), std::string("category"));
        QCOMPARE(copy->getBgPointZ(), -7.0f);
        QCOMPARE(copy->getDensity(), std::string("50"));
        QVERIFY(copy->getText()[0] != source.getText()[0]);
        QVERIFY(*copy->getText()[0] == *source.getText()[0]);
        copy.reset();
        QCOMPARE(source.getText()[0]->getTextItems()[1]->getText(), std::string("中"));
        Archive& self = source;
        source = self;
        QCOMPARE(source.getText().size(), std::size_t(2));
        source.releaseVectorText();
        QVERIFY(source.getText().empty());
    }

    void fullPaths()
    {
        Archive archive;
        archive.setPath("/标题/folder/20260101.xml");
        QVERIFY(archive.getFullPathOfThumbnailSmall().isNull());
        QVERIFY(archive.getFullPathOfBgResource().isNull());
        QVERIFY(archive.getFullPathOfBgResourceBig().isNull());
        archive.setThumbnailSmall("/标题/folder/s.png");
        QCOMPARE(archive.getFullPathOfThumbnailSmall(), QString("/标题/folder/s.png"));
        archive.setThumbnailSmall("é_240.png");
        QCOMPARE(archive.getFullPathOfThumbnailSmall(), QString("/标题/folder/é_240.png"));
        archive.setBgResource("bg.png");
        archive.setBgResourceBig("/templates/big.png");
        QVERIFY(!archive.isPreset());
        QCOMPARE(archive.getFullPathOfBgResource(), QString("/标题/folder/bg.png"));
        QCOMPARE(archive.getFullPathOfBgResourceBig(), QString("/标题/folder//templates/big.png"));
        archive.setBgResource("/标题/folder/presets/bg.png");
        archive.setBgResourceBig("/标题/folder/presets/big.png");
        QVERIFY(archive.isPreset());
        QCOMPARE(archive.getFullPathOfBgResource(), QString("/标题/folder/presets/bg.png"));
        QCOMPARE(archive.getFullPathOfBgResourceBig(), QString("/标题/folder/presets/big.png"));
        // Elsewhere there are no pictures for titles; where there are, tst_archivemanager says.
        archive.setThumbnailSmall("/abs/s.png");
        archive.setBgResource("/templates/bg.png");
        archive.setBgResourceBig("big.png"); // as it stands, beside a background that is absolute
        QVERIFY(archive.isPreset());
        QVERIFY(archive.getFullPathOfThumbnailSmall().isNull());
        QVERIFY(archive.getFullPathOfBgResource().isNull());
        QVERIFY(archive.getFullPathOfBgResourceBig().isNull());
    }
};

QTEST_GUILESS_MAIN(tst_archive)
#include "tst_archive.moc"
