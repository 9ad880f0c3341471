// Pictures of half the size, compared with those of QImage::scaled.
#include "document/HalfPicture.h"

#include <QImage>
#include <QRandomGenerator>
#include <QTest>

namespace
{

QImage byQt(const QImage& picture)
{
    return picture.scaled(picture.size() / 2, Qt::IgnoreAspectRatio, Qt::SmoothTransformation);
}

QImage reduced(const QImage& picture)
{
    QImage half(picture.size() / 2, picture.format());
    half.fill(0xFF123456); // is overwritten
    HalfPicture::reduce(picture, half);
    return half;
}

// A picture of noise with blank areas of any size.
QImage picture(QSize size, QImage::Format format, QRandomGenerator& random)
{
    QImage image(size, QImage::Format_ARGB32);
    for (int y = 0; y < size.height(); ++y) {
        bool isBlank = false;
        for (int x = 0; x < size.width(); ++x) {
            if (random.bounded(6) == 0)
                isBlank = !isBlank;
            image.setPixel(x, y, isBlank ? 0 : random.generate());
        }
    }
    return image.convertToFormat(format);
}

} // namespace

class tst_halfpicture : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void everyWidth_data()
    {
        QTest::addColumn<QImage::Format>("format");
        QTest::newRow("with alpha") << QImage::Format_ARGB32_Premultiplied;
        QTest::newRow("opaque") << QImage::Format_RGB32;
    }

    void everyWidth()
    {
        QFETCH(QImage::Format, format);
        QRandomGenerator random(7);
        for (int width = 2; width <= 80; width += 2) {
            const QImage image = picture({width, 14}, format, random);
            QCOMPARE(reduced(image), byQt(image));
        }
    }

    void pictureForAir()
    {
        QRandomGenerator random(8);
        const QImage image = picture({1920, 1080}, QImage::Format_ARGB32_Premultiplied, random);
        QCOMPARE(reduced(image), byQt(image));
        QImage blank(1920, 1080, QImage::Format_ARGB32_Premultiplied);
        blank.fill(0);
        QCOMPARE(reduced(blank), byQt(blank));
    }

    // One pixel of four has the value, in each of the channels and at each of the places.
    void everyValueAtEveryPlace()
    {
        QImage image(256 * 2, 16 * 2, QImage::Format_ARGB32_Premultiplied);
        image.fill(0);
        for (int value = 0; value < 256; ++value)
            for (int i = 0; i < 16; ++i)
                image.setPixel(value * 2 + i % 2, i * 2 + i / 2 % 2, QRgb(value) << i / 4 * 8);
        const QImage half = reduced(image);
        QCOMPARE(half, byQt(image));
        QCOMPARE(half.pixelColor(255, 0), byQt(image).pixelColor(255, 0));
        for (int value = 0; value < 256; ++value) {
            for (int i = 0; i < 16; ++i)
                QCOMPARE(reinterpret_cast<const QRgb*>(half.constScanLine(i))[value], QRgb(value / 4)
                                                                                          << i / 4 * 8);
        }
    }
};

QTEST_GUILESS_MAIN(tst_halfpicture)

#include "tst_halfpicture.moc"
