// The limit of open files and sockets.
#include "support/DescriptorLimit.h"

#include <sys/resource.h>

#include <QTest>

class tst_descriptorlimit : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void raisesTheSoftLimit();
    void keepsAHigherOne();
    void staysBelowTheHardLimit();

private:
    static void setSoft(rlim_t soft)
    {
        rlimit limit{};
        getrlimit(RLIMIT_NOFILE, &limit);
        limit.rlim_cur = soft;
        QCOMPARE(setrlimit(RLIMIT_NOFILE, &limit), 0);
    }
    static rlimit raised()
    {
        DescriptorLimit::raise();
        rlimit limit{};
        getrlimit(RLIMIT_NOFILE, &limit);
        return limit;
    }
};

void tst_descriptorlimit::raisesTheSoftLimit()
{
    setSoft(256);
    const rlimit limit = raised();
    QCOMPARE(limit.rlim_cur, std::min<rlim_t>(DescriptorLimit::WANTED, limit.rlim_max));
}

void tst_descriptorlimit::keepsAHigherOne()
{
    rlimit limit{};
    getrlimit(RLIMIT_NOFILE, &limit);
    if (limit.rlim_max <= DescriptorLimit::WANTED)
        QSKIP("the hard limit of this machine is too low");
    setSoft(DescriptorLimit::WANTED + 1);
    QCOMPARE(raised().rlim_cur, rlim_t(DescriptorLimit::WANTED + 1));
}

// The last one: a hard limit does not go up again.
void tst_descriptorlimit::staysBelowTheHardLimit()
{
    const rlimit low{200, 300};
    QCOMPARE(setrlimit(RLIMIT_NOFILE, &low), 0);
    QCOMPARE(raised().rlim_cur, rlim_t(300));
}

QTEST_GUILESS_MAIN(tst_descriptorlimit)
#include "tst_descriptorlimit.moc"
