// The designs that new titles begin with: the same in both languages, legible over any picture, within the
// title-safe area.
#include "appliance/PresetTemplates.h"
#include "appliance/SampleText.h"
#include "document/TText.h"
#include "library/ThumbnailRender.h"
#include "tests/support/Patience.h"

#include <QFontDatabase>
#include <QImage>
#include <QPainter>
#include <QSet>
#include <QTemporaryDir>
#include <QTest>
#include <cmath>

namespace
{

const QSize RASTER(1920, 1080);
const QSize CANVAS(1280, 720);
const QRect TITLE_SAFE(192, 108, 1536, 864);
constexpr double CONTRAST = 4.5;
// The steps of the size box.
const QSet<int> LADDER{20, 24,  28,  32,  36,  40,  44,  48,  54,  60,  64,  66,  72,  80, 88,
                       96, 115, 138, 166, 199, 239, 287, 344, 413, 496, 595, 714, 857, 999};

double linear(double channel)
{
    return channel <= 0.04045 ? channel / 12.92 : std::pow((channel + 0.055) / 1.055, 2.4);
}

double luminance(const QColor& color)
{
    return 0.2126 * linear(color.redF()) + 0.7152 * linear(color.greenF()) + 0.0722 * linear(color.blueF());
}

double contrast(const QColor& one, const QColor& other)
{
    const double first = luminance(one) + 0.05;
    const double second = luminance(other) + 0.05;
    return qMax(first, second) / qMin(first, second);
}

QImage over(const QColor& video, const QImage& background)
{
    QImage image(background.size(), QImage::Format_RGB32);
    image.fill(video);
    QPainter painter(&image);
    painter.drawImage(0, 0, background);
    return image;
}

QImage emptyPicture()
{
    QImage image(RASTER, QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    return image;
}

// Returns the rectangle in which two pictures differ clearly; soft shadows do not count.
QRect changedRect(const QImage& one, const QImage& other)
{
    constexpr int CLEARLY = 96;
    QRect rect;
    for (int y = 0; y < one.height(); ++y) {
        const QRgb* first = reinterpret_cast<const QRgb*>(one.constScanLine(y));
        const QRgb* second = reinterpret_cast<const QRgb*>(other.constScanLine(y));
        for (int x = 0; x < one.width(); ++x)
            if (qAbs(qRed(first[x]) - qRed(second[x])) + qAbs(qGreen(first[x]) - qGreen(second[x])) +
                    qAbs(qBlue(first[x]) - qBlue(second[x])) >=
                CLEARLY)
                rect |= QRect(x, y, 1, 1);
    }
    return rect;
}

} // namespace

class tst_presettemplates : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void bothSetsHaveTheSameDesigns();
    void stylesAreOfThePanel_data() { eachDesign(); }
    void stylesAreOfThePanel();
    void backgroundsHaveAlphaAtBothSizes_data() { eachDesign(); }
    void backgroundsHaveAlphaAtBothSizes();
    void textStandsWhereItIsPut();
    void textIsSafeAndLegible_data() { eachDesign(); }
    void textIsSafeAndLegible();

private:
    static void eachDesign();
    static SampleTitles::Sample fetch();
    // The picture of a title with only one of the design's text objects, without a background.
    QImage pictureOf(const SampleTitles::Sample& sample, std::size_t text);

    QTemporaryDir m_dir;
    int m_pictures = 0;
};

void tst_presettemplates::eachDesign()
{
    QTest::addColumn<bool>("chinese");
    QTest::addColumn<int>("index");
    for (const bool chinese : {false, true}) {
        int index = 0;
        for (const SampleTitles::Sample& sample : PresetTemplates::samples(chinese)) {
            QTest::addRow("%s %s", chinese ? "chs" : "en", sample.stem.c_str()) << chinese << index;
            ++index;
        }
    }
}

SampleTitles::Sample tst_presettemplates::fetch()
{
    QFETCH(const bool, chinese);
    QFETCH(const int, index);
    return PresetTemplates::samples(chinese).at(static_cast<std::size_t>(index));
}

QImage tst_presettemplates::pictureOf(const SampleTitles::Sample& sample, std::size_t text)
{
    const QString stem = QStringLiteral("p%1").arg(++m_pictures);
    Archive title;
    title.setPath((m_dir.path() + QLatin1Char('/') + stem + QStringLiteral(".xml")).toStdString());
    title.setThumbnailBig((stem + QStringLiteral("_1920.png")).toStdString());
    title.setThumbnailMiddle((stem + QStringLiteral("_960.png")).toStdString());
    title.setThumbnailSmall((stem + QStringLiteral("_240.png")).toStdString());
    title.setThumbnailBlack((stem + QStringLiteral("_240S.png")).toStdString());
    title.setText({std::make_unique<TText>(*sample.archive.text().at(text)).release()});
    ThumbnailRender render;
    render.makeThumbnail(&title, true);
    if (!QTest::qWaitFor([&render] { return render.makePictureThreadIsFinished(); }, PATIENCE_MS))
        return {};
    const QString folder = m_dir.path() + QLatin1Char('/');
    return QImage(folder + QString::fromStdString(title.getThumbnailBig()));
}

void tst_presettemplates::initTestCase()
{
    QVERIFY(m_dir.isValid());
    for (const char* family : {"KST", "DFHeiW5-A"})
        QVERIFY2(QFontDatabase::families().contains(QLatin1String(family)), family);
}

void tst_presettemplates::bothSetsHaveTheSameDesigns()
{
    const auto english = PresetTemplates::samples(false);
    const auto chinese = PresetTemplates::samples(true);
    QVERIFY(english.size() >= 6);
    QCOMPARE(chinese.size(), english.size());
    QSet<QString> names;
    for (std::size_t i = 0; i < english.size(); ++i) {
        QCOMPARE(chinese.at(i).stem, english.at(i).stem);
        QCOMPARE(chinese.at(i).archive.text().size(), english.at(i).archive.text().size());
        names.insert(QString::fromStdString(english.at(i).stem));
        for (std::size_t text = 0; text < english.at(i).archive.text().size(); ++text) {
            QVERIFY(chinese.at(i).archive.text().at(text)->getText() !=
                    english.at(i).archive.text().at(text)->getText());
        }
    }
    QCOMPARE(names.size(), qsizetype(english.size()));
    for (const char* name : {"LowerThird", "Strap", "FullScreen", "Quote", "NamePlate", "CornerMark"})
        QVERIFY2(names.contains(QLatin1String(name)), name);
}

void tst_presettemplates::stylesAreOfThePanel()
{
    QFETCH(const bool, chinese);
    const SampleTitles::Sample sample = fetch();
    const auto& texts = sample.archive.text();
    QVERIFY(!texts.empty() && texts.size() <= 4);
    for (std::size_t i = 0; i < texts.size(); ++i) {
        const TText& text = *texts.at(i);
        QCOMPARE(text.getTextObjectID(), int(i) + 1);
        QCOMPARE(text.textItems().size(), std::size_t(QString::fromStdString(text.getText()).size()));
        for (const TextStyle* item : text.textItems()) {
            QVERIFY(LADDER.contains(item->getFontSize()));
            QVERIFY(QColor(QString::fromStdString(item->getFontColor())).isValid());
            QCOMPARE(item->getFontFamily(), std::string(chinese ? "DFHeiW5-A" : "KST"));
        }
    }
}

void tst_presettemplates::backgroundsHaveAlphaAtBothSizes()
{
    const SampleTitles::Sample sample = fetch();
    if (!sample.background) {
        QCOMPARE(sample.stem, std::string("Title"));
        return;
    }
    const QImage big = sample.background(RASTER);
    const QImage small = sample.background(CANVAS);
    QCOMPARE(big.size(), RASTER);
    QCOMPARE(small.size(), CANVAS);
    QCOMPARE(sample.background(RASTER), big);
    int clear = 0;
    int through = 0;
    for (int y = 0; y < big.height(); y += 3) {
        for (int x = 0; x < big.width(); x += 3) {
            const int alpha = qAlpha(big.pixel(x, y));
            clear += alpha == 0 ? 1 : 0;
            through += alpha > 0 && alpha < 255 ? 1 : 0;
        }
    }
    QVERIFY(through > 0);
    // Only the full screen design covers the whole picture.
    QCOMPARE(clear == 0, sample.stem == "FullScreen");
    // The small background is the large one scaled down.
    const QImage reduced =
        over(Qt::gray, big).scaled(CANVAS, Qt::IgnoreAspectRatio, Qt::SmoothTransformation);
    const QImage painted = over(Qt::gray, small);
    qint64 sum = 0;
    for (int y = 0; y < CANVAS.height(); ++y)
        for (int x = 0; x < CANVAS.width(); ++x)
            sum += qAbs(qGray(reduced.pixel(x, y)) - qGray(painted.pixel(x, y)));
    QVERIFY2(sum < qint64(CANVAS.width()) * CANVAS.height(), qPrintable(QString::number(sum)));
}

void tst_presettemplates::textStandsWhereItIsPut()
{
    // for the bearings of the letters, and since places are whole pixels of the canvas
    constexpr int TOLERANCE = 6;
    for (const auto align : {SampleText::LEFT, SampleText::CENTRE, SampleText::RIGHT}) {
        for (const int size : {44, 138}) {
            SampleText::Look look;
            look.size = size;
            look.align = align;
            look = SampleText::placed(look, "HHH", 960, 540);
            const SampleTitles::Sample sample = SampleTitles::sample("x", nullptr, {{"HHH", look}});
            const QRect rect =
                changedRect(over(Qt::black, pictureOf(sample, 0)), over(Qt::black, emptyPicture()));
            QVERIFY(!rect.isEmpty());
            const int bearing = size / 10;
            const int at = align == SampleText::LEFT     ? rect.left()
                           : align == SampleText::CENTRE ? rect.center().x()
                                                         : rect.right();
            QVERIFY2(qAbs(at - 960) <= TOLERANCE + bearing, qPrintable(QString::number(at)));
            QVERIFY2(qAbs(rect.center().y() - 540) <= TOLERANCE,
                     qPrintable(QString::number(rect.center().y())));
        }
    }
}

void tst_presettemplates::textIsSafeAndLegible()
{
    const SampleTitles::Sample sample = fetch();
    const QImage background = sample.background ? sample.background(RASTER) : emptyPicture();
    QList<QRect> places;
    for (std::size_t i = 0; i < sample.archive.text().size(); ++i) {
        const TText& text = *sample.archive.text().at(i);
        // Dark letters are seen on white and light ones on black.
        const QColor ink(QString::fromStdString(text.textItems().front()->getFontColor()));
        const QColor ground = luminance(ink) > 0.2 ? Qt::black : Qt::white;
        const QImage picture = pictureOf(sample, i);
        QVERIFY(!picture.isNull());
        const QRect place = changedRect(over(ground, picture), over(ground, emptyPicture()));
        QVERIFY(!place.isEmpty());
        QVERIFY2(TITLE_SAFE.contains(place), text.getText().c_str());
        for (const QRect& other : places)
            QVERIFY2(!other.intersects(place), text.getText().c_str());
        places.append(place);
        if (!sample.background) {
            // Nothing is behind the letters: an outline of the other shade sets them off.
            const TextStyle& style = *text.textItems().front();
            QVERIFY(style.isTextEdge() != 0);
            QVERIFY(contrast(ink, QColor(QString::fromStdString(style.textEdge().getEdgeColor()))) >=
                    CONTRAST);
            continue;
        }
        for (const QColor& video : {QColor(Qt::white), QColor(Qt::black)}) {
            const QImage behind = over(video, background);
            double least = 21;
            for (int y = place.top(); y <= place.bottom(); y += 3)
                for (int x = place.left(); x <= place.right(); x += 3)
                    least = qMin(least, contrast(ink, behind.pixelColor(x, y)));
            QVERIFY2(
                least >= CONTRAST,
                qPrintable(QStringLiteral("%1: %2").arg(QString::fromStdString(text.getText())).arg(least)));
        }
    }
}

QTEST_MAIN(tst_presettemplates)
#include "tst_presettemplates.moc"
