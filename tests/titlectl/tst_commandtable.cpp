// The commands and what the program says about them; how a wrong command line and a folder in use are
// refused.
#include "RenderedFolder.h"
#include "support/FolderLock.h"
#include "titlectl/Command.h"
#include "titlectl/CommandTable.h"
#include "titlectl/ProgramTexts.h"

#include <QBuffer>
#include <QJsonArray>
#include <QJsonDocument>
#include <QJsonObject>
#include <QSet>
#include <QTest>

class tst_commandtable : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void textsNameEveryCommandAndOption();
    void wrongUse_data();
    void wrongUse();
    void helpOfACommand();
    void lockedFolder_data();
    void lockedFolder();
    void checkReportsAsJson();
    void setChangesTextAndPictures();

private:
    struct Result {
        int code;
        QByteArray result;
        QByteArray messages;
    };
    Result run(const QStringList& words) const
    {
        QBuffer result;
        QBuffer messages;
        result.open(QIODevice::WriteOnly);
        messages.open(QIODevice::WriteOnly);
        const int code = m_table.run(words, result, messages, false);
        FileSyncQueue::flush(std::chrono::seconds(30));
        return {code, result.data(), messages.data()};
    }

    LibraryFixture m_fixture;
    CommandTable m_table;
};

void tst_commandtable::textsNameEveryCommandAndOption()
{
    const ProgramTexts texts(m_table);
    QSet<QString> names;
    for (const auto& command : m_table.commands()) {
        const QString name = command->name();
        QVERIFY(!names.contains(name));
        names.insert(name);
        QCOMPARE(m_table.find(name), command.get());
        QVERIFY(texts.help().contains("  " + name + ' '));
        QVERIFY(texts.manPage().contains(".B " + name + '\n'));
        QVERIFY(texts.completion().contains("        " + name + ") options="));
        for (const CommandOption& option : CommandTable::optionsOf(*command)) {
            QVERIFY(ProgramTexts::helpFor(*command).contains("--" + option.name));
            QVERIFY(texts.completion().contains("--" + option.name));
            QVERIFY(texts.manPage().contains(".B \\-\\-" + QString(option.name).replace('-', "\\-")));
        }
    }
    QVERIFY(names.contains("render") && names.contains("check"));
    for (const char* word : {"--help", "--man-page", "--completion", "--version"}) {
        const Result result = run({word});
        QCOMPARE(result.code, 0);
        QVERIFY(result.result.size() > 5);
        QVERIFY(result.messages.isEmpty());
    }
}

void tst_commandtable::wrongUse_data()
{
    QTest::addColumn<QStringList>("words");
    QTest::addColumn<QByteArray>("reason");
    QTest::newRow("nothing") << QStringList{} << QByteArray("a command is missing");
    QTest::newRow("unknown command") << QStringList{"paint"} << QByteArray("there is no command paint");
    QTest::newRow("unknown option") << QStringList{"render", "--fast", "x"} << QByteArray("no option --fast");
    QTest::newRow("no operand") << QStringList{"render"} << QByteArray("render expects PATH...");
    QTest::newRow("too many operands") << QStringList{"show", "a", "b"} << QByteArray("show expects PATH");
    QTest::newRow("no path") << QStringList{"check"} << QByteArray("check expects PATH...");
    QTest::newRow("missing path") << QStringList{"check", "/nowhere"}
                                  << QByteArray("/nowhere does not exist");
    QTest::newRow("unknown rule") << QStringList{"check", "--without", "x,", "/tmp"}
                                  << QByteArray("no rule x");
    QTest::newRow("jobs") << QStringList{"render", "--jobs", "0", "/tmp"} << QByteArray("from 1 to");
    QTest::newRow("only") << QStringList{"render", "--only", "7", "/tmp"} << QByteArray("1920, 960 or 240");
    QTest::newRow("kind of sheet") << QStringList{"sheet", "/tmp", "x.gif"} << QByteArray(".pdf nor in .png");
    QTest::newRow("set of a folder") << QStringList{"set", "/tmp", "1=a"} << QByteArray("/tmp is a folder");
}

void tst_commandtable::wrongUse()
{
    QFETCH(QStringList, words);
    QFETCH(QByteArray, reason);
    const Result result = run(words);
    QCOMPARE(result.code, 2);
    QVERIFY(result.result.isEmpty());
    QVERIFY2(result.messages.contains(reason), result.messages.constData());
}

void tst_commandtable::helpOfACommand()
{
    const Result result = run({"render", "--help"});
    QCOMPARE(result.code, 0);
    QVERIFY(result.result.startsWith("titlectl render [--out DIR]"));
}

void tst_commandtable::lockedFolder_data()
{
    QTest::addColumn<QStringList>("words");
    QTest::newRow("render") << QStringList{"render", "@"};
    QTest::newRow("check") << QStringList{"check", "@"};
    QTest::newRow("set") << QStringList{"set", "@/a.xml", "1=changed"};
    QTest::newRow("sheet") << QStringList{"sheet", "@", "@/../sheet.png"};
}

void tst_commandtable::lockedFolder()
{
    QFETCH(QStringList, words);
    const QString folder = renderedFolder(m_fixture, "locked", {"a"});
    words.replaceInStrings("@", folder);
    FolderLock window;
    QCOMPARE(window.take(folder.toStdString(), FolderLock::Kind::Exclusive), FolderLock::Result::Taken);
    const QMap<QString, QByteArray> before = picturesIn(folder);
    const Result refused = run(words);
    QCOMPARE(refused.code, 2);
    QVERIFY(refused.messages.contains("--force"));
    QCOMPARE(picturesIn(folder), before);
    QCOMPARE(run(words + QStringList{"--force"}).code, 0);
    window.release();
    QCOMPARE(run(words).code, 0);
    QCOMPARE(run({"show", folder}).code, 0);
}

void tst_commandtable::checkReportsAsJson()
{
    const QString folder = renderedFolder(m_fixture, "report", {"a", "b"});
    QCOMPARE(run({"check", folder}).code, 0);
    QVERIFY(QFile::remove(folder + "/a_960.png"));
    const Result result = run({"check", "--json", folder});
    QCOMPARE(result.code, 1);
    const QJsonObject report = QJsonDocument::fromJson(result.result).object();
    QCOMPARE(report["titles"].toInt(), 2);
    QCOMPARE(report["findings"].toArray().size(), 1);
    const QJsonObject finding = report["findings"][0].toObject();
    QCOMPARE(finding["file"].toString(), folder + "/a.xml");
    QCOMPARE(finding["object"].toString(), QString("picture 960"));
    QCOMPARE(finding["rule"].toString(), QString("picture-missing"));
    QCOMPARE(run({"check", "--without=picture-missing", folder}).code, 0);
}

void tst_commandtable::setChangesTextAndPictures()
{
    const QString folder = renderedFolder(m_fixture, "set", {"a", "changed"});
    const Result result = run({"set", "--json", folder + "/a.xml", "1=changed"});
    QCOMPARE(result.code, 0);
    QCOMPARE(QJsonDocument::fromJson(result.result)["texts"][0]["text"].toString(), QString("changed"));
    const QMap<QString, QByteArray> pictures = picturesIn(folder);
    for (const char* suffix : {"_1920.png", "_960.png", "_240.png", "_240S.png"})
        QCOMPARE(pictures.value(QString("a") + suffix), pictures.value(QString("changed") + suffix));
    QCOMPARE(run({"check", folder}).code, 0);
    const Result wrong = run({"set", folder + "/a.xml", "4=text"});
    QCOMPARE(wrong.code, 2);
    QVERIFY(wrong.messages.contains("has no text 4"));
}

QTEST_MAIN(tst_commandtable)
#include "tst_commandtable.moc"
