// Icons whose pictures are decoded when they are first needed.
#include "touchui/PictureIcon.h"

#include <QImage>
#include <QPainter>
#include <QPixmap>
#include <QTemporaryDir>
#include <QTest>

class tst_pictureicon : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void isReadWhenItIsNeeded();
    void looksLikeAnIconOfThePicture_data();
    void looksLikeAnIconOfThePicture();
    void missingPicture();

private:
    QString write(const QColor& color)
    {
        QImage image(20, 12, QImage::Format_ARGB32);
        image.fill(Qt::transparent);
        QPainter painter(&image);
        painter.fillRect(QRect(3, 2, 9, 7), color);
        painter.end();
        const QString path = m_folder.filePath(QStringLiteral("picture"));
        return image.save(path, "PNG") ? path : QString();
    }
    static QColor colorOf(const QIcon& icon) { return icon.pixmap(20, 12).toImage().pixelColor(5, 5); }

    QTemporaryDir m_folder;
};

void tst_pictureicon::isReadWhenItIsNeeded()
{
    const QString path = write(Qt::red);
    const QIcon icon(new PictureIcon(path));
    QVERIFY(!icon.isNull());
    QIcon copy = icon;
    write(Qt::blue); // nobody has looked at it yet
    QCOMPARE(colorOf(icon), QColor(Qt::blue));
    write(Qt::green);
    QCOMPARE(colorOf(icon), QColor(Qt::blue));
    copy.addPixmap(QPixmap()); // detaches, which clones the engine
    QCOMPARE(colorOf(copy), QColor(Qt::blue));
}

void tst_pictureicon::looksLikeAnIconOfThePicture_data()
{
    QTest::addColumn<QSize>("size");
    QTest::newRow("its own size") << QSize(20, 12);
    QTest::newRow("smaller") << QSize(9, 9);
    QTest::newRow("larger") << QSize(64, 48);
}

void tst_pictureicon::looksLikeAnIconOfThePicture()
{
    QFETCH(QSize, size);
    const QString path = write(Qt::darkCyan);
    const QIcon plain{QPixmap(path)};
    const auto painted = [&size](const QIcon& icon, QIcon::Mode mode) {
        QImage image(QSize(70, 50), QImage::Format_ARGB32_Premultiplied);
        image.fill(Qt::white);
        QPainter painter(&image);
        icon.paint(&painter, QRect(QPoint(2, 1), size), Qt::AlignRight | Qt::AlignBottom, mode);
        return image;
    };
    for (const QIcon::Mode mode : {QIcon::Normal, QIcon::Disabled, QIcon::Active, QIcon::Selected}) {
        const QIcon first(new PictureIcon(path));
        QCOMPARE(painted(first, mode), painted(plain, mode));
        const QIcon second(new PictureIcon(path));
        QCOMPARE(second.pixmap(size, mode).toImage(), plain.pixmap(size, mode).toImage());
        const QIcon third(new PictureIcon(path));
        QCOMPARE(third.actualSize(size, mode), plain.actualSize(size, mode));
    }
    QCOMPARE(QIcon(new PictureIcon(path)).availableSizes(), plain.availableSizes());
}

void tst_pictureicon::missingPicture()
{
    const QIcon icon(new PictureIcon(m_folder.filePath(QStringLiteral("missing"))));
    QVERIFY(icon.isNull());
    QVERIFY(icon.pixmap(20, 12).isNull());
    QVERIFY(icon.availableSizes().isEmpty());
}

QTEST_MAIN(tst_pictureicon)
#include "tst_pictureicon.moc"
