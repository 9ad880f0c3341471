// Changing a text of a title: which styles the characters take, and where it stands afterwards.
#include "canvas/StyleDocument.h"
#include "document/TText.h"
#include "document/TextStyle.h"
#include "tests/library/LibraryFixture.h"
#include "titlectl/TitleTexts.h"

#include <QTest>
#include <memory>

namespace
{

// Makes a text whose characters have the sizes 40, 41, 42, ...
std::unique_ptr<TText> numbered(const QString& characters)
{
    std::unique_ptr<TText> text(LibraryFixture::makeText(characters, 1));
    for (std::size_t i = 0; i < text->textItems().size(); ++i) {
        text->textItems()[i]->setText(StyleDocument::storedText(characters, qsizetype(i)).toStdString());
        text->textItems()[i]->setFontSize(40 + int(i));
    }
    return text;
}

QList<int> sizes(const TText& text)
{
    QList<int> list;
    for (const TextStyle* style : text.textItems())
        list.append(style->getFontSize());
    return list;
}

} // namespace

class tst_titletexts : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void stylesOfTheCharacters_data();
    void stylesOfTheCharacters();
    void pairsStayWhole();
    void alignmentKeepsItsPlace_data();
    void alignmentKeepsItsPlace();
    void textWithoutRuns();
    void findById();
};

void tst_titletexts::stylesOfTheCharacters_data()
{
    QTest::addColumn<QString>("before");
    QTest::addColumn<QString>("after");
    QTest::addColumn<QList<int>>("sizes");
    QTest::newRow("the same") << "abc"
                              << "abc" << QList<int>{40, 41, 42};
    QTest::newRow("another text") << "abc"
                                  << "xyzw" << QList<int>{40, 40, 40, 40};
    QTest::newRow("in the middle") << "abcd"
                                   << "axyd" << QList<int>{40, 41, 41, 43};
    QTest::newRow("added at the end") << "ab"
                                      << "abc" << QList<int>{40, 41, 41};
    QTest::newRow("added at the beginning") << "ab"
                                            << "xab" << QList<int>{40, 40, 41};
    QTest::newRow("added in the middle") << "ab"
                                         << "axb" << QList<int>{40, 40, 41};
    QTest::newRow("removed") << "abcd"
                             << "ad" << QList<int>{40, 43};
    QTest::newRow("a repeated letter") << "aa"
                                       << "aaa" << QList<int>{40, 41, 41};
    QTest::newRow("a new line") << "ab"
                                << "a\nb" << QList<int>{40, 40, 41};
}

void tst_titletexts::stylesOfTheCharacters()
{
    QFETCH(QString, before);
    QFETCH(QString, after);
    QFETCH(QList<int>, sizes);
    const auto text = numbered(before);
    TitleTexts::replace(*text, after);
    QCOMPARE(TitleTexts::plainText(*text), after);
    QCOMPARE(QString::fromStdString(text->getText()), after);
    QCOMPARE(::sizes(*text), sizes);
}

void tst_titletexts::pairsStayWhole()
{
    // Two characters of two units each whose first units are the same, then two whose second units are.
    const char32_t first[] = {0x1F600, 0x1F601, 0};
    const char32_t changed[] = {0x1F600, 0x1F602, 0};
    const QString after = QString::fromUcs4(changed);
    const auto text = numbered(QString::fromUcs4(first));
    TitleTexts::replace(*text, after);
    QCOMPARE(TitleTexts::plainText(*text), after);
    QCOMPARE(text->textItems().size(), std::size_t(4));
    QVERIFY(text->textItems()[1]->getText().empty());
    QVERIFY(text->textItems()[3]->getText().empty());
}

void tst_titletexts::alignmentKeepsItsPlace_data()
{
    QTest::addColumn<int>("align");
    QTest::addColumn<double>("share"); // of the added width that the text moves to the left
    QTest::newRow("left") << -1 << 0.0;
    QTest::newRow("centre") << 0 << 0.5;
    QTest::newRow("right") << 1 << 1.0;
}

void tst_titletexts::alignmentKeepsItsPlace()
{
    QFETCH(int, align);
    QFETCH(double, share);
    std::unique_ptr<TText> right(LibraryFixture::makeText("ab", 1, 300, 100));
    right->setTextAlign(1);
    TitleTexts::replace(*right, "abcdefg");
    const double added = 300 - double(right->getXValue());
    QVERIFY(added > 50);

    std::unique_ptr<TText> text(LibraryFixture::makeText("ab", 1, 300, 100));
    text->setTextAlign(align);
    TitleTexts::replace(*text, "abcdefg");
    QVERIFY(qAbs(300 - double(text->getXValue()) - share * added) < 0.01);
    QCOMPARE(text->getYValue(), 100.0F);
}

void tst_titletexts::textWithoutRuns()
{
    TText text;
    TitleTexts::replace(text, "ab");
    QCOMPARE(TitleTexts::plainText(text), QString("ab"));
    QCOMPARE(text.textItems().front()->getFontSize(), TextStyle().getFontSize());
}

void tst_titletexts::findById()
{
    Archive archive;
    archive.setText({LibraryFixture::makeText("a", 3), LibraryFixture::makeText("b", 1)});
    QCOMPARE(TitleTexts::find(archive, 1), archive.text()[1]);
    QCOMPARE(TitleTexts::find(archive, 2), nullptr);
}

QTEST_MAIN(tst_titletexts)
#include "tst_titletexts.moc"
