#include "CanvasTestTools.h"

#include "canvas/InputLanguageFonts.h"
#include "canvas/StyleComparison.h"
#include "canvas/StyleDocument.h"

#include <QTest>
#include <cmath>
#include <limits>

// The style records of a text object without any layout.
class tst_styledocument : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void scriptClass_data();
    void scriptClass();
    void fontTables();
    void lastFontIsSharedByAllRows();
    void substituteFamily();
    void shadowScale_data();
    void shadowScale();
    void shadowOfRecordWithoutCharacters();
    void shadowOfAbsurdSizeStaysBounded();
    void removingTheLastCharacterKeepsItsStyle();
    void positionsOutOfRangeChangeNothing();
    void neighbourStyle();
    void latinAfterAsianTakesTheLatinFamily();
    void markKeepsTheFamilyOfItsBase();
    void longRunsAreSplit();
    void pairsSurviveNormalising();
    void tooLongRecordIsCut();
    void impossiblePlaceBecomesUsable();
    void synchroniseMakesEqualCopies();
    void characterProperties();
    void overallProperties();
    void sameStyles();
};

void tst_styledocument::init()
{
    InputLanguageFonts::resetLastFonts();
    InputLanguageFonts::mInputLanguage = 2;
    InputLanguageFonts::IS_CN_MODULE = false;
}

void tst_styledocument::scriptClass_data()
{
    QTest::addColumn<QChar>("character");
    QTest::addColumn<int>("expected");
    QTest::newRow("space") << QChar(' ') << 0;
    QTest::newRow("tilde") << QChar('~') << 0;
    QTest::newRow("e acute") << QChar(0x00E9) << 0;
    QTest::newRow("y diaeresis, end of the code page") << QChar(0x00FF) << 0;
    QTest::newRow("delete, start of the code page half") << QChar(0x007F) << 0;
    QTest::newRow("extended A") << QChar(0x0160) << 0;
    QTest::newRow("extended additional") << QChar(0x1EA0) << 0;
    QTest::newRow("after extended B") << QChar(0x0250) << 1;
    QTest::newRow("line break") << QChar('\n') << 1;
    QTest::newRow("Chinese") << QChar(0x5FEB) << 1;
    QTest::newRow("kana") << QChar(0x3042) << 1;
    QTest::newRow("Hangul") << QChar(0xAC00) << 1;
    QTest::newRow("won sign") << QChar(0xFFE6) << 0;
    QTest::newRow("quotation mark") << QChar(0x201C) << 1;
}

void tst_styledocument::scriptClass()
{
    QFETCH(QChar, character);
    QFETCH(int, expected);
    QCOMPARE(InputLanguageFonts::getSoftkeyboardMode(character), expected);
}

void tst_styledocument::fontTables()
{
    using namespace SystemSetupDef;
    QCOMPARE(InputLanguageFonts::languageRow(emInputLanguageJapanese), 2);
    QCOMPARE(InputLanguageFonts::languageRow(emInputLanguageKorean), 3);
    QCOMPARE(InputLanguageFonts::languageRow(emInputLanguageChineseSimplified), 0);
    QCOMPARE(InputLanguageFonts::languageRow(emInputLanguageChineseMixed), 1);
    QCOMPARE(InputLanguageFonts::languageRow(emInputLanguageType(42)), 4);

    const QStringList asian{"DFHeiW5-A", "DFHeiW5-A", "KST Japanese Pro", "YDGothic 100 Pro", "KST"};
    const QStringList latin{"DFHeiW5-A", "KST", "KST", "KST", "KST"};
    for (int row = 0; row < InputLanguageFonts::LANGUAGE_ROWS; ++row) {
        InputLanguageFonts::mInputLanguage = row;
        QCOMPARE(InputLanguageFonts::getDefaultFontAccordingToLanguage(QChar(0x5FEB), false), asian.at(row));
        QCOMPARE(InputLanguageFonts::getDefaultFontAccordingToLanguage(QChar('a'), false), latin.at(row));
    }
}

void tst_styledocument::lastFontIsSharedByAllRows()
{
    InputLanguageFonts::replaceLastFontWithCurrentCharFont(QChar('a'), "DejaVu Sans");
    for (const auto& row : InputLanguageFonts::LAST_KEEPED_FONT)
        QCOMPARE(row[InputLanguageFonts::Latin], QStringLiteral("DejaVu Sans"));
    QCOMPARE(InputLanguageFonts::LAST_KEEPED_FONT[2][InputLanguageFonts::Asian],
             QStringLiteral("KST Japanese Pro"));
    QCOMPARE(InputLanguageFonts::LANGUAGE_DEFAULT_FONT[2][InputLanguageFonts::Latin], QStringLiteral("KST"));
}

void tst_styledocument::substituteFamily()
{
    QCOMPARE(InputLanguageFonts::substituteFamily(), QStringLiteral("KST Japanese Pro"));
    InputLanguageFonts::mInputLanguage = 3;
    QCOMPARE(InputLanguageFonts::substituteFamily(), QStringLiteral("YDGothic 100 Pro"));
    InputLanguageFonts::IS_CN_MODULE = true;
    QCOMPARE(InputLanguageFonts::substituteFamily(), QStringLiteral("DFHeiW5-A"));
}

void tst_styledocument::shadowScale_data()
{
    QTest::addColumn<int>("smallest");
    QTest::addColumn<int>("offset");
    QTest::addColumn<double>("blur");
    QTest::newRow("17") << 17 << 0 << 1.0;
    QTest::newRow("18") << 18 << 4 << 16.0;
    QTest::newRow("51") << 51 << 4 << 16.0;
    QTest::newRow("52") << 52 << 8 << 32.0;
    QTest::newRow("96") << 96 << 12 << 48.0;
}

void tst_styledocument::shadowScale()
{
    QFETCH(int, smallest);
    QFETCH(int, offset);
    QFETCH(double, blur);
    TText record = makeRecord("ab", 1, "KST", 200);
    record.textItems()[1]->setFontSize(smallest);
    record.getTextShadow()->setShadowDirectionX(-4);
    record.getTextShadow()->setShadowDirectionY(4);
    StyleDocument::setItemShadowInfo(record);
    QCOMPARE(record.getTextShadow()->getShadowDirectionX(), -offset);
    QCOMPARE(record.getTextShadow()->getShadowDirectionY(), offset);
    QCOMPARE(record.getTextShadow()->getShadowBlurRadius(), blur);
}

void tst_styledocument::shadowOfRecordWithoutCharacters()
{
    TText record;
    record.getTextShadow()->setShadowDirectionX(4);
    StyleDocument::setItemShadowInfo(record);
    QCOMPARE(record.getTextShadow()->getShadowDirectionX(), 4);
    QCOMPARE(record.getTextShadow()->getShadowBlurRadius(), 18.3);
    QCOMPARE(StyleDocument::getMinmumSize(record), 20);
}

void tst_styledocument::shadowOfAbsurdSizeStaysBounded()
{
    TText record = makeRecord("a", 1, "KST", std::numeric_limits<int>::max());
    record.getTextShadow()->setShadowDirectionX(1);
    StyleDocument::setItemShadowInfo(record);
    QVERIFY(record.getTextShadow()->getShadowBlurRadius() < 500.0);
    record.textItems()[0]->setFontSize(-5);
    StyleDocument::setItemShadowInfo(record);
    QCOMPARE(record.getTextShadow()->getShadowBlurRadius(), 1.0);
}

void tst_styledocument::removingTheLastCharacterKeepsItsStyle()
{
    StyleDocument document;
    TText record = makeRecord("ab");
    record.setTextAlign(1);
    record.textItems()[1]->setFontBold(1);
    document.setCurrent(record);
    QVERIFY(!document.remove(0));
    QVERIFY(document.remove(0));
    QVERIFY(document.isEmpty());
    QCOMPARE(document.lastAlpha().textItems().size(), size_t(1));
    QCOMPARE(document.lastAlpha().textItems()[0]->isFontBold(), 1);
    QCOMPARE(document.lastAlpha().getTextAlign(), 1);
    QCOMPARE(document.lastAlpha().getTextObjectID(), 0);
}

void tst_styledocument::positionsOutOfRangeChangeNothing()
{
    StyleDocument document;
    document.setCurrent(makeRecord("ab"));
    QVERIFY(!document.remove(-1));
    QVERIFY(!document.remove(2));
    QCOMPARE(document.at(2), nullptr);
    std::vector<std::unique_ptr<TextStyle>> styles;
    styles.push_back(std::make_unique<TextStyle>());
    document.insert(7, std::move(styles));
    QCOMPARE(document.count(), 2);
}

void tst_styledocument::neighbourStyle()
{
    StyleDocument document;
    TText record = makeRecord("ab");
    record.textItems()[0]->setFontSize(40);
    record.textItems()[1]->setFontSize(50);
    document.setCurrent(record);
    TextStyle style;
    document.copyNeighbourStyle(2, false, QChar('c'), style);
    QCOMPARE(style.getFontSize(), 50);
    document.copyNeighbourStyle(1, false, QChar('c'), style);
    QCOMPARE(style.getFontSize(), 40);
    document.copyNeighbourStyle(1, true, QChar('c'), style);
    QCOMPARE(style.getFontSize(), 50);
    // There is no character before the first one, so its own style is used.
    document.copyNeighbourStyle(0, false, QChar('c'), style);
    QCOMPARE(style.getFontSize(), 40);
}

void tst_styledocument::latinAfterAsianTakesTheLatinFamily()
{
    StyleDocument document;
    document.setCurrent(makeRecord(QString::fromUtf8("快"), 1, "DFHeiW5-A"));
    InputLanguageFonts::replaceLastFontWithCurrentCharFont(QChar('a'), "DejaVu Sans");
    TextStyle style;
    document.copyNeighbourStyle(1, false, QChar('a'), style);
    QCOMPARE(style.getFontFamily(), std::string("DejaVu Sans"));
    document.copyNeighbourStyle(1, false, QChar(0x8BAF), style);
    QCOMPARE(style.getFontFamily(), std::string("DFHeiW5-A"));
    // A line break in between suppresses the change.
    document.setCurrent(makeRecord(QString::fromUtf8("快\n"), 1, "DFHeiW5-A"));
    document.copyNeighbourStyle(2, false, QChar('a'), style);
    QCOMPARE(style.getFontFamily(), std::string("DFHeiW5-A"));
}

void tst_styledocument::markKeepsTheFamilyOfItsBase()
{
    StyleDocument document;
    document.setCurrent(makeRecord("e", 1, "DejaVu Sans"));
    TextStyle style;
    document.copyNeighbourStyle(1, false, QChar(0x0301), style);
    QCOMPARE(style.getFontFamily(), std::string("DejaVu Sans"));
}

void tst_styledocument::longRunsAreSplit()
{
    TText record = makeRecord("x");
    record.textItems()[0]->setText("Ab\r\nc");
    record.textItems()[0]->setFontSize(33);
    StyleDocument::normalise(record);
    QCOMPARE(record.textItems().size(), size_t(4));
    QCOMPARE(textOfStyles(record), QStringLiteral("Ab\nc"));
    for (const TextStyle* style : record.textItems())
        QCOMPARE(style->getFontSize(), 33);
}

void tst_styledocument::pairsSurviveNormalising()
{
    const QString smile = QString::fromUtf8("😀");
    TText record = makeRecord("a" + smile + "b");
    record.textItems()[2]->setFontSize(11);
    StyleDocument::normalise(record);
    QCOMPARE(record.textItems().size(), size_t(4));
    QCOMPARE(record.textItems()[1]->getText(), smile.toStdString());
    QCOMPARE(record.textItems()[2]->getText(), std::string());
    QCOMPARE(record.textItems()[2]->getFontSize(), 11);
    // A missing second half of a pair is added, and a second half without a first one is removed.
    TText foreign = makeRecord("ab");
    foreign.textItems()[0]->setText(smile.toStdString());
    foreign.textItems()[1]->setText(std::string());
    TText lonely = makeRecord("ab");
    lonely.textItems()[1]->setText(std::string());
    StyleDocument::normalise(foreign);
    StyleDocument::normalise(lonely);
    QCOMPARE(foreign.textItems().size(), size_t(2));
    QCOMPARE(textOfStyles(lonely), QStringLiteral("a"));
    QCOMPARE(lonely.textItems().size(), size_t(1));
}

void tst_styledocument::tooLongRecordIsCut()
{
    TText record = makeRecord(QString(200, 'a') + "\n" + QString(150, 'b') + "\n");
    StyleDocument::normalise(record);
    QCOMPARE(record.textItems().size(), size_t(302));
    QCOMPARE(textOfStyles(record), QString(200, 'a') + "\n" + QString(100, 'b') + "\n");
}

void tst_styledocument::impossiblePlaceBecomesUsable()
{
    TText record = makeRecord("a");
    record.setXValue(std::numeric_limits<float>::quiet_NaN());
    record.setYValue(1e30F);
    record.setZValue(-std::numeric_limits<float>::infinity());
    StyleDocument::normalise(record);
    QCOMPARE(record.getXValue(), 0.0F);
    QVERIFY(std::isfinite(record.getYValue()) && record.getYValue() < 1e6F);
    QCOMPARE(record.getZValue(), 0.0F);
}

void tst_styledocument::synchroniseMakesEqualCopies()
{
    const QStringList texts{"", "a", "abc", "abXc", "bc", "abcabc", "xabc", "abc\n"};
    for (const QString& from : texts) {
        for (const QString& to : texts) {
            TText source = makeRecord(from);
            source.setXValue(7.0F);
            TText target = makeRecord(to, 3);
            StyleDocument::synchronise(target, source);
            QVERIFY(target == source);
            for (size_t i = 0; i < source.textItems().size(); ++i)
                QVERIFY(target.textItems()[i] != source.textItems()[i]);
        }
    }
    TText source = makeRecord("a");
    TText target = source;
    source.textItems()[0]->setAlphaDefaultFontOfInputLanguage("DejaVu Sans");
    StyleDocument::synchronise(target, source);
    QCOMPARE(target.textItems()[0]->getAlphaDefaultFontOfInputLanguage(), std::string("DejaVu Sans"));
}

void tst_styledocument::characterProperties()
{
    TextStyle source = makeStyle("s", "DejaVu Sans", 50);
    source.setFontBold(1);
    source.setIsTextItalic(1);
    source.setFontColor("#123456");
    source.setIsTextEdge(1);
    TEdge edge;
    edge.setEdgeWidth(9);
    source.setTextEdge(edge);
    source.setTextKerning(120);

    const auto changed = [&source](int id) {
        TextStyle target = makeStyle("t");
        StyleDocument::setCharacterProperty(id, target, source);
        return target;
    };
    QCOMPARE(changed(0).getFontFamily(), std::string("DejaVu Sans"));
    QCOMPARE(InputLanguageFonts::LAST_KEEPED_FONT[0][InputLanguageFonts::Latin],
             QStringLiteral("DejaVu Sans"));
    QCOMPARE(changed(1).getFontSize(), 50);
    QCOMPARE(changed(2).isFontBold(), 1);
    QCOMPARE(changed(3).isTextItalic(), 1);
    QCOMPARE(changed(4).getFontColor(), std::string("#123456"));
    for (const int id : {5, 6, 7}) {
        QCOMPARE(changed(id).isTextEdge(), 1);
        QCOMPARE(changed(id).getTextEdge().getEdgeWidth(), 9);
        QCOMPARE(changed(id).getFontSize(), 96);
    }
    QCOMPARE(changed(10).getTextKerning(), 120);
    QVERIFY(changed(8) == makeStyle("t"));
    QVERIFY(changed(99) == makeStyle("t"));
}

void tst_styledocument::overallProperties()
{
    StyleDocument document;
    document.setCurrent(makeRecord("a"));
    TText source;
    source.setShadowStyle(2);
    source.getTextShadow()->setShadowDirectionY(4);
    source.setTextAlign(1);
    document.setOverallProperty(8, source);
    QCOMPARE(document.current().getShadowStyle(), 2);
    QCOMPARE(document.current().getTextAlign(), -1);
    document.setOverallProperty(9, source);
    QCOMPARE(document.current().getTextAlign(), 1);
    QCOMPARE(document.lastAlpha().getTextAlign(), -1);
    document.remove(0);
    source.setTextAlign(0);
    document.setOverallProperty(9, source);
    QCOMPARE(document.lastAlpha().getTextAlign(), 0);
}

void tst_styledocument::sameStyles()
{
    QVERIFY(StyleComparison::isTheSame(makeRecord("")));
    QVERIFY(StyleComparison::isTheSame(makeRecord("a")));
    QVERIFY(StyleComparison::isTheSame(makeRecord("abc")));

    TText sizes = makeRecord("ab");
    sizes.textItems()[1]->setFontSize(40);
    QVERIFY(!StyleComparison::isTheSame(sizes));
    sizes.textItems()[0]->setFontSize(-1);
    QVERIFY(StyleComparison::isTheSame(sizes));

    TText families = makeRecord("ab");
    families.textItems()[1]->setFontFamily("DejaVu Sans");
    QVERIFY(!StyleComparison::isTheSame(families));
    families.textItems()[0]->setFontFamily("");
    QVERIFY(StyleComparison::isTheSame(families));

    // The texts only count as different if the first character has the property.
    TText bold = makeRecord("ab");
    bold.textItems()[1]->setFontBold(1);
    QVERIFY(StyleComparison::isTheSame(bold));
    bold.textItems()[0]->setFontBold(1);
    bold.textItems()[1]->setFontBold(0);
    QVERIFY(!StyleComparison::isTheSame(bold));

    TText edges = makeRecord("ab");
    TEdge wide;
    wide.setEdgeWidth(30);
    edges.textItems()[1]->setTextEdge(wide);
    QVERIFY(!StyleComparison::isTheSame(edges));
}

QTEST_GUILESS_MAIN(tst_styledocument)
#include "tst_styledocument.moc"
