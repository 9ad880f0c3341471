// Lists as arrays of JSON objects.
#include "ListTools.h"
#include "tests/support/RandomSeed.h"

#include "titlectl/JsonListReader.h"

#include <QByteArray>
#include <QRandomGenerator>
#include <QtTest/QTest>

namespace
{

const QByteArray WHOLE =
    "\xEF\xBB\xBF[\n"
    " {\"Name\": \"M\xC3\xBCller, \\\"Anna\\\"\", \"Role\": \"a\\nb\"},\r\n"
    " {\"role\": null, \"Number\": 12, \"Share\": 1.5, \"On\": true},\n"
    "\n"
    " {\"Name\": \"}]{[,\\\\\", \"Number\": 9007199254740993, \"Share\": 1e-7, \"On\": false}]\n";

} // namespace

class tst_jsonlistreader : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void wholeFile()
    {
        const ListTable table = JsonListReader::read(WHOLE);
        QCOMPARE(headerOf(table), QStringLiteral("Name|Role|Number|On|Share"));
        QCOMPARE(rowsOf(table),
                 QStringList({QString::fromUtf8("2: Müller, \"Anna\"|a\nb|||"), "3: ||12|true|1.5",
                              "5: }]{[,\\||9007199254740993|false|0.0000001"}));
    }

    void badRowsDoNotStopTheOthers()
    {
        const ListTable table = JsonListReader::read("[{\"a\": \"1\"},\n"
                                                     "5,\n"
                                                     "\"x\",\n"
                                                     "{\"a\": [1, {\"b\": 2}]},\n"
                                                     "{\"a\": 1,, },\n"
                                                     "{\"a\": 1, \"A\": 2},\n"
                                                     "{\"\": 1},\n"
                                                     "{\"a\": \"\\u0001\"},\n"
                                                     "{\"a\": \"\\ud83d\"},\n"
                                                     "[\"a\"],\n"
                                                     "{},\n"
                                                     "{\"a\": \"2\"}]");
        QStringList rows = rowsOf(table);
        QCOMPARE(rows.size(), 11);
        QCOMPARE(rows.takeFirst(), QStringLiteral("1: 1"));
        QCOMPARE(rows.takeLast(), QStringLiteral("12: 2"));
        const QStringList reasons = {"2! it is not an object",
                                     "3! it is not an object",
                                     "4! \"a\" is a list or an object",
                                     "5! it is not JSON",
                                     "6! \"a\" is there twice",
                                     "7! a key is empty",
                                     "8! column 1: it contains a control character",
                                     "9!",
                                     "10! it is not an object"};
        QCOMPARE(rows.size(), reasons.size());
        for (qsizetype i = 0; i < rows.size(); ++i)
            QVERIFY2(rows[i].startsWith(reasons[i]), qPrintable(rows[i]));
    }

    void refused_data()
    {
        QTest::addColumn<QByteArray>("bytes");
        QTest::addColumn<QString>("reason");
        QTest::newRow("nothing") << QByteArray() << "The list is not an array of objects";
        QTest::newRow("object") << QByteArray("{\"a\": 1}") << "The list is not an array of objects";
        QTest::newRow("empty") << QByteArray(" [ ] ") << "The list is empty";
        QTest::newRow("no object") << QByteArray("[\n5, 6]")
                                   << "line 2: The row cannot be used, and no other can: it is";
        QTest::newRow("no end") << QByteArray("[{\"a\": 1}") << "line 1: The row or the list has no end";
        QTest::newRow("no end of a row")
            << QByteArray("[{\"a\": 1},\n{\"a\"") << "line 2: The row or the list has no end";
        QTest::newRow("text behind") << QByteArray("[{\"a\": 1}]\nx") << "line 2: Text follows the list";
        QTest::newRow("long row") << QByteArray("[\n{\"a\": \"") +
                                         QByteArray(ListTable::ROW_BYTES_LIMIT, 'x') + "\"}]"
                                  << "line 2: The row is longer than 1048576 bytes";
        QTest::newRow("deep") << QByteArray("[") + QByteArray(100000, '[')
                              << "line 1: The row or the list has no end";
        QByteArray wide = "[{\"0\": 1";
        for (int i = 1; i <= ListTable::COLUMN_LIMIT; ++i)
            wide += ",\"" + QByteArray::number(i) + "\": 1";
        QTest::newRow("many columns") << wide + "}]"
                                      << "The list has more than 256 columns";
    }
    void refused()
    {
        QFETCH(QByteArray, bytes);
        QFETCH(QString, reason);
        const ListTable table = JsonListReader::read(bytes);
        QVERIFY(table.hasFailed());
        QVERIFY2(table.error().startsWith(reason), qPrintable(table.error()));
    }

    void numbers_data()
    {
        QTest::addColumn<double>("number");
        QTest::addColumn<QString>("text");
        QTest::newRow("whole") << 12.0 << "12";
        QTest::newRow("negative") << -3.0 << "-3";
        QTest::newRow("fraction") << 0.1 << "0.1";
        QTest::newRow("small") << 0.00001 << "0.00001";
        QTest::newRow("as a spreadsheet stores it") << 1.1000000000000001 << "1.1";
        QTest::newRow("large") << 1e15 << "1000000000000000";
    }
    void numbers()
    {
        QFETCH(double, number);
        QTEST(JsonListReader::numberText(number), "text");
    }

    void truncated()
    {
        const qsizetype end = WHOLE.lastIndexOf(']');
        for (qsizetype length = 0; length <= end; ++length)
            QVERIFY2(JsonListReader::read(WHOLE.left(length)).hasFailed(), WHOLE.left(length).constData());
        QCOMPARE(JsonListReader::read(WHOLE.left(end + 1)).rowCount(), 3);
    }

    void random()
    {
        const RandomSeed seed(17);
        QRandomGenerator generator(seed);
        for (int round = runLength("TITLER_ROUNDS", 3000); round > 0; --round) {
            QByteArray bytes = WHOLE;
            for (quint32 changes = 1 + generator.bounded(4U); changes > 0; --changes)
                bytes[generator.bounded(int(bytes.size()))] = "\"\\{}[],:\n1a\xFF"[generator.bounded(12)];
            const ListTable table = JsonListReader::read(bytes);
            for (int row = 1; row < table.rowCount(); ++row)
                QVERIFY2(table.line(row) >= table.line(row - 1), bytes.toPercentEncoding().constData());
        }
    }
};

QTEST_GUILESS_MAIN(tst_jsonlistreader)
#include "tst_jsonlistreader.moc"
