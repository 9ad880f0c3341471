// Shadows compared, pixel by pixel, with those of QGraphicsDropShadowEffect.
#include "canvas/ShadowPainter.h"

#include <QGraphicsDropShadowEffect>
#include <QGraphicsPixmapItem>
#include <QGraphicsScene>
#include <QImage>
#include <QPainter>
#include <QRandomGenerator>
#include <QTest>

namespace
{

// Draws with a ShadowPainter what its base class would draw.
class PaintedShadow : public QGraphicsDropShadowEffect
{
protected:
    void draw(QPainter* painter) override
    {
        const ShadowPainter shadow(offset(), blurRadius(), color());
        if (!shadow.isServed())
            return;
        QPoint place;
        const QPixmap source = sourcePixmap(Qt::DeviceCoordinates, &place, PadToEffectiveBoundingRect);
        const QTransform transform = painter->worldTransform();
        painter->setWorldTransform(QTransform());
        shadow.draw(*painter, place, source);
        painter->setWorldTransform(transform);
    }
};

QPixmap picture(QSize size, QRandomGenerator& random)
{
    QImage image(size, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    QPainter painter(&image);
    painter.setRenderHint(QPainter::Antialiasing);
    for (int i = 0; i < 6; ++i) {
        painter.setPen(QPen(QColor::fromRgba(random.generate()), 1 + random.bounded(9)));
        painter.drawLine(QPointF(random.bounded(size.width()), random.bounded(size.height())),
                         QPointF(random.bounded(size.width()), random.bounded(size.height())));
    }
    painter.end();
    return QPixmap::fromImage(image);
}

QImage render(QGraphicsDropShadowEffect* effect, const QPixmap& picture, QPointF place)
{
    QGraphicsScene scene(0, 0, 400, 300);
    scene.addRect(30, 40, 200, 100, Qt::NoPen, QColor(10, 200, 90, 130)); // something below
    auto* item = scene.addPixmap(picture);
    item->setPos(place);
    item->setGraphicsEffect(effect);
    QImage image(400, 300, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    QPainter painter(&image);
    painter.setRenderHint(QPainter::Antialiasing);
    scene.render(&painter);
    return image;
}

} // namespace

class tst_shadowpainter : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void sameAsQt_data()
    {
        QTest::addColumn<double>("radius");
        QTest::addColumn<QPointF>("offset");
        for (const double radius : {4.0, 5.0, 8.0, 12.5, 40.0})
            for (const QPointF offset : {QPointF(0, 0), QPointF(4, 4), QPointF(3, -5), QPointF(-7, 12)})
                QTest::addRow("%g, %g %g", radius, offset.x(), offset.y()) << radius << offset;
    }

    void sameAsQt()
    {
        QFETCH(double, radius);
        QFETCH(QPointF, offset);
        QRandomGenerator random(3);
        for (const QSize size : {QSize(200, 150), QSize(201, 97), QSize(64, 64), QSize(3, 3), QSize(1, 1)}) {
            for (const QColor& color : {QColor(0, 0, 0), QColor(63, 63, 63, 180), QColor(200, 20, 90, 40)}) {
                const QPixmap pixmap = picture(size, random);
                const QPointF place(20 + random.bounded(150), random.bounded(100) + 0.5);
                auto* qt = new QGraphicsDropShadowEffect;
                auto* ours = new PaintedShadow;
                for (QGraphicsDropShadowEffect* effect :
                     {qt, static_cast<QGraphicsDropShadowEffect*>(ours)}) {
                    effect->setBlurRadius(radius);
                    effect->setOffset(offset);
                    effect->setColor(color);
                }
                const QImage expected = render(qt, pixmap, place);
                QCOMPARE(render(ours, pixmap, place), expected);
            }
        }
    }

    void isServed()
    {
        QVERIFY(ShadowPainter({3, -2}, 4, Qt::black).isServed());
        QVERIFY(!ShadowPainter({3, -2}, 3.9, Qt::black).isServed());
        QVERIFY(!ShadowPainter({3.5, -2}, 8, Qt::black).isServed());
    }

    void blankPictureHasNoShadow()
    {
        QPixmap blank(50, 40);
        blank.fill(Qt::transparent);
        QImage image(80, 80, QImage::Format_ARGB32_Premultiplied);
        image.fill(qRgba(1, 2, 3, 4));
        const QImage before = image.copy();
        QPainter painter(&image);
        ShadowPainter({4, 4}, 8, Qt::black).draw(painter, {10, 10}, blank);
        painter.end();
        QCOMPARE(image, before);
    }
};

QTEST_MAIN(tst_shadowpainter)

#include "tst_shadowpainter.moc"
