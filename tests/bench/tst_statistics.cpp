#include "bench/Statistics.h"

#include <QTest>

#include <cmath>
#include <vector>

using Values = std::vector<double>;
using Points = std::vector<std::pair<double, double>>;

class tst_statistics : public QObject
{
    Q_OBJECT
private Q_SLOTS:
    void middle_data();
    void middle();
    void growth_data();
    void growth();
};

void tst_statistics::middle_data()
{
    QTest::addColumn<Values>("values");
    QTest::addColumn<double>("median");
    QTest::addColumn<double>("spread");
    QTest::newRow("none") << Values{} << 0.0 << 0.0;
    QTest::newRow("one") << Values{3} << 3.0 << 0.0;
    QTest::newRow("odd, in no order") << Values{9, 1, 4} << 4.0 << 2.0;
    QTest::newRow("even") << Values{8, 2, 4, 6} << 5.0 << 1.2;
    QTest::newRow("all equal") << Values{7, 7, 7} << 7.0 << 0.0;
    QTest::newRow("one outlier") << Values{10, 10, 10, 10, 10, 10, 10, 10, 100} << 10.0 << 9.0;
    QTest::newRow("a median of zero") << Values{0, 0, 5} << 0.0 << 0.0;
}

void tst_statistics::middle()
{
    QFETCH(Values, values);
    QTEST(Statistics::median(values), "median");
    QTEST(Statistics::spread(values), "spread");
}

void tst_statistics::growth_data()
{
    QTest::addColumn<Points>("points");
    QTest::addColumn<double>("exponent");
    QTest::newRow("none") << Points{} << 0.0;
    QTest::newRow("one size") << Points{{10, 1}, {10, 2}} << 0.0;
    QTest::newRow("does not grow") << Points{{10, 5}, {99, 5}, {9998, 5}} << 0.0;
    QTest::newRow("in proportion") << Points{{10, 1}, {100, 10}, {1000, 100}} << 1.0;
    QTest::newRow("squared") << Points{{10, 1}, {300, 900}, {1200, 14400}} << 2.0;
    QTest::newRow("root") << Points{{4, 2}, {16, 4}} << 0.5;
    QTest::newRow("becomes faster") << Points{{10, 10}, {100, 1}} << -1.0;
    QTest::newRow("what was not measured is left out") << Points{{10, 1}, {50, 0}, {0, 3}, {100, 10}} << 1.0;
    QTest::newRow("the line closest to all") << Points{{1, 1}, {10, 10}, {100, 10}} << 0.5;
}

void tst_statistics::growth()
{
    QFETCH(Points, points);
    QFETCH(double, exponent);
    const double found = Statistics::growthExponent(points);
    QVERIFY2(std::abs(found - exponent) < 1e-9, qPrintable(QString::number(found)));
}

QTEST_APPLESS_MAIN(tst_statistics)
#include "tst_statistics.moc"
