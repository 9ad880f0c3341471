// Compares the pages of the gallery with approved pictures, and checks that a seed of the monkey repeats its
// touches.
#include "app/APPEventFilter.h"
#include "gallery/GalleryPages.h"
#include "gallery/GalleryScreen.h"
#include "gallery/Monkey.h"
#include "gallery/PagePicture.h"

#include <QApplication>
#include <QDir>
#include <QFile>
#include <QTest>

#include <algorithm>

namespace
{

// The tolerance of a colour component in the mean of a cell, 0 to 255. Glyphs may differ by a few levels
// between runs.
constexpr int TOLERANCE = 5;

QStringList kept(const QString& page)
{
    QFile file(QStringLiteral(TITLER_GALLERY_PAGES "/%1.txt").arg(page));
    if (!file.open(QIODevice::ReadOnly))
        return QStringList();
    return QString::fromLatin1(file.readAll()).split(QLatin1Char('\n'), Qt::SkipEmptyParts);
}

GalleryPages::Maker maker(const QString& name)
{
    for (const GalleryPages::Maker& candidate : GalleryPages::all())
        if (candidate().name == name)
            return candidate;
    return GalleryPages::Maker();
}

} // namespace

class tst_gallerypages : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void pagesLookAsKept_data();
    void pagesLookAsKept();
    void everyKeptPageIsShown();
    void aChangeIsSeen();
    void whatIsNoDigestIsRefused();
    void theSeedPlaysTheSameGame();
};

void tst_gallerypages::pagesLookAsKept_data()
{
    QTest::addColumn<QString>("name");
    for (const GalleryPages::Maker& candidate : GalleryPages::all()) {
        const QString name = candidate().name;
        QTest::newRow(qPrintable(name)) << name;
    }
}

void tst_gallerypages::pagesLookAsKept()
{
    QFETCH(QString, name);
    GalleryPage page = maker(name)();
    const QImage picture = page.shoot();
    page.close();
    const QStringList reference = kept(name);
    const PagePicture::Difference difference =
        PagePicture::compare(reference, PagePicture::digest(picture), TOLERANCE);
    if (!difference.sameShape || difference.cells > 0) {
        const QDir folder(QStringLiteral(TITLER_GALLERY_PICTURES));
        folder.mkpath(QStringLiteral("."));
        picture.save(folder.filePath(name + QStringLiteral(".png")));
        PagePicture::explain(picture, reference, TOLERANCE)
            .save(folder.filePath(name + QStringLiteral("_difference.png")));
        QFAIL(qPrintable(QStringLiteral("%1 cells differ, the worst by %2; see %3")
                             .arg(difference.cells)
                             .arg(difference.worst)
                             .arg(folder.path())));
    }
}

void tst_gallerypages::everyKeptPageIsShown()
{
    QStringList names;
    for (const GalleryPages::Maker& candidate : GalleryPages::all())
        names.append(candidate().name + QStringLiteral(".txt"));
    names.sort();
    QCOMPARE(QDir(QStringLiteral(TITLER_GALLERY_PAGES)).entryList(QDir::Files, QDir::Name), names);
}

void tst_gallerypages::aChangeIsSeen()
{
    QImage picture(960, 640, QImage::Format_RGB32);
    picture.fill(QColor(50, 50, 50));
    const QStringList before = PagePicture::digest(picture);
    QCOMPARE(PagePicture::compare(before, before, TOLERANCE).cells, 0);
    // A line as thin as the stroke of a letter.
    for (int y = 100; y < 110; ++y) {
        picture.setPixelColor(200, y, QColor(220, 220, 220));
        picture.setPixelColor(201, y, QColor(220, 220, 220));
    }
    const PagePicture::Difference difference =
        PagePicture::compare(before, PagePicture::digest(picture), TOLERANCE);
    QVERIFY(difference.sameShape);
    QVERIFY(difference.cells > 0 && difference.cells <= 2);
    QVERIFY(difference.worst > TOLERANCE);
    QVERIFY(difference.mean > 0);
    QVERIFY(PagePicture::explain(picture, before, TOLERANCE).pixelColor(205, 105).red() > 100);
}

void tst_gallerypages::whatIsNoDigestIsRefused()
{
    QImage picture(8, 8, QImage::Format_RGB32);
    picture.fill(Qt::white);
    const QStringList whole = PagePicture::digest(picture);
    QCOMPARE(whole.size(), PagePicture::ROWS);
    QVERIFY(PagePicture::compare(whole, whole, 0).sameShape);
    QVERIFY(!PagePicture::compare(QStringList(), whole, 0).sameShape);
    QVERIFY(!PagePicture::compare(whole.mid(1), whole, 0).sameShape);
    QStringList spoilt = whole;
    spoilt[3].replace(QStringLiteral("ffffff"), QStringLiteral("gggggg"));
    QVERIFY(!PagePicture::compare(whole, spoilt, 0).sameShape);
    QVERIFY(PagePicture::digest(QImage()).isEmpty());
}

void tst_gallerypages::theSeedPlaysTheSameGame()
{
    const auto play = [](quint32 seed) {
        GalleryPage page = GalleryPages::toolsBar();
        page.show();
        Monkey monkey(APPEventFilter::instance(), seed);
        const QStringList problems = monkey.play(page, 300);
        page.close();
        return problems.isEmpty() ? monkey.inputChecksum() : 0U;
    };
    const quint32 first = play(7);
    QVERIFY(first != 0);
    QCOMPARE(play(7), first);
    QVERIFY(play(8) != first);
}

int main(int argc, char* argv[])
{
    const GalleryScreen screen;
    QApplication application(argc, argv);
    Q_INIT_RESOURCE(TitlerToolResource);
    Q_INIT_RESOURCE(UILibrary);
    QApplication::setFont(QFont(QStringLiteral("KST"), 12));
    tst_gallerypages test;
    return QTest::qExec(&test, argc, argv);
}

#include "tst_gallerypages.moc"
