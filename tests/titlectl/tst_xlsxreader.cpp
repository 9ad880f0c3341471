// Lists in workbooks, and what is refused of them.
#include "ListTools.h"
#include "WorkbookFile.h"
#include "tests/support/RandomSeed.h"

#include "titlectl/XlsxReader.h"
#include "titlectl/ZipXmlEntry.h"

#include <QFile>
#include <QRandomGenerator>
#include <QTemporaryDir>
#include <QtTest/QTest>

namespace
{

const QByteArray STRINGS =
    "<si><t>Name</t></si><si><t>Role</t></si>"
    "<si><r><t>M\xC3\xBC</t></r><r><rPr><b/></rPr><t xml:space=\"preserve\">ller </t></r>"
    "<rPh sb=\"0\" eb=\"1\"><t>phonetic</t></rPh></si>"
    "<si><t>first_x000D_\nsecond _x005F_x &lt;&amp;</t></si>";

const QByteArray ROWS =
    "<row r=\"2\"><c r=\"A2\" s=\"1\"/></row>"
    "<row r=\"3\"><c r=\"B3\" t=\"s\"><v>0</v></c><c r=\"D3\" t=\"s\"><v>1</v></c></row>"
    "<row r=\"4\"><c r=\"B4\" t=\"s\"><v>2</v></c><c r=\"C4\"><v>7</v></c><c r=\"D4\" "
    "t=\"s\"><v>3</v></c></row>"
    "<row r=\"7\"><c r=\"D7\" t=\"inlineStr\"><is><t>inline</t></is></c></row>"
    "<row><c/><c><v>1.1000000000000001</v></c><c/><c t=\"b\"><v>1</v></c></row>"
    "<row r=\"9\"><c r=\"B9\" t=\"str\"><f>A1</f><v>formula</v></c><c r=\"ZZ9\" s=\"4\"/></row>";

} // namespace

class tst_xlsxreader : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void wholeFile_data()
    {
        QTest::addColumn<bool>("isPacked");
        QTest::newRow("packed") << true;
        QTest::newRow("stored") << false;
    }
    void wholeFile()
    {
        QFETCH(bool, isPacked);
        const ListTable table = read({ROWS, STRINGS, isPacked});
        QCOMPARE(table.error(), QString());
        QCOMPARE(headerOf(table), QStringLiteral("|Name||Role"));
        QCOMPARE(rowsOf(table), QStringList({QString::fromUtf8("4: |Müller |7|first\nsecond _x <&"),
                                             "7: |||inline", "8: |1.1||TRUE", "9: |formula||"}));
    }

    void badRowsDoNotStopTheOthers()
    {
        const ListTable table = read({"<row r=\"1\"><c r=\"A1\" t=\"s\"><v>0</v></c></row>"
                                      "<row r=\"2\"><c r=\"A2\" t=\"e\"><v>#N/A</v></c></row>"
                                      "<row r=\"3\"><c r=\"A3\" t=\"s\"><v>99</v></c></row>"
                                      "<row r=\"4\"><c r=\"A4\" t=\"s\"><v>-1</v></c></row>"
                                      "<row r=\"5\"><c r=\"B5\"><v>1</v></c></row>"
                                      "<row r=\"6\"><c r=\"5\"><v>1</v></c></row>"
                                      "<row r=\"7\"><c r=\"A7\"><v>2</v></c></row>",
                                      STRINGS});
        QCOMPARE(rowsOf(table), QStringList({"2! column 1 has the error #N/A",
                                             "3! column 1 refers to a text that is missing",
                                             "4! column 1 refers to a text that is missing",
                                             "5! it has text in column 2, the header has 1 columns",
                                             "6! a cell has no column", "7: 2"}));
    }

    void refusedSheets_data()
    {
        QTest::addColumn<QByteArray>("sheet");
        QTest::addColumn<QString>("reason");
        const QByteArray longText(ListTable::CELL_LIMIT + 1, 'x');
        QTest::newRow("empty") << WorkbookFile::sheet("") << "The list is empty";
        QTest::newRow("not XML") << QByteArray("x") << "The workbook cannot be read: ";
        QTest::newRow("torn") << WorkbookFile::sheet("<row><c><v>1").chopped(35)
                              << "The workbook cannot be read: ";
        QTest::newRow("long cell") << WorkbookFile::sheet("<row><c><v>" + longText + "</v></c></row>")
                                   << "A cell is longer than 65536 bytes";
        QTest::newRow("long inline text")
            << WorkbookFile::sheet("<row><c t=\"inlineStr\"><is><t>" + longText + "</t></is></c></row>")
            << "A cell is longer than 65536 bytes";
        QTest::newRow("column") << WorkbookFile::sheet("<row><c r=\"IW1\"><v>1</v></c></row>")
                                << "The list has more than 256 columns";
        QTest::newRow("error in the header")
            << WorkbookFile::sheet("<row r=\"3\"><c t=\"e\"><v>#REF!</v></c></row>")
            << "row 3: The header cannot be used";
        QTest::newRow("entity") << QByteArray("<!DOCTYPE a [<!ENTITY b \"c\">]><a>&b;</a>")
                                << "The workbook cannot be read: Its XML is not that of a workbook";
        QTest::newRow("comment") << QByteArray("<a><!-- x --></a>")
                                 << "The workbook cannot be read: Its XML is not that of a workbook";
        QTest::newRow("deep") << QByteArray("<a>").repeated(1000)
                              << "The workbook cannot be read: Its XML is too deep";
        QByteArray attributes = "<a";
        for (int i = 0; i < 5000; ++i)
            attributes += " a" + QByteArray::number(i) + "=\"\"";
        QTest::newRow("attributes") << attributes + "/>"
                                    << "The workbook cannot be read: Its XML is not that of a workbook";
        QTest::newRow("long text") << QByteArray("<a>") + QByteArray(ZipXmlEntry::TEXT_LIMIT + 1, 'x') +
                                          "</a>"
                                   << "The workbook cannot be read: Its XML is not that of a workbook";
        QTest::newRow("encoding") << QByteArray("<?xml version=\"1.0\" encoding=\"ISO-8859-1\"?><a/>")
                                  << "The workbook cannot be read: Its XML is not UTF-8";
        QTest::newRow("two bytes a sign") << QByteArray("\xFF\xFE<\0a\0/\0>\0", 10)
                                          << "The workbook cannot be read: Its XML is not that of a workbook";
    }
    void refusedSheets()
    {
        QFETCH(QByteArray, sheet);
        QFETCH(QString, reason);
        auto parts = WorkbookFile{{}, STRINGS}.parts();
        parts[3].second = sheet;
        QVERIFY(WorkbookFile::write(path(), parts));
        const ListTable table = XlsxReader::read(path());
        QVERIFY(table.hasFailed());
        QVERIFY2(table.error().startsWith(reason), qPrintable(table.error()));
    }

    void missingParts()
    {
        const auto whole = WorkbookFile{ROWS, STRINGS}.parts();
        for (qsizetype missing = 0; missing < whole.size(); ++missing) {
            auto parts = whole;
            parts.removeAt(missing);
            QVERIFY(WorkbookFile::write(path(), parts));
            const ListTable table = XlsxReader::read(path());
            QVERIFY2(table.error().contains(QLatin1String("missing in it")), qPrintable(table.error()));
        }
        // The names of parts ignore case.
        auto parts = whole;
        parts[1].first = "XL/Workbook.xml";
        QVERIFY(WorkbookFile::write(path(), parts));
        QVERIFY(!XlsxReader::read(path()).hasFailed());
    }

    // A gigabyte packed into a megabyte is refused before it is unpacked, and also when its size is not true.
    void bombs()
    {
        auto parts = WorkbookFile{ROWS, STRINGS}.parts();
        parts[4].second = QByteArray(ZipXmlEntry::ENTRY_LIMIT + 1, ' ');
        QVERIFY(WorkbookFile::write(path(), parts));
        QVERIFY(XlsxReader::read(path()).error().contains("is longer than 67108864 bytes"));
        QFile file(path());
        QVERIFY(file.open(QIODevice::ReadOnly));
        QByteArray bytes = file.readAll();
        file.close();
        const QByteArray size = QByteArray::fromHex("01000004"); // 64 MB and one byte
        QVERIFY(bytes.count(size) > 0);
        bytes.replace(size, QByteArray::fromHex("01000000"));
        writeBytes(bytes);
        QVERIFY(XlsxReader::read(path()).hasFailed());

        QList<std::pair<QByteArray, QByteArray>> many;
        for (int i = 0; i <= ZipXmlEntry::COUNT_LIMIT; ++i)
            many.append({QByteArray::number(i), QByteArray()});
        QVERIFY(WorkbookFile::write(path(), many, false));
        QVERIFY(XlsxReader::read(path()).error().contains("more than 10000 entries"));
    }

    void truncated()
    {
        QVERIFY((WorkbookFile{ROWS, STRINGS}.write(path())));
        QFile file(path());
        QVERIFY(file.open(QIODevice::ReadOnly));
        const QByteArray whole = file.readAll();
        file.close();
        const QStringList rows = rowsOf(XlsxReader::read(path()));
        // The last three bytes are zeros: the end of an offset and the length of a comment that is not there.
        for (qsizetype length = 0; length < whole.size(); ++length) {
            writeBytes(whole.left(length));
            const ListTable table = XlsxReader::read(path());
            QVERIFY(length >= whole.size() - 3 ? rowsOf(table) == rows || table.hasFailed()
                                               : table.hasFailed());
        }
    }

    void random()
    {
        const RandomSeed seed(19);
        QRandomGenerator generator(seed);
        QVERIFY((WorkbookFile{ROWS, STRINGS, false}.write(path())));
        QFile file(path());
        QVERIFY(file.open(QIODevice::ReadOnly));
        const QByteArray whole = file.readAll();
        file.close();
        for (int round = runLength("TITLER_ROUNDS", 1000); round > 0; --round) {
            QByteArray bytes = whole;
            for (quint32 changes = 1 + generator.bounded(3U); changes > 0; --changes)
                bytes[generator.bounded(int(bytes.size()))] = char(generator.bounded(256));
            writeBytes(bytes);
            const ListTable table = XlsxReader::read(path());
            QVERIFY(table.hasFailed() ? table.rowCount() == 0 : table.columnCount() > 0);
        }
    }

private:
    QString path() const { return m_folder.filePath("list.xlsx"); }

    void writeBytes(const QByteArray& bytes) const
    {
        QFile file(path());
        QVERIFY(file.open(QIODevice::WriteOnly));
        file.write(bytes);
    }

    ListTable read(const WorkbookFile& workbook) const
    {
        return workbook.write(path()) ? XlsxReader::read(path()) : ListTable();
    }

    QTemporaryDir m_folder;
};

QTEST_GUILESS_MAIN(tst_xlsxreader)
#include "tst_xlsxreader.moc"
