// Memory of pictures that is used again: when, how much of it, and that pictures in use keep theirs.
#include "document/RasterPool.h"

#include <QImage>
#include <QPainter>
#include <QTest>
#include <future>
#include <vector>

namespace
{

constexpr QSize BIG(1920, 1080);
constexpr QSize HALF(960, 540);
constexpr qsizetype BIG_BYTES = 1920 * 1080 * 4;

} // namespace

class tst_rasterpool : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init() { RasterPool::clear(); }

    void memoryIsUsedAgain()
    {
        const uchar* bytes = nullptr;
        {
            const QImage image = RasterPool::take(BIG);
            QCOMPARE(image.size(), BIG);
            QCOMPARE(image.format(), QImage::Format_ARGB32_Premultiplied);
            QCOMPARE(RasterPool::keptBytes(), qsizetype(0));
            bytes = image.constBits();
        }
        QCOMPARE(RasterPool::keptBytes(), BIG_BYTES);
        const QImage again = RasterPool::take(BIG);
        QCOMPARE(again.constBits(), bytes);
        QCOMPARE(RasterPool::keptBytes(), qsizetype(0));
        const QImage other = RasterPool::take(BIG);
        QVERIFY(other.constBits() != bytes);
    }

    void smallestMemoryIsTaken()
    {
        const uchar* bigBytes = nullptr;
        const uchar* halfBytes = nullptr;
        {
            const QImage big = RasterPool::take(BIG);
            const QImage half = RasterPool::take(HALF);
            bigBytes = big.constBits();
            halfBytes = half.constBits();
        }
        const QImage first = RasterPool::take({900, 500});
        QCOMPARE(first.constBits(), halfBytes);
        QCOMPARE(first.size(), QSize(900, 500));
        QCOMPARE(first.bytesPerLine(), qsizetype(900 * 4));
        const QImage second = RasterPool::take({900, 500});
        QCOMPARE(second.constBits(), bigBytes);
        QCOMPARE(RasterPool::keptBytes(), qsizetype(0));
    }

    void tooSmallMemoryIsNotTaken()
    {
        RasterPool::take(HALF);
        const QImage big = RasterPool::take(BIG);
        QCOMPARE(RasterPool::keptBytes(), BIG_BYTES / 4);
        QCOMPARE(big.sizeInBytes(), BIG_BYTES);
    }

    void paintingNeedsNoOtherMemory()
    {
        QImage image = RasterPool::take(HALF);
        const uchar* bytes = image.constBits();
        image.fill(Qt::transparent);
        QPainter(&image).fillRect(3, 3, 5, 5, Qt::red);
        QCOMPARE(image.constBits(), bytes);
        QCOMPARE(image.pixelColor(4, 4), QColor(Qt::red));
        QCOMPARE(image.pixelColor(2, 2).alpha(), 0);
    }

    void copiesKeepTheirPixels()
    {
        QImage image = RasterPool::take(HALF);
        image.fill(Qt::red);
        QImage copy = image;
        image.fill(Qt::blue);
        QCOMPARE(copy.pixelColor(7, 7), QColor(Qt::red));
        image = QImage();
        copy.fill(Qt::green);
        QCOMPARE(copy.pixelColor(7, 7), QColor(Qt::green));
    }

    void whatIsKeptIsBounded()
    {
        std::vector<QImage> images;
        for (int i = 0; i < 5; ++i)
            images.push_back(RasterPool::take(BIG));
        images.push_back(RasterPool::take(HALF));
        images.clear();
        QVERIFY(RasterPool::keptBytes() >= BIG_BYTES);
        QVERIFY(RasterPool::keptBytes() <= RasterPool::LIMIT);
        RasterPool::clear();
        QCOMPARE(RasterPool::keptBytes(), qsizetype(0));
    }

    // Each thread fills pictures with a colour of its own, and finds it there.
    void manyThreads()
    {
        std::vector<std::future<bool>> threads;
        for (int thread = 0; thread < 4; ++thread) {
            threads.push_back(std::async(std::launch::async, [thread] {
                bool isRight = true;
                for (int i = 0; i < 200; ++i) {
                    QImage image = RasterPool::take({64, 32 + i % 2});
                    const QRgb color = qRgb(thread, i, 200);
                    image.fill(color);
                    for (int y = 0; y < image.height(); ++y)
                        isRight = isRight && image.pixel(y, y % 32) == color;
                }
                return isRight;
            }));
        }
        for (std::future<bool>& thread : threads)
            QVERIFY(thread.get());
        QVERIFY(RasterPool::keptBytes() <= RasterPool::LIMIT);
    }
};

QTEST_GUILESS_MAIN(tst_rasterpool)

#include "tst_rasterpool.moc"
