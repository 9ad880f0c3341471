// Where the texts of a title are drawn and whether they stand out.
#include "tests/library/LibraryFixture.h"
#include "titlectl/TitleInk.h"

#include <QTest>

namespace
{

TitleInk::Text measured(TText* text)
{
    Archive archive;
    archive.setText({text});
    return TitleInk(archive).texts().front();
}

} // namespace

class tst_titleink : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void inkOfAPicture();
    void differenceOfPictures();
    void textInTheMiddle();
    void textOutside_data();
    void textOutside();
    void shadowIsNoInk();
    void textLikeItsGround();
    void coveredText();
};

void tst_titleink::inkOfAPicture()
{
    QImage image(30, 20, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    QCOMPARE(TitleInk::inkIn(image), QRect());
    image.setPixelColor(3, 4, Qt::black);
    image.setPixelColor(20, 15, Qt::white);
    image.setPixelColor(29, 19, QColor(255, 255, 255, 5)); // faint
    QCOMPARE(TitleInk::inkIn(image), QRect(QPoint(3, 4), QPoint(20, 15)));
}

void tst_titleink::differenceOfPictures()
{
    QImage image(4, 3, QImage::Format_ARGB32_Premultiplied);
    image.fill(QColor(10, 20, 30));
    QImage other = image;
    QCOMPARE(TitleInk::largestDifference(image, other), 0);
    other.setPixelColor(3, 2, QColor(10, 80, 31));
    QCOMPARE(TitleInk::largestDifference(image, other), 60);
}

void tst_titleink::textInTheMiddle()
{
    const TitleInk::Text text = measured(LibraryFixture::makeText("Middle", 1, 400, 300));
    QVERIFY(QRect(600, 450, 800, 300).contains(text.ink));
    QVERIFY(text.ink.height() > 40);
    QVERIFY(text.layout.intersects(text.ink));
    QCOMPARE(text.contrast, 255);
}

void tst_titleink::textOutside_data()
{
    QTest::addColumn<float>("x");
    QTest::addColumn<bool>("isInk");
    QTest::addColumn<bool>("isLayoutOnPicture");
    QTest::newRow("over the left edge") << -120.0F << true << true;
    QTest::newRow("far away") << 5000.0F << false << false;
}

void tst_titleink::textOutside()
{
    QFETCH(float, x);
    QFETCH(bool, isInk);
    QFETCH(bool, isLayoutOnPicture);
    const TitleInk::Text text = measured(LibraryFixture::makeText("Outside the picture", 1, x, 300));
    QCOMPARE(!text.ink.isEmpty(), isInk);
    QCOMPARE(text.layout.intersects(QRectF(0, 0, 1920, 1080)), isLayoutOnPicture);
    if (isInk)
        QVERIFY(text.ink.left() < 0);
}

void tst_titleink::shadowIsNoInk()
{
    TText* plain = LibraryFixture::makeText("Shadow", 1, 400, 300);
    auto* shadowed = new TText(*plain);
    shadowed->setShadowStyle(1);
    TShadow shadow;
    shadow.setShadowDirectionX(1);
    shadow.setShadowDirectionY(1);
    shadowed->setTextShadow(shadow);
    const QRect ink = measured(plain).ink;
    QCOMPARE(measured(shadowed).ink, ink);
}

void tst_titleink::textLikeItsGround()
{
    LibraryFixture fixture;
    const QString folder = fixture.makeFolder("ground");
    QImage ground(1920, 1080, QImage::Format_RGB32);
    ground.fill(QColor(255, 255, 255));
    QVERIFY(ground.save(folder + "/t_source_1920.png"));
    Archive archive;
    archive.setPath((folder + "/t.xml").toStdString());
    archive.setBgResource("t_source_1920.png");
    archive.setBgResourceBig("t_source_1920.png");
    TText* black = LibraryFixture::makeText("Black", 2, 400, 500);
    for (TextStyle* style : black->textItems())
        style->setFontColor("#000000");
    archive.setText({LibraryFixture::makeText("White", 1, 400, 200), black});
    const TitleInk ink(archive);
    QVERIFY(ink.texts()[0].contrast < TitleInk::LEAST_CONTRAST);
    QVERIFY(!ink.texts()[0].ink.isEmpty());
    QVERIFY(ink.texts()[1].contrast > 200);
}

void tst_titleink::coveredText()
{
    TText* below = LibraryFixture::makeText("Text", 1, 400, 300);
    auto* above = new TText(*below);
    above->setTextObjectID(2);
    above->setZValue(2.0F);
    for (TextStyle* style : below->textItems())
        style->setFontColor("#ffffff");
    Archive archive;
    archive.setText({below, above});
    QVERIFY(TitleInk(archive).texts()[0].contrast < 200); // only where both are smoothed at the edges
}

QTEST_MAIN(tst_titleink)
#include "tst_titleink.moc"
