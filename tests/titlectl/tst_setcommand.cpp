// The changes that the words of the command stand for.
#include "titlectl/SetCommand.h"

#include <QTest>

using Changes = SetCommand::Changes;

class tst_setcommand : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void accepted_data();
    void accepted();
    void refused_data();
    void refused();
};

void tst_setcommand::accepted_data()
{
    QTest::addColumn<QStringList>("words");
    QTest::addColumn<Changes>("changes");
    QTest::newRow("one") << QStringList{"1=Text"} << Changes{{1, "Text"}};
    QTest::newRow("two") << QStringList{"2=b", "1=a"} << Changes{{1, "a"}, {2, "b"}};
    QTest::newRow("equals sign") << QStringList{"1=a=b"} << Changes{{1, "a=b"}};
    QTest::newRow("new line") << QStringList{"1=a\\nb"} << Changes{{1, "a\nb"}};
    QTest::newRow("real new line") << QStringList{"1=a\nb"} << Changes{{1, "a\nb"}};
    QTest::newRow("backslash") << QStringList{"1=a\\\\nb"} << Changes{{1, "a\\nb"}};
    QTest::newRow("other backslashes") << QStringList{"1=\\x\\"} << Changes{{1, "\\x\\"}};
    QTest::newRow("300 characters") << QStringList{"1=" + QString(300, 'x')}
                                    << Changes{{1, QString(300, 'x')}};
}

void tst_setcommand::accepted()
{
    QFETCH(QStringList, words);
    QFETCH(Changes, changes);
    QString error;
    const auto result = SetCommand::parse(words, error);
    QVERIFY2(result, qPrintable(error));
    QCOMPARE(*result, changes);
}

void tst_setcommand::refused_data()
{
    QTest::addColumn<QStringList>("words");
    QTest::addColumn<QString>("reason");
    QTest::newRow("no equals sign") << QStringList{"Text"} << "not of the form";
    QTest::newRow("number alone") << QStringList{"1"} << "not of the form";
    QTest::newRow("no id") << QStringList{"=Text"} << "not of the form";
    QTest::newRow("no number") << QStringList{"a=Text"} << "not of the form";
    QTest::newRow("second one") << QStringList{"1=a", "b"} << "b is not of the form";
    QTest::newRow("empty") << QStringList{"1="} << "text 1 would be blank";
    QTest::newRow("blank") << QStringList{"1= \\n "} << "text 1 would be blank";
    QTest::newRow("too long") << QStringList{"1=" + QString(301, 'x')} << "more than 300";
}

void tst_setcommand::refused()
{
    QFETCH(QStringList, words);
    QFETCH(QString, reason);
    QString error;
    QVERIFY(!SetCommand::parse(words, error));
    QVERIFY2(error.contains(reason), qPrintable(error));
}

QTEST_APPLESS_MAIN(tst_setcommand)
#include "tst_setcommand.moc"
