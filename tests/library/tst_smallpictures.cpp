// Small pictures that are decoded ahead: each is there once, whoever decoded it, and leaving early is safe.
#include "library/SmallPictures.h"

#include <QFile>
#include <QTemporaryDir>
#include <QTest>
#include <sys/stat.h>

class tst_smallpictures : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void eachPictureComesAtItsPlace();
    void takenBeforeItsTurn();
    void whatIsNoPictureIsNull();
    void largePicturesAreScaledIntoTheBounds();
    void leavingEarlyWaitsForOneOnly();

private:
    static constexpr QSize BOUNDS{240, 135};

    // Makes pictures whose red is their index.
    QStringList makePictures(int count, QSize size) const
    {
        QStringList paths;
        for (int i = 0; i < count; ++i) {
            QImage image(size, QImage::Format_RGB32);
            image.fill(QColor(i, 10, 10));
            paths.append(m_folder.filePath(QString::number(i) + QStringLiteral(".png")));
            image.save(paths.constLast());
        }
        return paths;
    }

    QTemporaryDir m_folder;
};

void tst_smallpictures::eachPictureComesAtItsPlace()
{
    SmallPictures pictures(makePictures(60, BOUNDS), BOUNDS);
    QCOMPARE(pictures.count(), 60);
    for (int i = 0; i < 60; ++i)
        QCOMPARE(pictures.take(i).pixelColor(3, 3), QColor(i, 10, 10));
    QVERIFY(pictures.take(7).isNull()); // each picture can be taken once
    QVERIFY(pictures.take(-1).isNull());
    QVERIFY(pictures.take(60).isNull());
}

void tst_smallpictures::takenBeforeItsTurn()
{
    const QStringList paths = makePictures(60, BOUNDS);
    for (int round = 0; round < 20; ++round) {
        SmallPictures pictures(paths, BOUNDS);
        for (int i = 59; i >= 0; --i)
            QCOMPARE(pictures.take(i).pixelColor(3, 3), QColor(i, 10, 10));
    }
}

void tst_smallpictures::whatIsNoPictureIsNull()
{
    const QString text = m_folder.filePath(QStringLiteral("text.png"));
    QFile file(text);
    QVERIFY(file.open(QIODevice::WriteOnly));
    file.write("no picture");
    file.close();
    const QString pipe = m_folder.filePath(QStringLiteral("pipe.png"));
    QCOMPARE(mkfifo(pipe.toLocal8Bit().constData(), 0600), 0);
    SmallPictures pictures(
        {text, pipe, m_folder.path(), QString(), m_folder.filePath(QStringLiteral("gone"))}, BOUNDS);
    for (qsizetype i = 0; i < pictures.count(); ++i)
        QVERIFY(pictures.take(i).isNull());
}

void tst_smallpictures::largePicturesAreScaledIntoTheBounds()
{
    SmallPictures pictures(makePictures(1, QSize(2400, 300)), BOUNDS);
    QCOMPARE(pictures.take(0).size(), QSize(240, 30));
}

void tst_smallpictures::leavingEarlyWaitsForOneOnly()
{
    const QStringList paths = makePictures(8, QSize(960, 540));
    for (int round = 0; round < 20; ++round) {
        SmallPictures pictures(paths, BOUNDS);
        if (round % 2 == 0)
            QVERIFY(!pictures.take(0).isNull());
    }
}

QTEST_GUILESS_MAIN(tst_smallpictures)
#include "tst_smallpictures.moc"
