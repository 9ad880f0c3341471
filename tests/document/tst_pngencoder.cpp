// Pictures encoded as PNG files, decoded again by libpng, Qt, and ffmpeg where it is installed. TITLER_SEED
// repeats a run of the random pictures, TITLER_PICTURES changes their number.
#include "document/PngEncoder.h"
#include "tests/support/RandomSeed.h"

#include <QFile>
#include <QImage>
#include <QPainter>
#include <QProcess>
#include <QRandomGenerator>
#include <QStandardPaths>
#include <QTemporaryDir>
#include <QtEndian>
#include <QtTest/QTest>
#include <array>
#include <cmath>
#include <cstring>
#include <future>
#include <libdeflate.h>
#include <memory>
#include <png.h>
#include <vector>

namespace
{

constexpr std::array FORMATS = {QImage::Format_RGB32, QImage::Format_ARGB32,
                                QImage::Format_ARGB32_Premultiplied};
constexpr std::size_t BLOCK_TOKENS = 32768;

enum class Content { Transparent, Even, Noise, Photograph, Text, Steps };

QRgb photographPixel(int x, int y, QRandomGenerator& random)
{
    const int light = 120 + static_cast<int>(80 * std::sin(x / 30.0) * std::cos(y / 20.0));
    return qRgb(light + random.bounded(8), light + random.bounded(8), light - random.bounded(8));
}

QRgb pixel(Content content, int x, int y, QRandomGenerator& random)
{
    switch (content) {
    case Content::Transparent:
        return 0;
    case Content::Even:
        return qRgba(200, 100, 50, 150);
    case Content::Noise:
        return random.generate();
    case Content::Photograph:
        return photographPixel(x, y, random);
    case Content::Steps: // what differs from the line above begins and ends anywhere
        return x * 7 % 31 < y * 11 % 31 ? qRgba(x, y, x ^ y, y * 16) : qRgba(9, 8, 7, 6);
    case Content::Text:
        break;
    }
    const int stroke = (x + y / 3) % 23;
    const bool isInLine = y % 20 > 5;
    return isInLine && stroke < 6 ? qRgba(255, 255, 255, qMin(255, stroke * 60)) : 0;
}

QImage picture(QSize size, QImage::Format format, Content content)
{
    QRandomGenerator random(static_cast<quint32>(size.width() * 8191 + size.height()));
    QImage image(size, QImage::Format_ARGB32);
    for (int y = 0; y < size.height(); ++y) {
        auto* line = reinterpret_cast<QRgb*>(image.scanLine(y));
        for (int x = 0; x < size.width(); ++x)
            line[x] = pixel(content, x, y, random);
    }
    return image.convertToFormat(format);
}

// Returns what the file should contain.
QImage expected(const QImage& image)
{
    return image.convertToFormat(image.hasAlphaChannel() ? QImage::Format_ARGB32 : QImage::Format_RGB32);
}

// Returns the picture as libpng decodes it; null if it finds anything to remark on.
QImage byLibpng(const QByteArray& file)
{
    png_image png = {};
    png.version = PNG_IMAGE_VERSION;
    if (!png_image_begin_read_from_memory(&png, file.constData(), static_cast<std::size_t>(file.size())))
        return {};
    const bool hasAlpha = (png.format & PNG_FORMAT_FLAG_ALPHA) != 0;
    QImage image(static_cast<int>(png.width), static_cast<int>(png.height),
                 hasAlpha ? QImage::Format_ARGB32 : QImage::Format_RGB32);
    png.format = PNG_FORMAT_BGRA;
    if (!png_image_finish_read(&png, nullptr, image.bits(), static_cast<png_int_32>(image.bytesPerLine()),
                               nullptr))
        return {};
    return png.warning_or_error == 0 ? image : QImage();
}

// Returns the data of all chunks of the type.
QByteArray chunks(const QByteArray& file, const QByteArray& type)
{
    QByteArray data;
    for (qsizetype at = 8; at + 8 <= file.size();) {
        const qsizetype size = qFromBigEndian<qint32>(file.constData() + at);
        if (file.mid(at + 4, 4) == type)
            data += file.mid(at + 8, size);
        at += size + 12;
    }
    return data;
}

// Returns whether the compressed lines are one zlib stream, with the right check sum and size.
bool isOneStream(const QByteArray& file, const QImage& image)
{
    const QByteArray data = chunks(file, "IDAT");
    const auto lineSize = static_cast<std::size_t>(image.width()) * (image.hasAlphaChannel() ? 4 : 3) + 1;
    std::vector<char> lines(lineSize * static_cast<std::size_t>(image.height()));
    libdeflate_decompressor* decompressor = libdeflate_alloc_decompressor();
    const auto result =
        libdeflate_zlib_decompress(decompressor, data.constData(), static_cast<std::size_t>(data.size()),
                                   lines.data(), lines.size(), nullptr);
    libdeflate_free_decompressor(decompressor);
    return result == LIBDEFLATE_SUCCESS;
}

bool isRight(const QByteArray& file, const QImage& image)
{
    const QImage wanted = expected(image);
    const QImage byQt = QImage::fromData(file, "png");
    return byQt.format() == wanted.format() && byQt == wanted && byLibpng(file) == wanted &&
           isOneStream(file, image);
}

// Returns a picture of areas in random colours and patterns.
QImage randomPicture(QRandomGenerator& random)
{
    const QSize size = random.bounded(8) == 0 ? QSize(1 + random.bounded(12000), 1 + random.bounded(4))
                                              : QSize(1 + random.bounded(150), 1 + random.bounded(90));
    QImage image(size, QImage::Format_ARGB32);
    image.fill(random.bounded(2) == 0 ? 0 : random.generate());
    for (int areas = random.bounded(12); areas > 0; --areas) {
        const QRect area = QRect(random.bounded(size.width()), random.bounded(size.height()),
                                 1 + random.bounded(size.width()), 1 + random.bounded(size.height()))
                               .intersected(image.rect());
        const auto content = static_cast<Content>(random.bounded(6));
        for (int y = area.top(); y <= area.bottom(); ++y)
            for (int x = area.left(); x <= area.right(); ++x)
                image.setPixel(x, y, pixel(content, x, y, random));
    }
    return image.convertToFormat(FORMATS[random.bounded(quint32(FORMATS.size()))]);
}

// Returns a picture of one line, whose bytes are those of the file.
QImage lineOf(const QByteArray& bytes)
{
    QImage image(static_cast<int>(bytes.size() / 4), 1, QImage::Format_ARGB32);
    for (int x = 0; x < image.width(); ++x) {
        const auto at = [&](int i) { return static_cast<uchar>(bytes[x * 4 + i]); };
        image.setPixel(x, 0, qRgba(at(0), at(1), at(2), at(3)));
    }
    return image;
}

} // namespace

class tst_pngencoder : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void everySize_data()
    {
        QTest::addColumn<Content>("content");
        QTest::addColumn<QImage::Format>("format");
        for (const QImage::Format format : FORMATS)
            for (const auto& [name, content] :
                 {std::pair("transparent", Content::Transparent), std::pair("even", Content::Even),
                  std::pair("noise", Content::Noise), std::pair("photograph", Content::Photograph),
                  std::pair("text", Content::Text), std::pair("steps", Content::Steps)})
                QTest::addRow("%s, format %d", name, format) << content << format;
    }

    // Small ones, and those around the lengths at which comparisons, repetitions and strips end.
    void everySize()
    {
        QFETCH(Content, content);
        QFETCH(QImage::Format, format);
        std::vector<QSize> sizes;
        for (int width = 1; width <= 20; ++width)
            for (int height = 1; height <= 6; ++height)
                sizes.emplace_back(width, height);
        for (const int width : {63,   64,   65,   66,   85,   86,    87,    88,    127,   128,   129,
                                172,  173,  240,  257,  258,  259,   516,   517,   960,   1920,  2047,
                                2048, 8190, 8191, 8192, 8193, 10922, 10923, 40000, 65535, 65536, 65537})
            sizes.emplace_back(width, 3);
        for (const int height : {100, 1000, 40000})
            sizes.emplace_back(1, height);
        sizes.emplace_back(1920, 1080);
        for (const QSize size : sizes) {
            const QImage image = picture(size, format, content);
            QVERIFY2(isRight(PngEncoder::encode(image), image),
                     qPrintable(QString("%1x%2").arg(size.width()).arg(size.height())));
        }
    }

    // The strips join into one stream wherever they are split, whichever thread compresses them.
    void everySplit_data()
    {
        QTest::addColumn<Content>("content");
        QTest::newRow("transparent") << Content::Transparent;
        QTest::newRow("noise") << Content::Noise;
        QTest::newRow("text") << Content::Text;
        QTest::newRow("steps") << Content::Steps;
    }

    void everySplit()
    {
        QFETCH(Content, content);
        for (const QImage::Format format : FORMATS) {
            const QImage image = picture({80, 41}, format, content);
            for (int lines = 1; lines <= image.height() + 1; ++lines) {
                const QByteArray file = PngEncoder::encode(image, lines, 1);
                QVERIFY2(isRight(file, image), qPrintable(QString::number(lines)));
                QCOMPARE(PngEncoder::encode(image, lines, 3), file);
            }
        }
    }

    void everyAlpha_data()
    {
        QTest::addColumn<int>("width");
        for (const int width : {16, 17, 31, 32, 255, 256, 257})
            QTest::addRow("%d", width) << width;
    }

    // With every colour, also those that are greater than the alpha by which they should be multiplied.
    void everyAlpha()
    {
        QFETCH(int, width);
        QImage image(width, 256 * 256 / width + 1, QImage::Format_ARGB32_Premultiplied);
        image.fill(0);
        for (int alpha = 0; alpha < 256; ++alpha) {
            for (int color = 0; color < 256; ++color) {
                const int place = alpha * 256 + color;
                reinterpret_cast<QRgb*>(image.scanLine(place / width))[place % width] =
                    qRgba(color, 255 - color, color / 2, alpha);
            }
        }
        QVERIFY(isRight(PngEncoder::encode(image), image));
    }

    void runsOfEveryLength()
    {
        for (const QImage::Format format : FORMATS) {
            QImage image(700, 1400, QImage::Format_ARGB32);
            image.fill(0);
            // Each second line has a run, and the next one takes it back.
            for (int y = 0; y < image.height(); y += 2) {
                const QRgb color = y % 4 == 0 ? 0xFF102030 : 0x80405060;
                for (int x = y / 2 % 3; x < y / 2; ++x)
                    image.setPixel(x, y, color);
            }
            const QImage converted = image.convertToFormat(format);
            QVERIFY(isRight(PngEncoder::encode(converted), converted));
        }
    }

    // A line of noise is one byte and as many pixels as the picture is wide.
    void blocksOfEveryFill()
    {
        constexpr int WIDTH = 127;
        constexpr int FULL = static_cast<int>(BLOCK_TOKENS) / (WIDTH + 1);
        for (const int height : {FULL - 1, FULL, FULL + 1, 2 * FULL, 2 * FULL + 1}) {
            const QImage image = picture({WIDTH, height}, QImage::Format_ARGB32, Content::Noise);
            QVERIFY(isRight(PngEncoder::encode(image, height, 1), image));
        }
    }

    // Numbers of bytes that grow like these would give the rarest a code longer than is allowed.
    void rareBytes()
    {
        QByteArray bytes;
        for (int value = 0, count = 1, next = 1; value < 22; ++value) {
            bytes.append(count, static_cast<char>(value * 11 + 1));
            count = std::exchange(next, count + next);
        }
        QRandomGenerator random(5);
        std::shuffle(bytes.begin(), bytes.end(), random);
        const QImage image = lineOf(bytes);
        const QByteArray file = PngEncoder::encode(image);
        QVERIFY(isRight(file, image));
        QVERIFY2(file.size() * 3 < bytes.size(), qPrintable(QString::number(file.size())));
    }

    // Buffers are kept from picture to picture, and several threads encode at once.
    void theSamePictureGivesTheSameFile()
    {
        std::vector<QImage> images;
        for (const QImage::Format format : FORMATS) {
            images.push_back(picture({1920, 540}, format, Content::Text));
            images.push_back(picture({33, 900}, format, Content::Steps));
            images.push_back(picture({200, 200}, format, Content::Noise));
        }
        std::vector<QByteArray> files;
        for (const QImage& image : images)
            files.push_back(PngEncoder::encode(image));
        std::vector<std::future<bool>> threads;
        for (int thread = 0; thread < 6; ++thread) {
            threads.push_back(std::async(std::launch::async, [&] {
                bool isSame = true;
                for (std::size_t i = images.size(); i-- > 0;)
                    isSame = isSame && PngEncoder::encode(images[i]) == files[i];
                return isSame;
            }));
        }
        for (std::future<bool>& thread : threads)
            QVERIFY(thread.get());
        for (std::size_t i = 0; i < images.size(); ++i)
            QVERIFY(isRight(files[i], images[i]));
    }

    void titlesAreSmall()
    {
        QImage image(1920, 1080, QImage::Format_ARGB32_Premultiplied);
        image.fill(Qt::transparent);
        QVERIFY(PngEncoder::encode(image).size() < 11000);
        QPainter painter(&image);
        painter.setRenderHint(QPainter::Antialiasing);
        painter.setPen(QPen(Qt::white, 9));
        for (int i = 0; i < 40; ++i)
            painter.drawEllipse(QPoint(60 + i * 45, 300 + i % 2 * 400), 20 + i, 60);
        painter.end();
        QVERIFY(isRight(PngEncoder::encode(image), image));
        QVERIFY(PngEncoder::encode(image).size() < 150000);
    }

    void resolutionIsKept()
    {
        QImage image = picture({9, 9}, QImage::Format_RGB32, Content::Noise);
        image.setDotsPerMeterX(1234);
        image.setDotsPerMeterY(4321);
        const QImage read = QImage::fromData(PngEncoder::encode(image));
        QCOMPARE(read.dotsPerMeterX(), 1234);
        QCOMPARE(read.dotsPerMeterY(), 4321);
    }

    void otherFormatsAreRefused()
    {
        QVERIFY(PngEncoder::encode(QImage()).isEmpty());
        for (int format = QImage::Format_Mono; format < QImage::NImageFormats; ++format) {
            QImage image(20, 20, static_cast<QImage::Format>(format));
            image.fill(0);
            const bool isEncoded = std::find(FORMATS.begin(), FORMATS.end(), image.format()) != FORMATS.end();
            QCOMPARE(PngEncoder::encode(image).isEmpty(), !isEncoded);
        }
    }

    void randomPictures()
    {
        const RandomSeed seed(20240);
        QRandomGenerator random(seed);
        for (int i = runLength("TITLER_PICTURES", 400); i > 0; --i) {
            const QImage image = randomPicture(random);
            const int lines = 1 + random.bounded(image.height() + 1);
            QVERIFY(isRight(PngEncoder::encode(image, lines, 1 + random.bounded(3)), image));
        }
    }

    void ffmpegDecodesThem()
    {
        const QString program = QStandardPaths::findExecutable("ffmpeg");
        if (program.isEmpty())
            QSKIP("ffmpeg is not installed");
        QTemporaryDir folder;
        for (const QImage::Format format : FORMATS) {
            for (const Content content :
                 {Content::Transparent, Content::Noise, Content::Photograph, Content::Text}) {
                const QImage image = picture({321, 123}, format, content);
                QFile file(folder.filePath("a.png"));
                QVERIFY(file.open(QIODevice::WriteOnly) && file.write(PngEncoder::encode(image, 50, 2)) > 0);
                file.close();
                QProcess process;
                process.start(program, {"-v", "error", "-xerror", "-i", file.fileName(), "-f", "rawvideo",
                                        "-pix_fmt", "bgra", "-"});
                QVERIFY(process.waitForFinished(60000) && process.exitCode() == 0);
                QCOMPARE(process.readAllStandardError(), QByteArray());
                const QByteArray pixels = process.readAllStandardOutput();
                QCOMPARE(pixels.size(), image.sizeInBytes());
                QCOMPARE(QImage(reinterpret_cast<const uchar*>(pixels.constData()), image.width(),
                                image.height(), expected(image).format()),
                         expected(image));
            }
        }
    }
};

QTEST_GUILESS_MAIN(tst_pngencoder)

#include "tst_pngencoder.moc"
