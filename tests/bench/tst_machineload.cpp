#include "bench/MachineLoad.h"

#include <QTest>

#include <cmath>
#include <string>

using Ticks = MachineLoad::Ticks;

namespace
{

bool isClose(double one, double other)
{
    return std::abs(one - other) < 1e-9;
}

} // namespace

class tst_machineload : public QObject
{
    Q_OBJECT
private Q_SLOTS:
    void parses_data();
    void parses();
    void shares_data();
    void shares();
    void describes();
};

void tst_machineload::parses_data()
{
    QTest::addColumn<std::string>("line");
    QTest::addColumn<double>("used");
    QTest::addColumn<double>("idle");
    QTest::addColumn<double>("stolen");
    QTest::newRow("all columns") << std::string("cpu  100 20 30 4000 50 6 7 8 9 10") << 163.0 << 4050.0
                                 << 8.0;
    QTest::newRow("an old kernel's") << std::string("cpu  100 20 30 4000") << 150.0 << 4000.0 << 0.0;
    QTest::newRow("not numbers") << std::string("cpu  100 many 30 4000") << 100.0 << 0.0 << 0.0;
    QTest::newRow("nothing") << std::string() << 0.0 << 0.0 << 0.0;
}

void tst_machineload::parses()
{
    QFETCH(std::string, line);
    const Ticks ticks = MachineLoad::parse(line);
    QTEST(ticks.used, "used");
    QTEST(ticks.idle, "idle");
    QTEST(ticks.stolen, "stolen");
}

void tst_machineload::shares_data()
{
    QTest::addColumn<double>("used");
    QTest::addColumn<double>("idle");
    QTest::addColumn<double>("stolen");
    QTest::addColumn<double>("own");
    QTest::addColumn<double>("others");
    QTest::addColumn<double>("stolenShare");
    QTest::addColumn<bool>("isBusy");
    QTest::newRow("only this program") << 100.0 << 100.0 << 0.0 << 100.0 << 0.0 << 0.0 << false;
    QTest::newRow("the services of a machine") << 102.0 << 98.0 << 0.0 << 100.0 << 0.01 << 0.0 << false;
    QTest::newRow("another program on a core") << 180.0 << 20.0 << 0.0 << 100.0 << 0.4 << 0.0 << true;
    QTest::newRow("the host takes time") << 100.0 << 90.0 << 10.0 << 100.0 << 0.0 << 0.05 << true;
    QTest::newRow("more own time than was counted") << 90.0 << 110.0 << 0.0 << 100.0 << 0.0 << 0.0 << false;
    QTest::newRow("no time went by") << 0.0 << 0.0 << 0.0 << 0.0 << 0.0 << 0.0 << false;
}

void tst_machineload::shares()
{
    QFETCH(double, used);
    QFETCH(double, idle);
    QFETCH(double, stolen);
    QFETCH(double, own);
    QFETCH(double, others);
    QFETCH(double, stolenShare);
    const Ticks before{1000, 2000, 30};
    const Ticks after{1000 + used, 2000 + idle, 30 + stolen};
    const MachineLoad::Shares shares = MachineLoad::sharesBetween(before, after, own);
    QVERIFY(isClose(shares.others, others));
    QVERIFY(isClose(shares.stolen, stolenShare));
    QTEST(MachineLoad::isBusy(shares), "isBusy");
}

void tst_machineload::describes()
{
    QCOMPARE(
        MachineLoad::describe({0.004, 0}),
        std::string(
            "Other programs used 0.4 % of the processors, the machine's host took 0.0 %: a quiet machine."));
    QCOMPARE(
        MachineLoad::describe({0.4, 0.02}),
        std::string("Other programs used 40.0 % of the processors, the machine's host took 2.0 %: a busy "
                    "machine, whose times are not to be believed."));
}

QTEST_APPLESS_MAIN(tst_machineload)
#include "tst_machineload.moc"
