#include "bench/FastPng.h"

#include <QImage>
#include <QRandomGenerator>
#include <QTest>

class tst_fastpng : public QObject
{
    Q_OBJECT
private Q_SLOTS:
    void isLossless_data();
    void isLossless();
    void isTheSameEachTime();
    void takesTheFastest();
};

namespace
{

// A picture with large even areas and some noise, so that it is compressed in several blocks.
QImage picture(QSize size, QImage::Format format, int noisyLines)
{
    QImage image(size, QImage::Format_ARGB32);
    image.fill(qRgba(10, 20, 30, 40));
    QRandomGenerator random(7);
    for (int y = 0; y < qMin(noisyLines, size.height()); ++y)
        for (int x = 0; x < size.width(); ++x)
            image.setPixel(x, size.height() - 1 - y, random.generate());
    return image.convertToFormat(format);
}

} // namespace

void tst_fastpng::isLossless_data()
{
    QTest::addColumn<QSize>("size");
    QTest::addColumn<int>("format");
    QTest::addColumn<int>("noisyLines");
    QTest::addColumn<int>("strips");
    for (const int strips : {1, 2, 3, 7}) {
        for (const auto format : {QImage::Format_RGB32, QImage::Format_ARGB32_Premultiplied}) {
            const auto add = [&](const char* name, QSize size, int noisy) {
                QTest::addRow("%s, format %d, %d strips", name, int(format), strips)
                    << size << int(format) << noisy << strips;
            };
            add("even", QSize(320, 100), 0);
            add("noise", QSize(301, 77), 77);
            add("partly noise", QSize(640, 360), 100);
            add("small", QSize(3, 7), 2);
        }
    }
}

void tst_fastpng::isLossless()
{
    QFETCH(QSize, size);
    QFETCH(int, format);
    QFETCH(int, noisyLines);
    QFETCH(int, strips);
    const QImage image = picture(size, QImage::Format(format), noisyLines);
    const auto read = image.hasAlphaChannel() ? QImage::Format_ARGB32 : QImage::Format_RGB32;
    for (const auto filter : {FastPng::Filter::None, FastPng::Filter::Up})
        for (const int level : {1, 2, 3})
            QCOMPARE(QImage::fromData(FastPng(image, filter, level, strips).encode()).convertToFormat(read),
                     image.convertToFormat(read));
}

void tst_fastpng::isTheSameEachTime()
{
    FastPng png(picture(QSize(640, 360), QImage::Format_ARGB32, 200), FastPng::Filter::Up, 2, 2);
    const QByteArray first = png.encode();
    QCOMPARE(png.encode(), first);
    QCOMPARE(png.encode(), first);
}

void tst_fastpng::takesTheFastest()
{
    const QImage image = picture(QSize(200, 100), QImage::Format_ARGB32, 20);
    QCOMPARE(QImage::fromData(FastPng::fastestFor(image, 2)->encode()), image);
}

QTEST_GUILESS_MAIN(tst_fastpng)
#include "tst_fastpng.moc"
