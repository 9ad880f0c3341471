// Which objects share the decoded pixels of a background file, and which must not.
#include "canvas/BackgroundPicture.h"
#include "canvas/GraphicsPixmap.h"

#include <QFile>
#include <QTemporaryDir>
#include <QTest>

class tst_backgroundpicture : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void itemsOfOneFileShareItsPicture();
    void copiesShareThePicture();
    void changedFileIsReadAnew();
    void otherBytesOfTheSameSizeAreAnotherPicture();
    void nothingIsKeptForLater();
    void decodedElsewhereIsTheSame();
    void unreadableIsEmpty();

private:
    // Uncompressed, so that all files of a size are of the same length.
    QString write(const QString& name, const QColor& colour) const
    {
        QImage image(64, 36, QImage::Format_RGB32);
        image.fill(colour);
        const QString path = m_folder.filePath(name);
        return image.save(path, "BMP") ? path : QString();
    }

    QTemporaryDir m_folder;
};

void tst_backgroundpicture::itemsOfOneFileShareItsPicture()
{
    const QString path = write(QStringLiteral("one.bmp"), Qt::red);
    const GraphicsPixmap first(path);
    const GraphicsPixmap second(path);
    QCOMPARE(first.pixmap().size(), QSize(64, 36));
    QCOMPARE(first.pixmap().cacheKey(), second.pixmap().cacheKey());
}

void tst_backgroundpicture::copiesShareThePicture()
{
    const QString path = write(QStringLiteral("source.bmp"), Qt::green);
    const QString copy = m_folder.filePath(QStringLiteral("copy.bmp"));
    QVERIFY(QFile::copy(path, copy));
    const GraphicsPixmap first(path);
    const GraphicsPixmap second(copy);
    QCOMPARE(first.pixmap().cacheKey(), second.pixmap().cacheKey());
    QCOMPARE(second.getPixmapPath(), copy);
}

void tst_backgroundpicture::changedFileIsReadAnew()
{
    const QString path = write(QStringLiteral("changed.bmp"), Qt::red);
    const auto before = BackgroundPicture::load(path);
    QVERIFY(QFile::remove(path));
    QCOMPARE(write(QStringLiteral("changed.bmp"), Qt::blue), path);
    QCOMPARE(BackgroundPicture::load(path)->pixmap().toImage().pixelColor(5, 5), QColor(Qt::blue));
    QCOMPARE(before->pixmap().toImage().pixelColor(5, 5), QColor(Qt::red));
}

void tst_backgroundpicture::otherBytesOfTheSameSizeAreAnotherPicture()
{
    const QString red = write(QStringLiteral("red.bmp"), Qt::red);
    const QString blue = write(QStringLiteral("blue.bmp"), Qt::blue);
    QCOMPARE(QFile(red).size(), QFile(blue).size());
    const auto first = BackgroundPicture::load(red);
    const auto second = BackgroundPicture::load(blue);
    QCOMPARE(first->pixmap().toImage().pixelColor(5, 5), QColor(Qt::red));
    QCOMPARE(second->pixmap().toImage().pixelColor(5, 5), QColor(Qt::blue));
}

void tst_backgroundpicture::nothingIsKeptForLater()
{
    const QString path = write(QStringLiteral("short.bmp"), Qt::red);
    auto picture = BackgroundPicture::load(path);
    QCOMPARE(BackgroundPicture::find(path), picture);
    picture.reset();
    QVERIFY(!BackgroundPicture::find(path));
}

void tst_backgroundpicture::decodedElsewhereIsTheSame()
{
    const QString path = write(QStringLiteral("thread.bmp"), Qt::magenta);
    const auto picture = BackgroundPicture::load(BackgroundPicture::decode(path));
    QCOMPARE(picture->pixmap().toImage().pixelColor(5, 5), QColor(Qt::magenta));
    QCOMPARE(BackgroundPicture::load(path), picture);
}

void tst_backgroundpicture::unreadableIsEmpty()
{
    QVERIFY(BackgroundPicture::load(m_folder.filePath(QStringLiteral("missing.png")))->pixmap().isNull());
    QVERIFY(BackgroundPicture::load(m_folder.path())->pixmap().isNull());
    QVERIFY(BackgroundPicture::load(QString())->pixmap().isNull());
}

QTEST_MAIN(tst_backgroundpicture)
#include "tst_backgroundpicture.moc"
