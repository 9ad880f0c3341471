// Picture files of other makers: what is decoded, and what is refused before a decoder sees it.
#include "document/PictureGuard.h"
#include "document/PictureReader.h"
#include "tests/support/RandomSeed.h"

#include <QBuffer>
#include <QFile>
#include <QImage>
#include <QImageWriter>
#include <QRandomGenerator>
#include <QTemporaryDir>
#include <QtEndian>
#include <QtTest/QTest>
#include <sys/stat.h>

namespace
{

constexpr quint32 LARGEST = PictureGuard::MAX_SIDE;

template <typename T>
QByteArray big(T value)
{
    QByteArray bytes(sizeof(T), '\0');
    qToBigEndian(value, bytes.data());
    return bytes;
}

template <typename T>
QByteArray little(T value)
{
    QByteArray bytes(sizeof(T), '\0');
    qToLittleEndian(value, bytes.data());
    return bytes;
}

// Check sums do not matter to the guard, and the decoder stops at the first that is wrong.
QByteArray chunk(const char* type, const QByteArray& data)
{
    return big(quint32(data.size())) + type + data + big(quint32(0));
}

QByteArray png(quint32 width, quint32 height, char depth = 8, const QByteArray& chunks = {})
{
    const QByteArray header = big(width) + big(height) + QByteArray(1, depth) + QByteArray("\x06\0\0\0", 4);
    return "\x89PNG\r\n\x1a\n" + chunk("IHDR", header) + chunks + chunk("IDAT", "x") + chunk("IEND", {});
}

QByteArray bmp(qint32 width, qint32 height, quint16 bits, quint32 kind, qint64 pixelBytes, quint32 colors = 0)
{
    const QByteArray info = little(quint32(40)) + little(width) + little(height) + little(quint16(1)) +
                            little(bits) + little(kind) + QByteArray(12, '\0') + little(colors) +
                            QByteArray(4, '\0');
    return "BM" + little(quint32(54 + pixelBytes)) + QByteArray(4, '\0') + little(quint32(54)) + info +
           QByteArray(pixelBytes, '\0');
}

QByteArray segment(char marker, const QByteArray& data)
{
    return QByteArray("\xFF", 1) + marker + big(quint16(data.size() + 2)) + data;
}

QByteArray jpegFrame(char marker, quint16 width, quint16 height, const QByteArray& samplings)
{
    QByteArray data = QByteArray(1, 8) + big(height) + big(width) + QByteArray(1, char(samplings.size()));
    for (qsizetype i = 0; i < samplings.size(); ++i)
        data += QByteArray(1, char(i + 1)) + samplings.at(i) + QByteArray(1, '\0');
    return segment(marker, data);
}

QByteArray jpeg(const QByteArray& frame, int scans = 1)
{
    QByteArray bytes("\xFF\xD8", 2);
    bytes += segment('\xE0', "JFIF") + frame;
    for (int i = 0; i < scans; ++i)
        bytes +=
            segment('\xDA', QByteArray("\x01\x01\x00\x00\x3F\x00", 6)) + QByteArray("ab\xFF\0c\xFF\xD0z", 8);
    return bytes + QByteArray("\xFF\xD9", 2);
}

QByteArray gif(quint16 width, quint16 height, quint16 left, quint16 top, quint16 frameWidth,
               quint16 frameHeight, const QByteArray& data = QByteArray("\x02\x02\x44\x01\x00", 5))
{
    return "GIF89a" + little(width) + little(height) + QByteArray("\x80\0\0", 3) +
           QByteArray("\0\0\0\xFF\xFF\xFF", 6) + QByteArray("!\xFE\x02hi\0", 6) + "," + little(left) +
           little(top) + little(frameWidth) + little(frameHeight) + QByteArray(1, '\0') + data + ";";
}

template <typename T>
QByteArray number(bool isBig, T value)
{
    return isBig ? big(value) : little(value);
}

struct TiffField {
    quint16 tag;
    quint16 type;
    quint32 count;
    quint32 value;
};

QByteArray tiff(bool isBig, const QList<TiffField>& fields)
{
    QByteArray bytes = isBig ? QByteArray("MM\0*", 4) : QByteArray("II*\0", 4);
    bytes += number(isBig, quint32(8)) + number(isBig, quint16(fields.size()));
    for (const TiffField& field : fields) {
        bytes += number(isBig, field.tag) + number(isBig, field.type) + number(isBig, field.count);
        const bool isShort = field.type == 3 && field.count == 1;
        bytes +=
            isShort ? number(isBig, quint16(field.value)) + QByteArray(2, '\0') : number(isBig, field.value);
    }
    return bytes + QByteArray(4, '\0');
}

QImage gradient(QImage::Format format)
{
    QImage image(61, 37, QImage::Format_ARGB32);
    for (int y = 0; y < image.height(); ++y)
        for (int x = 0; x < image.width(); ++x)
            image.setPixel(x, y, qRgba(4 * x, 6 * y, 100, 255 - x));
    return image.convertToFormat(format);
}

QByteArray encoded(const QImage& image, const char* format, bool isProgressive = false)
{
    QByteArray bytes;
    QBuffer buffer(&bytes);
    buffer.open(QIODevice::WriteOnly);
    QImageWriter writer(&buffer, format);
    writer.setProgressiveScanWrite(isProgressive);
    return writer.write(image) ? bytes : QByteArray();
}

} // namespace

class tst_picturereader : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void ordinaryPictures_data()
    {
        QTest::addColumn<QByteArray>("bytes");
        QTest::addColumn<QByteArray>("format");
        for (const auto& [name, format] :
             {std::pair("alpha", QImage::Format_ARGB32), std::pair("opaque", QImage::Format_RGB32),
              std::pair("palette", QImage::Format_Indexed8), std::pair("mono", QImage::Format_Mono),
              std::pair("grey", QImage::Format_Grayscale8), std::pair("16 bits", QImage::Format_RGBA64)}) {
            QTest::addRow("PNG, %s", name) << encoded(gradient(format), "png") << QByteArray("png");
            QTest::addRow("BMP, %s", name) << encoded(gradient(format), "bmp") << QByteArray("bmp");
        }
        const QImage image = gradient(QImage::Format_RGB32);
        QTest::newRow("JPEG") << encoded(image, "jpeg") << QByteArray("jpeg");
        QTest::newRow("JPEG, in refinements") << encoded(image, "jpeg", true) << QByteArray("jpeg");
        QTest::newRow("JPEG, grey") << encoded(gradient(QImage::Format_Grayscale8), "jpeg")
                                    << QByteArray("jpeg");
        QTest::newRow("JPEG, cut off") << encoded(image, "jpeg").chopped(60) << QByteArray("jpeg");
        QTest::newRow("GIF") << gif(2, 1, 0, 0, 2, 1) << QByteArray("gif");
    }

    void ordinaryPictures()
    {
        QFETCH(QByteArray, bytes);
        QFETCH(QByteArray, format);
        QVERIFY(!bytes.isEmpty());
        QCOMPARE(PictureGuard(bytes).format(), format);
        // Whatever the file is called.
        for (const char* name : {"画像 é", "picture.png", "picture.gif"}) {
            const QString path = write(name, bytes);
            const QImage expected = QImage::fromData(bytes, format.constData());
            QVERIFY(!expected.isNull());
            const PictureReader reader(path);
            QCOMPARE(reader.size(), expected.size());
            QCOMPARE(reader.read(), expected);
            QCOMPARE(reader.read(), expected); // again
            QCOMPARE(reader.read(QSize(20, 12)).size(), QSize(20, 12));
        }
    }

    void noPictures()
    {
        const QString pipe = m_folder.filePath("pipe.png");
        QCOMPARE(mkfifo(pipe.toLocal8Bit().constData(), 0600), 0);
        for (const QString& path :
             {QString(), m_folder.filePath("missing.png"), m_folder.path(), pipe, QStringLiteral("/dev/zero"),
              write("empty.png", {}), write("text.png", "no picture"),
              write("drawing.svg", "<svg width='9' height='9'/>"),
              write("x.xbm", "#define x_width 8\n#define x_height 1\nstatic char x_bits[] = { 0xff };\n"),
              write("x.ppm", "P3 1 1 255 1 2 3\n")}) {
            QVERIFY2(PictureReader::read(path).isNull(), qPrintable(path));
            QVERIFY(PictureReader(path).size().isEmpty());
        }
        // More than the largest picture could need, of which nothing is read.
        QFile sparse(write("sparse.png", png(1, 1)));
        QVERIFY(sparse.resize(PictureReader::MAX_FILE_BYTES + 1));
        QVERIFY(PictureReader::read(sparse.fileName()).isNull());
    }

    void theLargestPicture()
    {
        QImage image(LARGEST, LARGEST, QImage::Format_Mono);
        image.fill(1);
        const QString path = write("largest.png", encoded(image, "png"));
        QCOMPARE(PictureReader(path).size(), QSize(LARGEST, LARGEST));
        QCOMPARE(PictureReader::read(path).size(), QSize(LARGEST, LARGEST));
    }

    void limits_data()
    {
        QTest::addColumn<QByteArray>("bytes");
        QTest::addColumn<bool>("isAccepted");
        const auto row = [](const char* name, const QByteArray& bytes, bool isAccepted) {
            QTest::newRow(name) << bytes << isAccepted;
        };
        row("PNG, largest", png(LARGEST, LARGEST), true);
        row("PNG, too wide", png(LARGEST + 1, 1), false);
        row("PNG, too high", png(1, LARGEST + 1), false);
        row("PNG, no width", png(0, 1), false);
        row("PNG, most negative", png(0x80000000, 1), false);
        row("PNG, 16 bits, half the largest", png(LARGEST, LARGEST / 2, 16), true);
        row("PNG, 16 bits, more", png(LARGEST, LARGEST / 2 + 1, 16), false);
        row("PNG, text", png(1, 1, 8, chunk("tEXt", QByteArray(1000, 'x'))), true);
        for (const char* type : {"tEXt", "zTXt", "iTXt", "sPLT", "iCCP", "PLTE", "IDAT", "vpAg"})
            row(type, png(1, 1, 8, big(quint32(0x70000000)) + type + QByteArray(200, 'x')), false);
        row("PNG, length of all bits", png(1, 1, 8, big(quint32(-1)) + "tEXt"), false);
        row("PNG, second header",
            png(1, 1, 8, chunk("IHDR", big(quint32(9999)) + big(quint32(9999)) + "\x08\x06\0\0\0")), false);
        row("PNG, no end", png(1, 1).chopped(12), false);
        row("PNG, header later", "\x89PNG\r\n\x1a\n" + chunk("tEXt", "x") + png(1, 1).mid(8), false);

        row("BMP, largest", bmp(LARGEST, LARGEST, 1, 0, LARGEST / 8 * qint64(LARGEST)), true);
        row("BMP, upside down", bmp(3, -2, 24, 0, 24), true);
        row("BMP, fewer lines than told", bmp(3, -3, 24, 0, 24), false);
        row("BMP, too wide", bmp(LARGEST + 1, 1, 1, 0, 8192), false);
        row("BMP, too high", bmp(1, LARGEST + 1, 1, 0, 4 * (LARGEST + 1)), false);
        row("BMP, most negative height", bmp(1, INT_MIN, 1, 0, 100), false);
        row("BMP, negative width", bmp(-3, 2, 24, 0, 24), false);
        row("BMP, run lengths", bmp(LARGEST, LARGEST, 8, 1, 2), true);
        row("BMP, no such depth", bmp(1, 1, 7, 0, 4), false);
        row("BMP, colours without end", bmp(1, 1, 8, 0, 4, 0x7FFFFFFF), false);
        row("BMP, header cut off", bmp(1, 1, 24, 0, 4).left(40), false);
        row("BMP, two bytes", "BM", false);

        const QByteArray three("\x22\x11\x11", 3);
        row("JPEG, largest", jpeg(jpegFrame('\xC0', LARGEST, LARGEST, three)), true);
        row("JPEG, too wide", jpeg(jpegFrame('\xC0', LARGEST + 1, 1, three)), false);
        row("JPEG, too high", jpeg(jpegFrame('\xC0', 1, LARGEST + 1, three)), false);
        row("JPEG, height told later", jpeg(jpegFrame('\xC0', 1, 0, three)), false);
        row("JPEG, refinements", jpeg(jpegFrame('\xC2', LARGEST, LARGEST, three)), true);
        row("JPEG, refinements, colours in full", jpeg(jpegFrame('\xC2', LARGEST, LARGEST, "\x11\x11\x11")),
            false);
        row("JPEG, refinements, colours in full, smaller",
            jpeg(jpegFrame('\xC2', 6000, 6000, "\x11\x11\x11")), true);
        row("JPEG, two frames", jpeg(jpegFrame('\xC0', 1, 1, three) + jpegFrame('\xC0', 1, 1, three)), false);
        row("JPEG, no frame", jpeg({}), false);
        row("JPEG, no scan", jpeg(jpegFrame('\xC0', 1, 1, three), 0), false);
        row("JPEG, ten scans", jpeg(jpegFrame('\xC2', 100, 100, three), 10), true);
        row("JPEG, thousands of scans", jpeg(jpegFrame('\xC2', 100, 100, three), 5000), false);
        row("JPEG, no colour", jpeg(jpegFrame('\xC0', 1, 1, "")), false);
        row("JPEG, five colours", jpeg(jpegFrame('\xC0', 1, 1, "\x11\x11\x11\x11\x11")), false);
        row("JPEG, sampling of nothing", jpeg(jpegFrame('\xC0', 1, 1, QByteArray("\0\x11\x11", 3))), false);
        row("JPEG, part beyond the end",
            QByteArray("\xFF\xD8\xFF\xE1\xFF\xFF"
                       "Exif",
                       10),
            false);

        row("GIF, largest", gif(LARGEST, LARGEST / 2, 0, 0, LARGEST, LARGEST / 2), true);
        row("GIF, too wide", gif(LARGEST + 1, 1, 0, 0, 1, 1), false);
        row("GIF, frame too wide", gif(1, 1, 0, 0, 65535, 65535), false);
        row("GIF, frame far out", gif(1, 1, 65535, 0, 1, 1), false);
        row("GIF, no size", gif(0, 0, 0, 0, 1, 1), false);
        row("GIF, block beyond the end", gif(1, 1, 0, 0, 1, 1, QByteArray("\x02\xFF\x44", 3)), false);
        row("GIF, no frame", gif(1, 1, 0, 0, 1, 1).left(25) + ";", false);

        for (const bool isBig : {false, true}) {
            const auto sized = [isBig](quint32 width, quint32 height, QList<TiffField> more = {}) {
                return tiff(isBig, QList<TiffField>{{256, 4, 1, width}, {257, 4, 1, height}} + more);
            };
            const auto name = [isBig](const char* what) {
                return QByteArray(isBig ? "TIFF, big, " : "TIFF, little, ") + what;
            };
            row(name("largest"), sized(LARGEST, LARGEST, {{258, 3, 1, 8}, {277, 3, 1, 4}}), true);
            row(name("too wide"), sized(LARGEST + 1, 1), false);
            row(name("too high"), sized(1, 0x80000000), false);
            row(name("deep"), sized(LARGEST, LARGEST, {{258, 3, 1, 16}, {277, 3, 1, 4}}), false);
            row(name("many samples"), sized(1, 1, {{277, 3, 1, 60000}}), false);
            row(name("large tiles"), sized(1, 1, {{322, 4, 1, 60000}, {323, 4, 1, 60000}}), false);
            row(name("offsets beyond the end"), sized(1, 1, {{273, 4, 0x10000000, 8}}), false);
            row(name("unknown type"), sized(1, 1, {{273, 99, 1, 8}}), false);
            row(name("no size"), tiff(isBig, {{258, 3, 1, 8}}), false);
            row(name("no fields"), tiff(isBig, {}), false);
            row(name("directory beyond the end"), sized(1, 1).left(8), false);
        }
    }

    void limits()
    {
        QFETCH(QByteArray, bytes);
        QFETCH(bool, isAccepted);
        const PictureGuard guard(bytes);
        QCOMPARE(guard.isAccepted(), isAccepted);
        QCOMPARE(guard.format().isEmpty(), !isAccepted);
        QCOMPARE(guard.size().isValid(), isAccepted);
        if (!isAccepted)
            QVERIFY(PictureReader::read(write("refused", bytes)).isNull());
    }

    // Cut off and spoiled anywhere: refused, or decoded within the limits.
    void spoiledPictures()
    {
        const QImage image = gradient(QImage::Format_ARGB32);
        const QList<QByteArray> pictures{
            encoded(image, "png"),  encoded(image, "bmp"),
            encoded(image, "jpeg"), encoded(image, "jpeg", true),
            gif(2, 1, 0, 0, 2, 1),  tiff(false, {{256, 4, 1, 9}, {257, 4, 1, 9}}),
            bmp(9, 9, 8, 1, 40)};
        const RandomSeed seed(20261122);
        QRandomGenerator random(seed);
        for (const QByteArray& bytes : pictures) {
            for (qsizetype length = 0; length < bytes.size(); length += 1 + length / 50)
                read(bytes.left(length));
            for (int round = 0; round < 300; ++round) {
                QByteArray spoiled = bytes;
                for (int i = random.bounded(1, 6); i > 0; --i)
                    spoiled[random.bounded(int(qMin<qsizetype>(spoiled.size(), 200)))] =
                        char(random.bounded(256));
                read(spoiled);
            }
        }
    }

private:
    QString write(const QString& name, const QByteArray& bytes) const
    {
        const QString path = m_folder.filePath(name);
        QFile file(path);
        if (!file.open(QIODevice::WriteOnly) || file.write(bytes) != bytes.size())
            qFatal("cannot write %s", qPrintable(path));
        return path;
    }

    void read(const QByteArray& bytes) const
    {
        const PictureGuard guard(bytes);
        if (guard.size().width() > 2000 || guard.size().height() > 2000)
            return; // allowed, and slow to decode by hundreds
        const QImage image = PictureReader::read(write("spoiled", bytes));
        QVERIFY(image.isNull() || guard.isAccepted());
        QVERIFY(image.sizeInBytes() <= PictureGuard::MAX_DECODED_BYTES);
    }

    QTemporaryDir m_folder;
};

QTEST_GUILESS_MAIN(tst_picturereader)
#include "tst_picturereader.moc"
