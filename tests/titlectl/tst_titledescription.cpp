// A title as JSON and as lines.
#include "tests/library/LibraryFixture.h"
#include "titlectl/TitleDescription.h"

#include <QJsonArray>
#include <QTest>

class tst_titledescription : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void json();
    void runsOfEqualStyle();
    void lines();
};

void tst_titledescription::json()
{
    const auto archive = LibraryFixture::makeRecord("/f", "t", "Text");
    archive->setBgResourceBig("t_source_1920.png");
    archive->text().front()->setTextAlign(0);
    const QJsonObject title = TitleDescription(*archive).json();
    QCOMPARE(title["file"].toString(), QString("/f/t.xml"));
    QCOMPARE(title["background"]["1920"].toString(), QString("t_source_1920.png"));
    QCOMPARE(title["pictures"]["960"].toString(), QString("t_960.png"));
    const QJsonObject text = title["texts"][0].toObject();
    QCOMPARE(text["id"].toInt(), 1);
    QCOMPARE(text["text"].toString(), QString("Text"));
    QCOMPARE(text["align"].toString(), QString("centre"));
    QCOMPARE(text["x"].toDouble(), 100.0);
    QCOMPARE(text["runs"].toArray().size(), 1);
}

void tst_titledescription::runsOfEqualStyle()
{
    const auto archive = LibraryFixture::makeRecord("/f", "t", "abcd");
    const auto& styles = archive->text().front()->textItems();
    styles[1]->setFontSize(50);
    styles[2]->setFontSize(50);
    const QJsonArray runs = TitleDescription(*archive).json()["texts"][0]["runs"].toArray();
    QStringList texts;
    for (const auto& run : runs)
        texts.append(run.toObject()["text"].toString());
    QCOMPARE(texts, (QStringList{"a", "bc", "d"}));
    QCOMPARE(runs.at(1).toObject()["size"].toInt(), 50);
}

void tst_titledescription::lines()
{
    const auto archive = LibraryFixture::makeRecord("/f", "t", "a\\b\nc");
    const QStringList lines = TitleDescription(*archive).lines();
    QCOMPARE(lines.first(), QString("/f/t.xml"));
    QVERIFY(lines.contains("  1=a\\\\b\\nc")); // as the command that changes texts takes it
}

QTEST_MAIN(tst_titledescription)
#include "tst_titledescription.moc"
