// The reduction of pictures, and the writer of picture files.
#include "document/ImageResizer.h"
#include "document/PngWriter.h"
#include "support/FileSyncQueue.h"

#include <QBuffer>
#include <QColorSpace>
#include <QDir>
#include <QFile>
#include <QFileInfo>
#include <QPainter>
#include <QTemporaryDir>
#include <QtTest/QTest>
#include <memory>

namespace
{

QImage pattern(int width, int height, QImage::Format format)
{
    QImage image(width, height, QImage::Format_ARGB32);
    quint32 state = 1;
    for (int y = 0; y < height; ++y) {
        for (int x = 0; x < width; ++x) {
            state = state * 1664525u + 1013904223u;
            image.setPixel(x, y, state);
        }
    }
    return image.convertToFormat(format);
}

// What QImage::save makes of the picture.
QImage throughQt(const QImage& image)
{
    QByteArray bytes;
    QBuffer buffer(&bytes);
    buffer.open(QIODevice::WriteOnly);
    image.save(&buffer, "png");
    return QImage::fromData(bytes, "png");
}

} // namespace

class tst_imageresizer : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init()
    {
        m_folder = std::make_unique<QTemporaryDir>();
        qputenv("K2SYS_AC_DATA", m_folder->path().toUtf8());
        qputenv("K2SYS_AC_ROOT", "");
        QVERIFY(QDir(m_folder->path()).mkpath("defaultuser/resources/Templates"));
        m_checker = QImage(240, 135, QImage::Format_RGB32);
        for (int y = 0; y < 135; ++y)
            for (int x = 0; x < 240; ++x)
                m_checker.setPixel(x, y, (x / 8 + y / 8) % 2 ? 0xFF808080u : 0xFFC0C0C0u);
        QVERIFY(m_checker.save(checkerPath()));
    }

    void cleanup() { QVERIFY(FileSyncQueue::flush(std::chrono::seconds(30))); }

    void writesWhatQtWrites_data()
    {
        QTest::addColumn<QImage>("image");
        for (const auto& [name, format] :
             {std::pair("premultiplied", QImage::Format_ARGB32_Premultiplied),
              std::pair("alpha", QImage::Format_ARGB32), std::pair("opaque", QImage::Format_RGB32),
              std::pair("palette", QImage::Format_Indexed8), std::pair("mono", QImage::Format_Mono),
              std::pair("grey", QImage::Format_Grayscale8), std::pair("16 bits", QImage::Format_RGBA64),
              std::pair("24 bits", QImage::Format_RGB888)})
            QTest::newRow(name) << pattern(61, 37, format);
        QTest::newRow("one pixel") << pattern(1, 1, QImage::Format_ARGB32);
        QTest::newRow("large") << pattern(1920, 1080, QImage::Format_ARGB32_Premultiplied);
        QImage marked = pattern(9, 9, QImage::Format_ARGB32);
        marked.setColorSpace(QColorSpace::AdobeRgb);
        QTest::newRow("colour space") << marked;
        marked = pattern(9, 9, QImage::Format_RGB32);
        marked.setText("key", "text");
        marked.setOffset({3, 4});
        QTest::newRow("text") << marked;
        marked = pattern(9, 9, QImage::Format_RGB32);
        marked.setDotsPerMeterX(1234);
        marked.setDotsPerMeterY(4321);
        QTest::newRow("resolution") << marked;
        QImage transparent(100, 100, QImage::Format_ARGB32_Premultiplied);
        transparent.fill(Qt::transparent);
        QTest::newRow("transparent") << transparent;
    }

    void writesWhatQtWrites()
    {
        QFETCH(QImage, image);
        const QString path = m_folder->filePath("画像 é.png");
        QVERIFY(PngWriter::save(image, path));
        const QImage read(path);
        const QImage expected = throughQt(image);
        QVERIFY(!read.isNull());
        QCOMPARE(read.format(), expected.format());
        QCOMPARE(read, expected);
        QCOMPARE(read.dotsPerMeterX(), expected.dotsPerMeterX());
        QCOMPARE(read.dotsPerMeterY(), expected.dotsPerMeterY());
        QCOMPARE(read.colorSpace(), expected.colorSpace());
        QCOMPARE(read.text(), expected.text());
        QCOMPARE(read.offset(), expected.offset());
    }

    void otherFormatsAndRefusals()
    {
        const QImage image = pattern(16, 16, QImage::Format_RGB32);
        QVERIFY(PngWriter::save(image, m_folder->filePath("a.PNG")));
        QCOMPARE(QImage(m_folder->filePath("a.PNG")), image);
        QVERIFY(PngWriter::save(image, m_folder->filePath("a.bmp")));
        QCOMPARE(QImage(m_folder->filePath("a.bmp")), image);
        QVERIFY(PngWriter::save(image, m_folder->filePath("a.jpg")));
        QCOMPARE(QImage(m_folder->filePath("a.jpg")).size(), image.size());
        QVERIFY(!PngWriter::save(image, m_folder->filePath("a.none")));
        QVERIFY(!PngWriter::save(image, m_folder->filePath("a")));
        QVERIFY(!PngWriter::save(QImage(), m_folder->filePath("a.bmp")));
        QCOMPARE(QImage(m_folder->filePath("a.bmp")), image);
        QVERIFY(!PngWriter::save(image, m_folder->filePath("no/a.png")));
        QVERIFY(!PngWriter::save(image, ""));
        QVERIFY(PngWriter::encode(QImage()).isEmpty());
    }

    void opaquePicturesGiveTwoEqualFiles()
    {
        const QImage source = pattern(960, 540, QImage::Format_RGB32);
        QVERIFY(resize(source));
        const QImage black = read("black.png"), small = read("small.png");
        QCOMPARE(black.size(), QSize(240, 135));
        QCOMPARE(black, small);
        QVERIFY(!black.hasAlphaChannel());
        for (const QPoint p : {QPoint(0, 0), QPoint(239, 134), QPoint(100, 77)})
            QCOMPARE(black.pixel(p), meanOfTwoLines(source, p) | 0xFF000000u);
    }

    void transparentPicturesShowTheChecker()
    {
        QImage source(960, 540, QImage::Format_ARGB32_Premultiplied);
        source.fill(Qt::transparent);
        QVERIFY(resize(source));
        QCOMPARE(read("small.png"), m_checker);
        QImage black(240, 135, QImage::Format_RGB32);
        black.fill(Qt::black);
        QCOMPARE(read("black.png"), black);
    }

    void picturesWithAlphaAreReducedChannelByChannel()
    {
        const QImage source = pattern(960, 540, QImage::Format_ARGB32);
        QVERIFY(resize(source));
        QImage reduced(240, 135, QImage::Format_ARGB32);
        for (int y = 0; y < 135; ++y)
            for (int x = 0; x < 240; ++x)
                reduced.setPixel(x, y, meanOfTwoLines(source, {x, y}));
        QCOMPARE(read("black.png"), reduced.convertToFormat(QImage::Format_RGB32));
        QImage expected = m_checker;
        QPainter(&expected).drawImage(0, 0, reduced);
        QCOMPARE(read("small.png"), expected);

        // A premultiplied picture from memory, as the renderer makes it, gives the same result as the file.
        const QImage rendered = source.convertToFormat(QImage::Format_ARGB32_Premultiplied);
        QVERIFY(resize(rendered));
        const QImage small = read("small.png"), black = read("black.png");
        QVERIFY(ImageResizer().resizeImageToThumbnail(rendered, path("b2.png"), path("s2.png"), 240, 135));
        QCOMPARE(read("s2.png"), small);
        QCOMPARE(read("b2.png"), black);
    }

    void onlyTheFirstTwoLinesOfABlockCount()
    {
        QImage source = pattern(8, 4, QImage::Format_ARGB32);
        QImage target(2, 1, QImage::Format_ARGB32), other(2, 1, QImage::Format_ARGB32);
        ImageResizer resizer;
        resizer.scaledToQuaterSizeWithAAF(source, target);
        for (int x = 0; x < 8; ++x) {
            source.setPixel(x, 2, 0);
            source.setPixel(x, 3, 0);
        }
        resizer.scaledToQuaterSizeWithAAF(source, other);
        QCOMPARE(target, other);
        QCOMPARE(target.pixel(1, 0), meanOfTwoLines(source, {1, 0}));
        source.setPixel(0, 1, ~source.pixel(0, 1));
        resizer.scaledToQuaterSizeWithAAF(source, other);
        QVERIFY(target != other);
    }

    // With sizes that do not fit, or other formats, nothing is read or written beyond a picture.
    void oddPictures()
    {
        ImageResizer resizer;
        for (const QSize size : {QSize(0, 0), QSize(3, 3), QSize(7, 5), QSize(4, 1), QSize(4000, 4000)}) {
            for (const auto format : {QImage::Format_ARGB32, QImage::Format_Mono, QImage::Format_RGB888}) {
                QImage source = size.isEmpty() ? QImage() : pattern(size.width(), size.height(), format);
                QImage target(9, 9, QImage::Format_ARGB32);
                target.fill(Qt::red);
                resizer.scaledToQuaterSizeWithAAF(source, target);
                resizer.scaledToQuaterSizeWithAAF(target, source);
                QVERIFY(size.width() >= 4000 || target.pixel(8, 8) == 0xFFFF0000u);
            }
        }
        for (const auto format : {QImage::Format_Indexed8, QImage::Format_Grayscale16, QImage::Format_RGB888})
            QVERIFY(resize(pattern(960, 540, format)));
        QVERIFY(resize(pattern(10, 6, QImage::Format_ARGB32)));
        QCOMPARE(read("small.png").size(), QSize(240, 135));
    }

    void missingPictures()
    {
        std::wstring source = path("missing.png"), black = path("black.png"), small = path("none/small.png");
        ImageResizer resizer;
        QVERIFY(!resizer.resizeImageToThumbnail(source, black, small, 240, 135));
        QImage transparent(960, 540, QImage::Format_ARGB32);
        transparent.fill(Qt::transparent);
        QVERIFY(QFile::remove(checkerPath()));
        QVERIFY(!resize(transparent));
        QVERIFY(QFile::exists(m_folder->filePath("black.png")));
        QVERIFY(!QFile::exists(m_folder->filePath("small.png")));
        QVERIFY(resize(pattern(960, 540, QImage::Format_RGB32)));
        // A checker picture with a palette can be painted on as well.
        QVERIFY(m_checker.convertToFormat(QImage::Format_Indexed8).save(checkerPath()));
        QVERIFY(resize(transparent));
        QCOMPARE(read("small.png").convertToFormat(QImage::Format_RGB32), m_checker);
        // If the checker picture cannot be read any more, the former one is used.
        QFile torn(checkerPath());
        QVERIFY(torn.resize(20) && QFile::remove(m_folder->filePath("small.png")));
        QVERIFY(resize(transparent));
        QCOMPARE(read("small.png").convertToFormat(QImage::Format_RGB32), m_checker);
    }

    void availability()
    {
        QFile text(m_folder->filePath("text.png"));
        QVERIFY(text.open(QIODevice::WriteOnly) && text.write("no picture") > 0);
        text.close();
        QVERIFY(PngWriter::save(pattern(12, 34, QImage::Format_RGB32), m_folder->filePath("标题.png")));
        ImageResizer resizer;
        QVERIFY(!resizer.isAvailableImage(path("text.png")));
        QVERIFY(!resizer.isAvailableImage(path("missing.png")));
        QVERIFY(!resizer.isAvailableImage(L""));
        QVERIFY(resizer.isAvailableImage(path("标题.png")));
        std::wstring good = path("标题.png"), missing = path("missing.png");
        QCOMPARE(resizer.getImageWidth(good), 12);
        QCOMPARE(resizer.getImageHeight(good), 34);
        QCOMPARE(resizer.getImageWidth(missing), 0);
        QCOMPARE(resizer.getImageHeight(missing), 0);
    }

    void jpeNames()
    {
        ImageResizer resizer;
        for (const wchar_t* name :
             {L"a.jpe", L"a.Jpe", L"a.jPe", L"a.jpE", L"a.jPE", L"a.JpE", L"a.JPe", L"/x.y/a.JPE"})
            QVERIFY(resizer.checkJPE(name));
        for (const wchar_t* name : {L"", L"a", L"jpe", L"a.jpeg", L"a.jpe.png", L"/x.jpe/a", L"a.jp", L"a."})
            QVERIFY(!resizer.checkJPE(name));
        QCOMPARE(resizer.changeJPEToJPEG(L"/f/a.jpe"), std::wstring(L"/f/a.jp.jpeg"));
        QCOMPARE(resizer.changeJPEToJPEG(L"/f/a.JPE"), std::wstring(L"/f/a.JP.jpeg"));
        QCOMPARE(resizer.changeJPEToJPEG(L"/f/a"), std::wstring());
        QCOMPARE(resizer.changeJPEToJPEG(L""), std::wstring());
    }

    void jpeFiles()
    {
        const QImage source = pattern(960, 540, QImage::Format_RGB32);
        QVERIFY(PngWriter::save(source, m_folder->filePath("source.png")));
        std::wstring from = path("source.png"), black = path("黑.JPE"), small = path("small.jpe");
        QFile old(m_folder->filePath("small.jpe"));
        QVERIFY(old.open(QIODevice::WriteOnly) && old.write("old") > 0);
        old.close();
        QVERIFY(ImageResizer().resizeImageToThumbnail(from, black, small, 240, 135));
        QCOMPARE(QImage(m_folder->filePath("small.jpe"), "jpeg").size(), QSize(240, 135));
        QCOMPARE(QImage(m_folder->filePath("黑.JPE"), "jpeg").size(), QSize(240, 135));
        QVERIFY(FileSyncQueue::flush(std::chrono::seconds(30)));
        QCOMPARE(QDir(m_folder->path()).entryList(QDir::Files | QDir::Hidden, QDir::Name),
                 QStringList({"small.jpe", "source.png", "黑.JPE"}));
    }

    void aChunkOfGigabytesIsNotMadeRoomFor_data()
    {
        QTest::addColumn<QByteArray>("type");
        for (const char* type : {"tEXt", "zTXt", "iTXt", "sPLT", "eXIf"})
            QTest::newRow(type) << QByteArray(type);
    }

    void aChunkOfGigabytesIsNotMadeRoomFor()
    {
        QFETCH(QByteArray, type);
        QVERIFY(PngWriter::save(pattern(1, 1, QImage::Format_ARGB32), m_folder->filePath("one.png")));
        QFile file(m_folder->filePath("one.png"));
        QVERIFY(file.open(QIODevice::ReadOnly));
        QByteArray bytes = file.readAll();
        bytes.insert(33, QByteArray("\x70\0\0\0", 4) + type + QByteArray(200, 'x'));
        QFile claimed(m_folder->filePath("claimed.png"));
        QVERIFY(claimed.open(QIODevice::WriteOnly) && claimed.write(bytes) == bytes.size());
        claimed.close();
        [[maybe_unused]] const qint64 before = peakMemory();
        QVERIFY(!ImageResizer().isAvailableImage(path("claimed.png")));
        QVERIFY(ImageResizer().isAvailableImage(path("one.png")));
#ifndef __SANITIZE_ADDRESS__
        const qint64 grown = peakMemory() - before;
        QVERIFY2(grown < 50000, qPrintable(QString("%1 kB").arg(grown)));
#endif
    }

    void linksAreReplacedAndNotWrittenThrough()
    {
        const QString victim = m_folder->filePath("victim");
        QFile file(victim);
        QVERIFY(file.open(QIODevice::WriteOnly) && file.write("kept") == 4);
        file.close();
        const QImage image = pattern(960, 540, QImage::Format_RGB32);
        for (const char* name : {"link.png", "link.jpe"})
            QVERIFY(QFile::link(victim, m_folder->filePath(name)));
        QVERIFY(QFile::link(m_folder->filePath("nothing"), m_folder->filePath("dangling.png")));
        std::wstring black = path("link.png"), small = path("link.jpe");
        QVERIFY(ImageResizer().resizeImageToThumbnail(image, black, small, 240, 135));
        QVERIFY(PngWriter::save(image, m_folder->filePath("dangling.png")));
        QVERIFY(file.open(QIODevice::ReadOnly));
        QCOMPARE(file.readAll(), QByteArray("kept"));
        QVERIFY(!QFile::exists(m_folder->filePath("nothing")));
        for (const char* name : {"link.png", "link.jpe", "dangling.png"})
            QVERIFY(!QFileInfo(m_folder->filePath(name)).isSymLink());
        QCOMPARE(read("link.png").size(), QSize(240, 135));
        QCOMPARE(read("dangling.png").size(), image.size());
    }

private:
    // Largest size of the address space so far, in kB.
    static qint64 peakMemory()
    {
        QFile file("/proc/self/status");
        if (!file.open(QIODevice::ReadOnly))
            return -1;
        const QList<QByteArray> lines = file.readAll().split('\n');
        for (const QByteArray& line : lines)
            if (line.startsWith("VmPeak:"))
                return line.mid(7).trimmed().split(' ').constFirst().toLongLong();
        return -1;
    }

    QString checkerPath() const
    {
        return m_folder->filePath("defaultuser/resources/Templates/checker_240x135.png");
    }

    std::wstring path(const QString& name) const
    {
        return m_folder->filePath(name).toStdWString();
    }

    QImage read(const QString& name) const
    {
        return QImage(m_folder->filePath(name));
    }

    bool resize(const QImage& image)
    {
        if (!PngWriter::save(image, m_folder->filePath("source.png")))
            return false;
        std::wstring source = path("source.png"), black = path("black.png"), small = path("small.png");
        return ImageResizer().resizeImageToThumbnail(source, black, small, 240, 135);
    }

    static QRgb meanOfTwoLines(const QImage& source, QPoint target)
    {
        int red = 0, green = 0, blue = 0, alpha = 0;
        for (int y = 0; y < 2; ++y) {
            for (int x = 0; x < 4; ++x) {
                const QRgb p = reinterpret_cast<const QRgb*>(
                    source.constScanLine(4 * target.y() + y))[4 * target.x() + x];
                red += qRed(p);
                green += qGreen(p);
                blue += qBlue(p);
                alpha += qAlpha(p);
            }
        }
        return qRgba(red / 8, green / 8, blue / 8, alpha / 8);
    }

    std::unique_ptr<QTemporaryDir> m_folder;
    QImage m_checker;
};

QTEST_MAIN(tst_imageresizer)
#include "tst_imageresizer.moc"
