// What a command writes as lines, as JSON and while it works.
#include "titlectl/Output.h"

#include <QBuffer>
#include <QJsonDocument>
#include <QJsonObject>
#include <QTest>

class tst_output : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void linesOrJson_data();
    void linesOrJson();
    void messagesHaveTheName();
    void bars_data();
    void bars();
    void progressIsRemovedBeforeALine();
    void hiddenProgressWritesNothing();

private:
    QBuffer m_result;
    QBuffer m_messages;
};

void tst_output::init()
{
    for (QBuffer* buffer : {&m_result, &m_messages}) {
        buffer->close();
        buffer->setData({});
        QVERIFY(buffer->open(QIODevice::WriteOnly));
    }
}

void tst_output::linesOrJson_data()
{
    QTest::addColumn<Output::Format>("format");
    QTest::addColumn<QByteArray>("written");
    QTest::newRow("lines") << Output::Format::Lines << QByteArray("line\n");
    QTest::newRow("JSON") << Output::Format::Json << QByteArray("{\n    \"a\": 1\n}\n");
}

void tst_output::linesOrJson()
{
    QFETCH(Output::Format, format);
    QFETCH(QByteArray, written);
    Output output(m_result, m_messages, format, Output::Progress::Hidden);
    output.line("line");
    output.json(QJsonDocument(QJsonObject{{"a", 1}}));
    QCOMPARE(m_result.data(), written);
}

void tst_output::messagesHaveTheName()
{
    Output output(m_result, m_messages, Output::Format::Json, Output::Progress::Hidden);
    output.message("text");
    QCOMPARE(m_messages.data(), QByteArray("titlectl: text\n"));
    QVERIFY(m_result.data().isEmpty());
}

void tst_output::bars_data()
{
    QTest::addColumn<int>("done");
    QTest::addColumn<int>("total");
    QTest::addColumn<QString>("bar");
    QTest::newRow("none") << 0 << 3 << "[    ] 0/3";
    QTest::newRow("some") << 2 << 4 << "[##  ] 2/4";
    QTest::newRow("all") << 3 << 3 << "[####] 3/3";
    QTest::newRow("many") << 500000000 << 1000000000 << "[##  ] 500000000/1000000000";
}

void tst_output::bars()
{
    QFETCH(int, done);
    QFETCH(int, total);
    QFETCH(QString, bar);
    QCOMPARE(Output::bar(done, total, 4), bar);
}

void tst_output::progressIsRemovedBeforeALine()
{
    Output output(m_result, m_messages, Output::Format::Lines, Output::Progress::Shown);
    output.progress(1, 2);
    QVERIFY(m_messages.data().contains("1/2"));
    output.message("text");
    QVERIFY(m_messages.data().endsWith("\r\x1b[Ktitlectl: text\n"));
}

void tst_output::hiddenProgressWritesNothing()
{
    Output output(m_result, m_messages, Output::Format::Lines, Output::Progress::Hidden);
    output.progress(1, 2);
    QVERIFY(m_messages.data().isEmpty());
}

QTEST_APPLESS_MAIN(tst_output)
#include "tst_output.moc"
