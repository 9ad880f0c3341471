// The limits of a list and what a cell may contain.
#include "ListTools.h"

#include <QtTest/QTest>

class tst_listtable : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void columns()
    {
        ListTable table;
        table.setHeader({" Name ", "", "Funktion Ä", "Role"});
        QVERIFY(!table.hasFailed());
        QCOMPARE(table.columnCount(), 4);
        QCOMPARE(table.columnName(0), QStringLiteral("Name"));
        QCOMPARE(table.columnOf("NAME "), 0);
        QCOMPARE(table.columnOf("funktion ä"), 2);
        QCOMPARE(table.columnOf(""), -1);
        QCOMPARE(table.columnOf("none"), -1);
    }

    void refusedHeaders_data()
    {
        QTest::addColumn<QStringList>("names");
        QTest::addColumn<QString>("reason");
        QTest::newRow("none") << QStringList() << "names no column";
        QTest::newRow("blank") << QStringList{"", " "} << "names no column";
        QTest::newRow("twice") << QStringList{"a", "b", " A"} << "Two columns are named \"A\"";
        QTest::newRow("not UTF-8") << QStringList{QString(QChar(QChar::ReplacementCharacter))} << "not UTF-8";
        QTest::newRow("control") << QStringList{QString(QChar(7))} << "control character";
        QTest::newRow("long") << QStringList{QString(ListTable::CELL_LIMIT + 1, 'x')}
                              << "longer than 65536 bytes";
        QStringList many;
        for (int i = 0; i <= ListTable::COLUMN_LIMIT; ++i)
            many.append(QString::number(i));
        QTest::newRow("many") << many << "more than 256 columns";
    }
    void refusedHeaders()
    {
        QFETCH(QStringList, names);
        QFETCH(QString, reason);
        ListTable table;
        table.setHeader(names);
        QVERIFY(table.hasFailed());
        QVERIFY2(table.error().contains(reason), qPrintable(table.error()));
    }

    void cells_data()
    {
        QTest::addColumn<QStringList>("cells");
        QTest::addColumn<QString>("row");
        QTest::newRow("plain") << QStringList{"x", "y"} << "7: x|y";
        QTest::newRow("short") << QStringList{"x"} << "7: x|";
        QTest::newRow("gap") << QStringList{"", "y"} << "7: |y";
        QTest::newRow("empty cells behind") << QStringList{"x", "", "", ""} << "7: x|";
        QTest::newRow("too many") << QStringList{"x", "y", "z"}
                                  << "7! it has text in column 3, the header has 2 columns";
        QTest::newRow("scripts") << QStringList{QString::fromUtf8("快讯 속보"), QString::fromUtf8("é😀")}
                                 << QString::fromUtf8("7: 快讯 속보|é😀");
        QTest::newRow("line breaks") << QStringList{"a\r\nb\rc\nd",
                                                    QString(QChar(QChar::LineSeparator)) + 'x'}
                                     << "7: a\nb\nc\nd|\nx";
        QTest::newRow("tab") << QStringList{"a\tb"} << "7: a b|";
        QTest::newRow("control") << QStringList{"x", QString(QChar(1))}
                                 << "7! column 2: it contains a control character";
        QTest::newRow("NUL") << QStringList{QString(QChar(0))}
                             << "7! column 1: it contains a control character";
        QTest::newRow("not UTF-8") << QStringList{QString(QChar(QChar::ReplacementCharacter))}
                                   << "7! column 1: its text is not UTF-8";
        QTest::newRow("half a character")
            << QStringList{QString(QChar(0xD83D))} << "7! column 1: it contains half a character";
        QTest::newRow("non-character")
            << QStringList{QString(QChar(0xFFFE))} << "7! column 1: it contains a control character";
    }
    void cells()
    {
        QFETCH(QStringList, cells);
        QFETCH(QString, row);
        ListTable table;
        table.setHeader({"a", "b"});
        table.addRow(7, cells);
        QCOMPARE(rowsOf(table), QStringList{row});
    }

    void rowsWithoutTextAreLeftOut()
    {
        ListTable table;
        table.setHeader({"a", "b"});
        table.addRow(2, {});
        table.addRow(3, {"", ""});
        QCOMPARE(table.rowCount(), 0);
    }

    void columnsThatComeLater()
    {
        ListTable table;
        table.setHeader({"a"});
        table.addRow(1, {"x"});
        QCOMPARE(table.addColumn("b"), 1);
        table.addRow(2, {"", "y"});
        QCOMPARE(rowsOf(table), QStringList({"1: x|", "2: |y"}));
        QCOMPARE(table.cell(0, -1), QString());
        QCOMPARE(table.addColumn("B"), -1);
        QVERIFY(table.hasFailed());
    }

    void longCell()
    {
        ListTable table;
        table.setHeader({"a"});
        table.addRow(2, {QString(ListTable::CELL_LIMIT, 'x')});
        QCOMPARE(table.rowCount(), 1);
        table.addRow(3, {QString(ListTable::CELL_LIMIT / 2 + 1, QChar(0xE9))});
        QCOMPARE(table.error(), QStringLiteral("line 3: A cell is longer than 65536 bytes"));
        QCOMPARE(table.rowCount(), 0);
    }

    void manyRows()
    {
        ListTable table;
        table.setHeader({"a"});
        for (int row = 0; row < ListTable::ROW_LIMIT; ++row)
            if (row % 2)
                table.addRow(row, {"x"});
            else
                table.addBadRow(row, "bad");
        QCOMPARE(table.rowCount(), ListTable::ROW_LIMIT);
        table.addRow(1, {"x"});
        QCOMPARE(table.error(), QStringLiteral("The list has more than 100000 rows"));
        table.fail("another");
        QCOMPARE(table.error(), QStringLiteral("The list has more than 100000 rows"));
    }

    void textsTogether()
    {
        ListTable table;
        table.setHeader({"a"});
        const QString longest(ListTable::CELL_LIMIT, 'x');
        const int fitting = int(ListTable::FILE_LIMIT / ListTable::CELL_LIMIT);
        for (int row = 0; row < fitting; ++row)
            table.addRow(row, {longest});
        QCOMPARE(table.rowCount(), fitting);
        table.addRow(fitting, {"x"});
        QVERIFY2(table.error().startsWith("The texts of the list are longer"), qPrintable(table.error()));
    }
};

QTEST_GUILESS_MAIN(tst_listtable)
#include "tst_listtable.moc"
