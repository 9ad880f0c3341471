// A background that is decoded in a thread: what it gives when its file is known, changed, moved or
// unreadable.
#include "library/DecodedBackground.h"
#include "tests/support/Patience.h"

#include <QDateTime>
#include <QFile>
#include <QImage>
#include <QSemaphore>
#include <QTemporaryDir>
#include <QTest>
#include <atomic>
#include <memory>

namespace
{

constexpr int TIME_STEP = 20; // ms, longer than the step in which file systems count times

QColor colorOf(const std::shared_ptr<const BackgroundPicture>& picture)
{
    const QImage image = picture->pixmap().toImage();
    return image.isNull() ? QColor() : image.pixelColor(5, 5);
}

} // namespace

class tst_decodedbackground : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void isDecodedByAThread()
    {
        const QString path = write("thread.bmp", Qt::red);
        QSemaphore decoded;
        DecodedBackground background(path, [&] { decoded.release(); });
        QVERIFY(background.isThatOf(path)); // also before that
        QVERIFY(decoded.tryAcquire(1, PATIENCE_MS));
        QVERIFY(background.isDone());
        QCOMPARE(colorOf(background.picture()), QColor(Qt::red));
        QCOMPARE(BackgroundPicture::find(path), background.picture());
    }

    void waitsForTheThread()
    {
        DecodedBackground background(write("wait.bmp", Qt::red), [] {});
        QCOMPARE(colorOf(background.picture()), QColor(Qt::red));
    }

    void knownPictureIsNotDecoded()
    {
        const QString path = write("known.bmp", Qt::red);
        const auto known = BackgroundPicture::load(path);
        std::atomic<bool> isDecoded = false;
        const auto note = [&] { isDecoded = true; };
        DecodedBackground background(path, note);
        QVERIFY(background.isDone());
        QCOMPARE(background.picture(), known);

        const QString copy = path + ".copy.bmp";
        QVERIFY(QFile::copy(path, copy));
        DecodedBackground sameBytes(copy, note);
        QVERIFY(sameBytes.isDone());
        QCOMPARE(sameBytes.picture(), known);
        QVERIFY(sameBytes.isThatOf(path));
        QVERIFY(!isDecoded);
    }

    void nothingIsKeptAfterwards()
    {
        const QString path = write("freed.bmp", Qt::red);
        {
            DecodedBackground background(path, [] {});
            background.picture();
            QVERIFY(BackgroundPicture::find(path));
        }
        QVERIFY(!BackgroundPicture::find(path));
    }

    void changedFileIsDecodedAgain()
    {
        const QString path = write("changed.bmp", Qt::red);
        DecodedBackground background(path, [] {});
        QCOMPARE(colorOf(background.picture()), QColor(Qt::red));
        QVERIFY(background.isThatOf(path));
        QTest::qWait(TIME_STEP);
        write("changed.bmp", Qt::blue); // in place, with the same size
        QVERIFY(!background.isThatOf(path));
        QCOMPARE(colorOf(background.picture()), QColor(Qt::blue));
        QVERIFY(background.isThatOf(path));
    }

    // A copy that keeps the time of the file from which it was made.
    void changeWithAnOldTimeIsSeen()
    {
        const QString path = write("dated.bmp", Qt::red);
        QFile file(path);
        QVERIFY(file.open(QIODevice::ReadWrite));
        const QDateTime time = file.fileTime(QFileDevice::FileModificationTime);
        file.close();
        DecodedBackground background(path, [] {});
        QCOMPARE(colorOf(background.picture()), QColor(Qt::red));
        QTest::qWait(TIME_STEP);
        write("dated.bmp", Qt::blue);
        QVERIFY(file.open(QIODevice::ReadWrite));
        QVERIFY(file.setFileTime(time, QFileDevice::FileModificationTime));
        file.close();
        QCOMPARE(colorOf(background.picture()), QColor(Qt::blue));
    }

    void fileThatIsMovedKeepsItsPicture()
    {
        const QString path = write("before.bmp", Qt::red);
        DecodedBackground background(path, [] {});
        background.picture();
        const QString after = m_folder.filePath("after.bmp");
        QVERIFY(QFile::rename(path, after));
        QCOMPARE(colorOf(background.picture()), QColor(Qt::red));
        QVERIFY(!background.isThatOf(path));
    }

    void unreadableIsEmpty()
    {
        const QString path = m_folder.filePath("missing.bmp");
        DecodedBackground background(path, [] {});
        QVERIFY(background.picture()->pixmap().isNull());
        QVERIFY(!background.isThatOf(path)); // it may be readable the next time
        write("missing.bmp", Qt::red);
        QVERIFY(background.picture()->pixmap().isNull());
        QVERIFY(!background.isThatOf(path));
    }

private:
    // Uncompressed, so that all files are of the same length.
    QString write(const QString& name, const QColor& color) const
    {
        QImage image(64, 36, QImage::Format_RGB32);
        image.fill(color);
        const QString path = m_folder.filePath(name);
        return image.save(path, "BMP") ? path : QString();
    }

    QTemporaryDir m_folder;
};

QTEST_MAIN(tst_decodedbackground)

#include "tst_decodedbackground.moc"
