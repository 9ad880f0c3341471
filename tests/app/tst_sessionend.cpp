// The ways in which a session can end, and how they follow each other.
#include "app/SessionEnd.h"

#include <QTest>

class tst_sessionend : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void wayFollowsTheSession_data();
    void wayFollowsTheSession();
    void askingSurvivesTheEndOfTheStart();
    void endOfProcessIsFinal();
};

using Way = SessionEnd::Way;

void tst_sessionend::wayFollowsTheSession_data()
{
    QTest::addColumn<bool>("quits");
    QTest::addColumn<bool>("isAskedFor");
    QTest::addColumn<Way>("way");
    QTest::addColumn<bool>("closes");
    QTest::addColumn<bool>("asks");
    QTest::newRow("before the start is through") << true << false << Way::Quit << true << false;
    QTest::newRow("and asked for") << true << true << Way::AskThenQuit << true << true;
    QTest::newRow("of the sub panel") << false << false << Way::Hide << false << false;
    QTest::newRow("asked for") << false << true << Way::AskThenHide << false << true;
}

void tst_sessionend::wayFollowsTheSession()
{
    QFETCH(bool, quits);
    QFETCH(bool, isAskedFor);
    SessionEnd end;
    QCOMPARE(end.way(), Way::Quit);
    end.setQuits(quits);
    end.beginSession(!isAskedFor);
    end.beginSession(isAskedFor);
    QTEST(end.way(), "way");
    QTEST(end.closesWindow(), "closes");
    QTEST(end.asksFirst(), "asks");
}

void tst_sessionend::askingSurvivesTheEndOfTheStart()
{
    SessionEnd end;
    end.beginSession(true);
    end.setQuits(false);
    QCOMPARE(end.way(), Way::AskThenHide);
    end.setQuits(true);
    QCOMPARE(end.way(), Way::AskThenQuit);
}

void tst_sessionend::endOfProcessIsFinal()
{
    SessionEnd end;
    end.setQuits(false);
    QVERIFY(end.beginEndOfProcess());
    QVERIFY(!end.beginEndOfProcess());
    end.setQuits(false);
    end.beginSession(true);
    QCOMPARE(end.way(), Way::EndProcess);
    QVERIFY(end.closesWindow());
    QVERIFY(!end.asksFirst());
}

QTEST_APPLESS_MAIN(tst_sessionend)
#include "tst_sessionend.moc"
