#include "bench/MarkedTable.h"

#include <QTest>

class tst_markedtable : public QObject
{
    Q_OBJECT
private Q_SLOTS:
    void row_data();
    void row();
    void replaced_data();
    void replaced();
    void names_data();
    void names();
};

void tst_markedtable::row_data()
{
    QTest::addColumn<QStringList>("cells");
    QTest::addColumn<QString>("line");
    QTest::newRow("cells") << QStringList{"`key`", "0.50", "missed"} << "| `key` | 0.50 | missed |";
    QTest::newRow("an empty cell") << QStringList{"a", "", "c"} << "| a | | c |";
    QTest::newRow("a bar in a cell") << QStringList{"a|b"} << "| a\\|b |";
}

void tst_markedtable::row()
{
    QFETCH(QStringList, cells);
    QTEST(MarkedTable::row(cells), "line");
}

void tst_markedtable::replaced_data()
{
    QTest::addColumn<QString>("document");
    QTest::addColumn<bool>("isFound");
    QTest::addColumn<QString>("result");
    QTest::newRow("between the marks") << "a\n<!-- run -->\nold\nold\n<!-- end of run -->\nb\n"
                                       << true << "a\n<!-- run -->\n| 1 |\n| 2 |\n<!-- end of run -->\nb\n";
    QTest::newRow("nothing between them")
        << "<!-- run -->\n<!-- end of run -->" << true << "<!-- run -->\n| 1 |\n| 2 |\n<!-- end of run -->";
    QTest::newRow("another table's marks") << "<!-- runs -->\n<!-- end of runs -->" << false << QString();
    QTest::newRow("no end") << "<!-- run -->\nold\n" << false << QString();
    QTest::newRow("the end first") << "<!-- end of run -->\n<!-- run -->\n" << false << QString();
    QTest::newRow("no document") << QString() << false << QString();
}

void tst_markedtable::replaced()
{
    QFETCH(QString, document);
    const std::optional<QString> result = MarkedTable::replaced(document, "run", {"| 1 |", "| 2 |"});
    QTEST(result.has_value(), "isFound");
    QTEST(result.value_or(QString()), "result");
}

void tst_markedtable::names_data()
{
    QTest::addColumn<QString>("document");
    QTest::addColumn<QStringList>("names");
    QTest::newRow("rows") << "`x`\n<!-- run -->\n| Pair | Ours |\n|---|---|\n| `a_b` | `c` |\n|`d`| 1 |\n"
                             "<!-- end of run -->\n| `e` |\n"
                          << QStringList{"a_b", "d"};
    QTest::newRow("no rows") << "<!-- run -->\n<!-- end of run -->\n" << QStringList{};
    QTest::newRow("no marks") << "| `a` |\n" << QStringList{};
}

void tst_markedtable::names()
{
    QFETCH(QString, document);
    QTEST(MarkedTable::namesIn(document, "run"), "names");
}

QTEST_APPLESS_MAIN(tst_markedtable)
#include "tst_markedtable.moc"
