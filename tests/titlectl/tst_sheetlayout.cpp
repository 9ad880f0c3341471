// The places on a page of the contact sheet.
#include "titlectl/SheetLayout.h"

#include <QTest>

class tst_sheetlayout : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void pages_data();
    void pages();
    void places_data();
    void places();
};

void tst_sheetlayout::pages_data()
{
    QTest::addColumn<int>("titles");
    QTest::addColumn<int>("pages");
    QTest::newRow("none") << 0 << 1;
    QTest::newRow("one") << 1 << 1;
    QTest::newRow("full") << 16 << 1;
    QTest::newRow("one more") << 17 << 2;
    QTest::newRow("many") << 998 << 63;
}

void tst_sheetlayout::pages()
{
    QFETCH(int, titles);
    QFETCH(int, pages);
    QCOMPARE(SheetLayout::pages(titles), pages);
}

void tst_sheetlayout::places_data()
{
    QTest::addColumn<QSizeF>("size");
    QTest::newRow("across") << QSizeF(1754, 1240);
    QTest::newRow("upright") << QSizeF(1240, 1754);
    QTest::newRow("wide") << QSizeF(4000, 1000);
}

void tst_sheetlayout::places()
{
    QFETCH(QSizeF, size);
    const SheetLayout layout(size);
    const QRectF page(QPointF(0, 0), size);
    QList<QRectF> taken{layout.heading()};
    for (int i = 0; i < SheetLayout::PER_PAGE; ++i) {
        const QRectF picture = layout.picture(i);
        const QRectF name = layout.name(i);
        QVERIFY(qAbs(picture.width() / picture.height() - 16.0 / 9.0) < 1e-9);
        QCOMPARE(name.top(), picture.bottom());
        for (const QRectF& place : {picture, name}) {
            QVERIFY(page.contains(place));
            for (const QRectF& other : std::as_const(taken))
                QVERIFY(!other.intersects(place));
        }
        taken += {picture, name};
    }
}

QTEST_APPLESS_MAIN(tst_sheetlayout)
#include "tst_sheetlayout.moc"
