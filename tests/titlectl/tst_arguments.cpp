// How the words of a command line become options and operands.
#include "titlectl/Arguments.h"

#include <QTest>

using Words = QStringList;

class tst_arguments : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void accepted_data();
    void accepted();
    void refused_data();
    void refused();

private:
    const QList<CommandOption> m_options{{"out", "DIR", "a folder"}, {"force", "", "a switch"}};
};

void tst_arguments::accepted_data()
{
    QTest::addColumn<Words>("words");
    QTest::addColumn<Words>("operands");
    QTest::addColumn<QString>("out");
    QTest::addColumn<bool>("force");
    QTest::newRow("nothing") << Words{} << Words{} << "" << false;
    QTest::newRow("operands") << Words{"a", "b"} << Words{"a", "b"} << "" << false;
    QTest::newRow("value apart") << Words{"--out", "x", "a"} << Words{"a"} << "x" << false;
    QTest::newRow("value joined") << Words{"--out=x=y", "a"} << Words{"a"} << "x=y" << false;
    QTest::newRow("empty value") << Words{"--out=", "a"} << Words{"a"} << "" << false;
    QTest::newRow("last value") << Words{"--out", "x", "--out=y"} << Words{} << "y" << false;
    QTest::newRow("value like an option") << Words{"--out", "--force"} << Words{} << "--force" << false;
    QTest::newRow("switch behind") << Words{"a", "--force"} << Words{"a"} << "" << true;
    QTest::newRow("behind two dashes")
        << Words{"--force", "--", "--out", "-"} << Words{"--out", "-"} << "" << true;
    QTest::newRow("one dash") << Words{"-"} << Words{"-"} << "" << false;
    QTest::newRow("text with an equals sign") << Words{"1=--x"} << Words{"1=--x"} << "" << false;
}

void tst_arguments::accepted()
{
    QFETCH(Words, words);
    QFETCH(Words, operands);
    QFETCH(QString, out);
    QFETCH(bool, force);
    QString error;
    const auto arguments = Arguments::parse(words, m_options, error);
    QVERIFY2(arguments, qPrintable(error));
    QCOMPARE(arguments->operands(), operands);
    QCOMPARE(arguments->value("out"), out);
    QCOMPARE(arguments->has("force"), force);
}

void tst_arguments::refused_data()
{
    QTest::addColumn<Words>("words");
    QTest::addColumn<QString>("reason");
    QTest::newRow("unknown") << Words{"--other"} << "no option --other";
    QTest::newRow("unknown with a value") << Words{"--other=1"} << "no option --other";
    QTest::newRow("short") << Words{"-o"} << "no option -o";
    QTest::newRow("beginning of one") << Words{"--forc"} << "no option --forc";
    QTest::newRow("no value") << Words{"a", "--out"} << "--out needs a value";
    QTest::newRow("value for a switch") << Words{"--force=1"} << "--force takes no value";
}

void tst_arguments::refused()
{
    QFETCH(Words, words);
    QFETCH(QString, reason);
    QString error;
    QVERIFY(!Arguments::parse(words, m_options, error));
    QVERIFY2(error.contains(reason), qPrintable(error));
}

QTEST_APPLESS_MAIN(tst_arguments)
#include "tst_arguments.moc"
