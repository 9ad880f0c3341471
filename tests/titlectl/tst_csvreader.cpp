// Rows of comma separated values, good and bad ones.
#include "ListTools.h"
#include "tests/support/RandomSeed.h"

#include "titlectl/CsvReader.h"

#include <QBuffer>
#include <QRandomGenerator>
#include <QStringConverter>
#include <QtTest/QTest>

namespace
{

ListTable read(const QByteArray& bytes)
{
    QBuffer buffer;
    buffer.setData(bytes);
    buffer.open(QIODevice::ReadOnly);
    return CsvReader::read(buffer);
}

const QByteArray WHOLE = "\xEF\xBB\xBF"
                         "Name;Role;Note\r\n"
                         "\"Müller, \"\"Anna\"\"\";Reporterin;\"first\r\nsecond\"\r\n"
                         "金田;記者;\r\n"
                         "\r\n"
                         "Ève;\"\";x";

} // namespace

class tst_csvreader : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void separators_data()
    {
        QTest::addColumn<QString>("header");
        QTest::addColumn<QChar>("separator");
        QTest::newRow("comma") << "a,b\n1;2;3" << QChar(',');
        QTest::newRow("semicolon") << "a;b;\"c,,,,\"\n" << QChar(';');
        QTest::newRow("tab") << "a\tb\tc, d" << QChar('\t');
        QTest::newRow("none") << "a" << QChar(',');
        QTest::newRow("nothing") << "" << QChar(',');
        QTest::newRow("alike") << "a;b,c" << QChar(',');
        QTest::newRow("line break in quotes") << "\"a\n,,\";b;c" << QChar(';');
    }
    void separators()
    {
        QFETCH(QString, header);
        QFETCH(QChar, separator);
        QCOMPARE(CsvReader::separatorOf(header), separator);
    }

    void rows_data()
    {
        QTest::addColumn<QString>("text");
        QTest::addColumn<QStringList>("cells");
        QTest::addColumn<int>("length");
        QTest::addColumn<int>("lines");
        QTest::addColumn<QString>("reason");
        const QString none;
        QTest::newRow("plain") << "a,b\nc" << QStringList{"a", "b"} << 4 << 1 << none;
        QTest::newRow("CR LF") << "a,b\r\nc" << QStringList{"a", "b"} << 5 << 1 << none;
        QTest::newRow("CR") << "a,b\rc" << QStringList{"a", "b"} << 4 << 1 << none;
        QTest::newRow("end of text") << "a,b" << QStringList{"a", "b"} << 3 << 0 << none;
        QTest::newRow("empty cells") << ",a,,\n" << QStringList{"", "a", "", ""} << 5 << 1 << none;
        QTest::newRow("empty line") << "\nx" << QStringList{""} << 1 << 1 << none;
        QTest::newRow("spaces") << " a , b\n" << QStringList{" a ", " b"} << 7 << 1 << none;
        QTest::newRow("quotes") << "\"a\",\"b,c\"\n" << QStringList{"a", "b,c"} << 10 << 1 << none;
        QTest::newRow("doubled") << "\"a\"\"b\",\"\"\"\"\n" << QStringList{"a\"b", "\""} << 12 << 1 << none;
        QTest::newRow("empty quotes") << "\"\",\"\"" << QStringList{"", ""} << 5 << 0 << none;
        QTest::newRow("line breaks in quotes")
            << "\"a\r\nb\nc\rd\",e\r\nf" << QStringList{"a\r\nb\nc\rd", "e"} << 14 << 4 << none;
        QTest::newRow("not closed") << "a,\"b\nc,d\n" << QStringList() << 5 << 1 << "a quote is not closed";
        QTest::newRow("text behind") << "\"a\"b\nc" << QStringList() << 5 << 1
                                     << "text follows a closing quote";
        QTest::newRow("quote inside") << "a\"b\"\r\nc" << QStringList() << 6 << 1
                                      << "a quote stands in a cell that does not begin with one";
    }
    void rows()
    {
        QFETCH(QString, text);
        QFETCH(QString, reason);
        const CsvReader::Row row = CsvReader::rowAt(text, ',');
        QTEST(row.cells, "cells");
        QTEST(int(row.length), "length");
        QTEST(row.lines, "lines");
        QCOMPARE(row.reason, reason);
        QCOMPARE(row.state, reason.isEmpty() ? CsvReader::Row::State::Good : CsvReader::Row::State::Bad);
    }

    void wholeFile()
    {
        const ListTable table = read(WHOLE);
        QCOMPARE(headerOf(table), QStringLiteral("Name|Role|Note"));
        QCOMPARE(rowsOf(table),
                 QStringList({QString::fromUtf8("2: Müller, \"Anna\"|Reporterin|first\nsecond"),
                              QString::fromUtf8("4: 金田|記者|"), QString::fromUtf8("6: Ève||x")}));
    }

    void badRowsDoNotStopTheOthers()
    {
        const ListTable table = read("a,b\n"
                                     "1,2\n"
                                     "\"3,4\n"
                                     "5,6\n"
                                     "7\n"
                                     "8,9,10\n"
                                     "\"11\"x,12\n"
                                     "13,14\n");
        QCOMPARE(rowsOf(table), QStringList({"2: 1|2", "3! text follows a closing quote", "4: 5|6",
                                             "5! it has 1 columns, the header has 2",
                                             "6! it has 3 columns, the header has 2",
                                             "7! text follows a closing quote", "8: 13|14"}));
    }

    void refused_data()
    {
        QTest::addColumn<QByteArray>("bytes");
        QTest::addColumn<QString>("reason");
        QTest::newRow("nothing") << QByteArray() << "The list is empty";
        QTest::newRow("blank lines") << QByteArray("\n\r\n,,\n") << "The list is empty";
        QTest::newRow("mark only") << QByteArray("\xEF\xBB\xBF") << "The list is empty";
        QTest::newRow("header") << QByteArray("\"a\nb") << "line 1: The header cannot be used";
        QTest::newRow("long cell") << QByteArray("a\n") + QByteArray(ListTable::CELL_LIMIT + 1, 'x')
                                   << "line 2: A cell";
        QTest::newRow("long line") << QByteArray("a,b\n1,2\n3,\"") +
                                          QByteArray(3 * ListTable::ROW_BYTES_LIMIT, 'x')
                                   << "line 3: A cell";
        QTest::newRow("many columns") << QByteArray(300, ',') << "line 1: A cell";
    }
    void refused()
    {
        QFETCH(QByteArray, bytes);
        QFETCH(QString, reason);
        const ListTable table = read(bytes);
        QVERIFY(table.hasFailed());
        QVERIFY2(table.error().startsWith(reason), qPrintable(table.error()));
        QCOMPARE(table.rowCount(), 0);
    }

    void encodings()
    {
        const QString text = QString::fromUtf8("Name\tRole\r\nÈve 快讯\t😀\r\n");
        const QStringList expected = {QString::fromUtf8("2: Ève 快讯|😀")};
        for (const auto encoding :
             {QStringConverter::Utf8, QStringConverter::Utf16LE, QStringConverter::Utf16BE}) {
            QStringEncoder encoder(encoding, QStringConverter::Flag::WriteBom);
            const QByteArray bytes = encoder(text);
            const ListTable table = read(bytes);
            QCOMPARE(headerOf(table), QStringLiteral("Name|Role"));
            QCOMPARE(rowsOf(table), expected);
        }
        QCOMPARE(rowsOf(read("a\nM\xFCller\nb\xC3")),
                 QStringList({"2! column 1: its text is not UTF-8", "3! column 1: its text is not UTF-8"}));
    }

    void longFile()
    {
        QByteArray bytes = "Name,Note\n";
        QStringList expected;
        for (int row = 0; bytes.size() < 5 * ListTable::ROW_BYTES_LIMIT; ++row) {
            const QByteArray number = QByteArray::number(row);
            bytes += number + ",\"" + QByteArray(row % 3000, 'x') + "é\"\n";
            expected.append(QStringLiteral("%1: %2|").arg(row + 2).arg(row) + QString(row % 3000, 'x') +
                            QString::fromUtf8("é"));
        }
        QCOMPARE(rowsOf(read(bytes)), expected);
    }

    void rowLimit()
    {
        QByteArray bytes = "a\n";
        for (int row = 0; row < ListTable::ROW_LIMIT; ++row)
            bytes += "x\n";
        QCOMPARE(read(bytes).rowCount(), ListTable::ROW_LIMIT);
        QCOMPARE(read(bytes + "y").error(), QStringLiteral("The list has more than 100000 rows"));
    }

    // Each beginning of a file is read in some way, with the rows before its end as in the whole.
    void truncated()
    {
        const QStringList whole = rowsOf(read(WHOLE));
        for (qsizetype length = 0; length < WHOLE.size(); ++length) {
            const ListTable table = read(WHOLE.left(length));
            QVERIFY(table.hasFailed() == (length <= 3));
            for (int row = 0; row + 1 < table.rowCount() && table.fault(row).isEmpty(); ++row)
                QCOMPARE(rowsOf(table)[row], whole[row]);
        }
    }

    void random()
    {
        const RandomSeed seed(16);
        QRandomGenerator generator(seed);
        static const QByteArray SIGNS = "\"\"\",;\t\r\n\nab\xC3\xA9\xFF ";
        for (int round = runLength("TITLER_ROUNDS", 3000); round > 0; --round) {
            QByteArray bytes = "a,b\n";
            for (quint32 count = generator.bounded(60U); count > 0; --count)
                bytes += SIGNS[generator.bounded(int(SIGNS.size()))];
            const ListTable table = read(bytes);
            QVERIFY(!table.hasFailed());
            int last = 1;
            for (int row = 0; row < table.rowCount(); ++row) {
                QVERIFY2(table.line(row) > last, bytes.toPercentEncoding().constData());
                last = table.line(row);
            }
        }
    }
};

QTEST_GUILESS_MAIN(tst_csvreader)
#include "tst_csvreader.moc"
