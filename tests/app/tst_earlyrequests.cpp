// Requests that come before the hand-shakes are through.
#include "app/EarlyRequests.h"
#include "tests/support/Patience.h"

#include <QEventLoop>
#include <QTest>

class tst_earlyrequests : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void cleanup();
    void atOnceWithoutHandShakes();
    void afterTheLastHandShakeInTheirOrder();
    void whatComesMeanwhileStaysBehind();
    void aDialogHoldsNoOtherUp();
    void aSilentServiceHoldsNothingUpForEver();
    void aFloodIsCutOff();
    void unknownHandShakes();

private:
    static EarlyRequests& requests() { return *EarlyRequests::getInstance(); }
    void ask(int number)
    {
        requests().carryOut([this, number] { m_done << number; });
    }

    QList<int> m_done;
};

void tst_earlyrequests::cleanup()
{
    EarlyRequests::clearInstance();
    m_done.clear();
}

void tst_earlyrequests::atOnceWithoutHandShakes()
{
    ask(1);
    QCOMPARE(m_done, QList{1});
}

void tst_earlyrequests::afterTheLastHandShakeInTheirOrder()
{
    requests().expectClientId(65);
    requests().expectClientId(36);
    ask(1);
    requests().clientIdCame(65);
    ask(2);
    QCoreApplication::processEvents();
    QVERIFY(m_done.isEmpty());
    requests().clientIdCame(36);
    QTRY_COMPARE(m_done, QList({1, 2}));
    ask(3);
    QCOMPARE(m_done, QList({1, 2, 3}));
}

void tst_earlyrequests::whatComesMeanwhileStaysBehind()
{
    requests().expectClientId(65);
    ask(1);
    ask(2);
    requests().clientIdCame(65);
    ask(3);
    QTRY_COMPARE(m_done, QList({1, 2, 3}));
}

void tst_earlyrequests::aDialogHoldsNoOtherUp()
{
    requests().expectClientId(65);
    QEventLoop dialog;
    requests().carryOut([this, &dialog] {
        m_done << 1;
        dialog.exec();
        m_done << 4;
    });
    ask(2);
    requests().carryOut([this, &dialog] {
        m_done << 3;
        dialog.quit();
    });
    requests().clientIdCame(65);
    QTRY_COMPARE(m_done, QList({1, 2, 3, 4}));
}

void tst_earlyrequests::aSilentServiceHoldsNothingUpForEver()
{
    requests().expectClientId(71);
    ask(1);
    QTRY_COMPARE_WITH_TIMEOUT(m_done, QList{1}, 12 * EarlyRequests::PATIENCE.count() * 1000);
    ask(2);
    QCOMPARE(m_done, QList({1, 2}));
}

void tst_earlyrequests::aFloodIsCutOff()
{
    requests().expectClientId(65);
    for (int i = 0; i < 10 * EarlyRequests::MAX_KEPT; ++i)
        ask(i);
    requests().clientIdCame(65);
    QTRY_COMPARE(m_done.size(), EarlyRequests::MAX_KEPT);
    QCOMPARE(m_done.last(), EarlyRequests::MAX_KEPT - 1);
}

void tst_earlyrequests::unknownHandShakes()
{
    requests().clientIdCame(65);
    requests().expectClientId(65);
    requests().expectClientId(65);
    requests().clientIdCame(36);
    ask(1);
    QVERIFY(m_done.isEmpty());
    requests().clientIdCame(65);
    QTRY_COMPARE(m_done, QList{1});
}

QTEST_GUILESS_MAIN(tst_earlyrequests)
#include "tst_earlyrequests.moc"
