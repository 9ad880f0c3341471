// The pictures of a title: sizes, places, transparency and when each stage runs.
#include "LibraryFixture.h"
#include "tests/support/FullDisk.h"
#include "tests/support/LogFixture.h"

#include "canvas/BackgroundPicture.h"
#include "document/RasterPool.h"
#include "document/TShadow.h"
#include "library/ThumbnailRender.h"
#include "tests/support/Patience.h"

#include <QElapsedTimer>
#include <QRegularExpression>
#include <QSignalSpy>
#include <QTest>
#include <QThread>
#include <QTimer>
#include <memory>

namespace
{

// The rectangle of everything that is not the background.
QRect inkIn(const QImage& image, const QColor& background = Qt::transparent)
{
    QRect ink;
    for (int y = 0; y < image.height(); ++y) {
        for (int x = 0; x < image.width(); ++x)
            if (image.pixelColor(x, y) != background)
                ink |= QRect(x, y, 1, 1);
    }
    return ink;
}

} // namespace

class tst_thumbnailrender : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void nullDoesNothing();
    void fastStageTouchesNoDisk();
    void fastStageWithoutBackgroundIsTransparent();
    void fastStageScalesTheBackground();
    void fastStageLogsWhereTheTextsAre();
    void shadowOfTheFastStage();
    void missingBackgroundIsPassedOver();
    void hugeBackgroundGivesPicturesOfTheUsualSize();
    void slowStageWritesFourFiles();
    void slowStageReplacesTheOldBigPicture();
    void slowStageReplacesNothingElse_data();
    void slowStageReplacesNothingElse();
    void slowStageDrawsWhileTheEventsGoOn();
    void waitingWithoutEventsDrawsWhatIsLeft();
    void backgroundIsKeptForTheNextPictures();
    void changedBackgroundIsDrawn();
    void expectedBackgroundIsDecodedBefore();
    void memoryIsGivenBackWhenIdle();
    void textsStandAtOneAndAHalfTimesTheirPlace();
    void textOutsideTheRasterIsHarmless();
    void middlePictureIsTheBigOneReduced();
    void manyRendersLeaveNothingBehind();

private:
    static QImage fastPicture(ThumbnailRender& render, const Archive& archive)
    {
        QImage picture;
        const auto connection = connect(&render, &IThumbnailRender::saveHalfThumbnailsOK, &render,
                                        [&picture](const QString&, const QImage& image) { picture = image; });
        render.makeThumbnail(&archive, false);
        disconnect(connection);
        return picture;
    }
    QImage slowPicture(const Archive& archive, const char* suffix)
    {
        ThumbnailRender render;
        render.makeThumbnail(&archive, true);
        const bool finished =
            QTest::qWaitFor([&] { return render.makePictureThreadIsFinished(); }, PATIENCE_MS);
        const QFileInfo title(QString::fromStdString(archive.getPath()));
        return finished ? QImage(title.path() + QLatin1Char('/') + title.completeBaseName() +
                                 QLatin1String(suffix))
                        : QImage();
    }
    static void makeFiles(ThumbnailRender& render, const Archive& archive)
    {
        render.makeThumbnail(&archive, true);
        QTRY_VERIFY_WITH_TIMEOUT(render.makePictureThreadIsFinished(), PATIENCE_MS);
    }
    // Returns the colour of the picture for air where there is no text.
    static QColor airPixel(const Archive& archive)
    {
        const QFileInfo title(QString::fromStdString(archive.getPath()));
        return QImage(title.path() + QLatin1Char('/') + title.completeBaseName() +
                      QStringLiteral("_1920.png"))
            .pixelColor(5, 5);
    }
    static void paint(const QString& path, QSize size, const QColor& colour)
    {
        QImage image(size, QImage::Format_RGB32);
        image.fill(colour);
        QVERIFY(image.save(path));
    }

    LibraryFixture m_fixture;
};

void tst_thumbnailrender::nullDoesNothing()
{
    ThumbnailRender render;
    QSignalSpy spy(&render, &IThumbnailRender::saveHalfThumbnailsOK);
    render.makeThumbnail(nullptr, true);
    render.makeThumbnail(nullptr, false);
    QCOMPARE(spy.count(), 0);
    QVERIFY(render.makePictureThreadIsFinished());
}

void tst_thumbnailrender::fastStageTouchesNoDisk()
{
    const QString folder = m_fixture.makeFolder(QStringLiteral("fast"));
    const auto archive = LibraryFixture::makeRecord(folder, QStringLiteral("t"), QStringLiteral("Fast"));
    ThumbnailRender render;
    QSignalSpy spy(&render, &IThumbnailRender::saveHalfThumbnailsOK);
    render.makeThumbnail(archive.get(), false);
    QCOMPARE(spy.count(), 1); // before the call returns
    QCOMPARE(spy.front().at(0).toString(), QString::fromStdString(archive->getPath()));
    QCOMPARE(spy.front().at(1).value<QImage>().size(), QSize(240, 135));
    QVERIFY(render.makePictureThreadIsFinished());
    QVERIFY(QDir(folder).entryList(QDir::Files | QDir::Hidden).isEmpty());
}

void tst_thumbnailrender::fastStageWithoutBackgroundIsTransparent()
{
    const auto archive = LibraryFixture::makeRecord(m_fixture.makeFolder(QStringLiteral("bare")),
                                                    QStringLiteral("t"), QStringLiteral("Bare"));
    ThumbnailRender render;
    const QImage picture = fastPicture(render, *archive);
    QVERIFY(!inkIn(picture).isEmpty());
    QCOMPARE(picture.pixelColor(1, 133).alpha(), 0);
    archive->releaseVectorText();
    QVERIFY(inkIn(fastPicture(render, *archive)).isEmpty());
}

void tst_thumbnailrender::fastStageScalesTheBackground()
{
    const QString folder = m_fixture.makeFolder(QStringLiteral("background"));
    const auto archive = LibraryFixture::makeRecord(folder, QStringLiteral("t"), QString());
    archive->setBgResource("bg.png");
    paint(folder + QStringLiteral("/bg.png"), QSize(100, 100), Qt::blue);
    ThumbnailRender render;
    const QImage picture = fastPicture(render, *archive);
    QCOMPARE(picture.pixelColor(2, 2), QColor(Qt::blue));
    QCOMPARE(picture.pixelColor(237, 132), QColor(Qt::blue));

    archive->setBgPointX(640); // half of the canvas
    const QImage moved = fastPicture(render, *archive);
    QCOMPARE(moved.pixelColor(60, 60).alpha(), 0);
    QCOMPARE(moved.pixelColor(180, 60), QColor(Qt::blue));
}

void tst_thumbnailrender::fastStageLogsWhereTheTextsAre()
{
    const auto archive = LibraryFixture::makeRecord(m_fixture.makeFolder(QStringLiteral("logged")),
                                                    QStringLiteral("t"), QString());
    archive->setText({LibraryFixture::makeText(QStringLiteral("one"), 1),
                      LibraryFixture::makeText(QStringLiteral("longer"), 3)});
    ThumbnailRender render;
    LogFixture log;
    log.takeDebugLines();
    fastPicture(render, *archive);
    const QStringList lines = log.takeDebugLines();
    QCOMPARE(lines.size(), 2);
    static const QRegularExpression form(QRegularExpression::anchoredPattern(QStringLiteral(
        "\\[ThumbnailRender\\] 200: text (\\d) boundingRect (-?[\\d.]+),(-?[\\d.]+) ([\\d.]+)x([\\d.]+)")));
    const QRegularExpressionMatch first = form.match(lines.at(0));
    const QRegularExpressionMatch second = form.match(lines.at(1));
    QVERIFY2(first.hasMatch() && second.hasMatch(), qPrintable(lines.join('\n')));
    QCOMPARE(first.captured(1), QStringLiteral("1"));
    QCOMPARE(second.captured(1), QStringLiteral("3"));
    QVERIFY(first.captured(4).toDouble() > 0);
    QVERIFY(second.captured(4).toDouble() > first.captured(4).toDouble());
    QCOMPARE(second.captured(5), first.captured(5));

    archive->releaseVectorText();
    fastPicture(render, *archive);
    QVERIFY(log.takeDebugLines().isEmpty());
}

// The shadow is black and opaque, unlike that of the canvas and of the large pictures.
void tst_thumbnailrender::shadowOfTheFastStage()
{
    const auto archive = LibraryFixture::makeRecord(m_fixture.makeFolder(QStringLiteral("shadow")),
                                                    QStringLiteral("t"), QString());
    TText* text = LibraryFixture::makeText(QStringLiteral("█████\n█████\n█████"), 1, 0, 0);
    for (TextStyle* style : text->getTextItems()) {
        style->setFontSize(200);
        style->setTextKerning(24);
        style->setFontColor("#ffffff");
    }
    text->getTextShadow()->setShadowDirectionX(1);
    text->getTextShadow()->setShadowDirectionY(1);
    archive->setText({text});

    // Returns the highest alpha of a black pixel. It is found in narrow gaps, which have shadow from all
    // sides.
    const auto opacity = [](const QImage& image) {
        int highest = 0;
        for (int y = 0; y < image.height(); ++y) {
            for (int x = 0; x < image.width(); ++x) {
                const QColor colour = image.pixelColor(x, y);
                if (colour.value() == 0)
                    highest = qMax(highest, colour.alpha());
            }
        }
        return highest;
    };
    QCOMPARE(ThumbnailRender::DROP_SHADOW_COLOR, QColor(0, 0, 0, 255));
    ThumbnailRender render;
    const int fast = opacity(fastPicture(render, *archive));
    const int large = opacity(slowPicture(*archive, "_1920.png"));
    QVERIFY2(large > 100 && large <= 190, qPrintable(QString::number(large)));
    // The small picture has the darker shadow.
    QVERIFY2(fast > large + 20, qPrintable(QStringLiteral("%1 and %2").arg(fast).arg(large)));
}

void tst_thumbnailrender::missingBackgroundIsPassedOver()
{
    const QString folder = m_fixture.makeFolder(QStringLiteral("missing"));
    const auto archive = LibraryFixture::makeRecord(folder, QStringLiteral("t"), QString());
    archive->setBgResource("nothing.png");
    archive->setBgResourceBig("nothing.png");
    QFile text(folder + QStringLiteral("/text.png"));
    QVERIFY(text.open(QIODevice::WriteOnly));
    text.write("no picture");
    text.close();
    ThumbnailRender render;
    QVERIFY(inkIn(fastPicture(render, *archive)).isEmpty());
    QVERIFY(inkIn(slowPicture(*archive, "_1920.png")).isEmpty());
    archive->setBgResource("text.png");
    QVERIFY(inkIn(fastPicture(render, *archive)).isEmpty());
}

void tst_thumbnailrender::hugeBackgroundGivesPicturesOfTheUsualSize()
{
    const QString folder = m_fixture.makeFolder(QStringLiteral("huge"));
    const auto archive = LibraryFixture::makeRecord(folder, QStringLiteral("t"), QStringLiteral("Huge"));
    archive->setBgResource("bg.png");
    archive->setBgResourceBig("bg.png");
    paint(folder + QStringLiteral("/bg.png"), QSize(8192, 1200), Qt::blue);
    ThumbnailRender render;
    const QImage fast = fastPicture(render, *archive);
    QCOMPARE(fast.size(), QSize(240, 135));
    QCOMPARE(fast.pixelColor(237, 132), QColor(Qt::blue));
    const QImage big = slowPicture(*archive, "_1920.png");
    QCOMPARE(big.size(), QSize(1920, 1080));
    QCOMPARE(big.pixelColor(1917, 1077), QColor(Qt::blue));
    // A background that is too large is treated like a missing one.
    paint(folder + QStringLiteral("/bg.png"), QSize(8193, 10), Qt::blue);
    QCOMPARE(fastPicture(render, *archive).pixelColor(237, 132).alpha(), 0);
}

void tst_thumbnailrender::slowStageWritesFourFiles()
{
    FakeTitleChangeReporter reports;
    const QString folder = m_fixture.makeFolder(QStringLiteral("slow"));
    const auto archive = LibraryFixture::makeRecord(folder, QStringLiteral("t"), QStringLiteral("Slow"));
    archive->setBgResource("bg.png");
    archive->setBgResourceBig("bg.png");
    paint(folder + QStringLiteral("/bg.png"), QSize(1920, 1080), QColor(20, 90, 40));
    ThumbnailRender render;
    QSignalSpy spy(&render, &IThumbnailRender::saveHalfThumbnailsOK);
    render.makeThumbnail(archive.get(), true);
    QTRY_VERIFY(render.makePictureThreadIsFinished());
    QCOMPARE(spy.count(), 0);
    QCOMPARE(reports.take(), (Reports{{1, QStringLiteral("t")}}));
    QCOMPARE(QImage(folder + QStringLiteral("/t_1920.png")).size(), QSize(1920, 1080));
    QCOMPARE(QImage(folder + QStringLiteral("/t_960.png")).size(), QSize(960, 540));
    for (const char* name : {"/t_240.png", "/t_240S.png"}) {
        const QImage small(folder + QLatin1String(name));
        QCOMPARE(small.size(), QSize(240, 135));
        QCOMPARE(small.pixelColor(235, 130), QColor(20, 90, 40));
    }
}

void tst_thumbnailrender::slowStageReplacesTheOldBigPicture()
{
    const QString folder = m_fixture.makeFolder(QStringLiteral("old"));
    const auto archive = LibraryFixture::makeRecord(folder, QStringLiteral("t"), QString());
    const QString picture = folder + QStringLiteral("/t_1920.png");
    paint(picture, QSize(10, 10), Qt::red);
    {
        ThumbnailRender render;
        const FullDisk disk;
        render.makeThumbnail(archive.get(), true);
        QCOMPARE(QImage(picture).size(), QSize(10, 10)); // on air until the new one is there
        QTRY_VERIFY(render.makePictureThreadIsFinished());
        QCOMPARE(QImage(picture).size(), QSize(10, 10));
    }
    QCOMPARE(slowPicture(*archive, "_1920.png").size(), QSize(1920, 1080));
}

void tst_thumbnailrender::slowStageReplacesNothingElse_data()
{
    QTest::addColumn<QString>("name");
    QTest::newRow("of another folder") << "../neighbour/x.png";
    QTest::newRow("absolute") << m_fixture.titleRoot() + "/neighbour/x.png";
    QTest::newRow("another title") << "other.xml";
    QTest::newRow("another title in capitals") << "OTHER.XML";
    QTest::newRow("the title itself") << "t.xml";
    QTest::newRow("the order") << ".order.xml";
}

void tst_thumbnailrender::slowStageReplacesNothingElse()
{
    QFETCH(QString, name);
    const QString neighbour = m_fixture.makeFolder(QStringLiteral("neighbour"));
    paint(neighbour + QStringLiteral("/x.png"), QSize(10, 10), Qt::red);
    const QString folder = m_fixture.makeFolder(QStringLiteral("foreign"));
    LibraryFixture::fillFolder(folder, {QStringLiteral("t"), QStringLiteral("other")});
    QVERIFY(QFile::copy(folder + QStringLiteral("/other.xml"), folder + QStringLiteral("/OTHER.XML")));
    const auto archive = LibraryFixture::makeRecord(folder, QStringLiteral("t"), QStringLiteral("Foreign"));
    archive->setThumbnailBig(name.toStdString());
    const QString named = QDir(folder).absoluteFilePath(name);
    QFile file(named);
    QVERIFY(file.open(QIODevice::ReadOnly));
    const QByteArray before = file.readAll();
    file.close();

    ThumbnailRender render;
    render.makeThumbnail(archive.get(), true);
    QVERIFY(QFile::exists(named));
    QTRY_VERIFY(render.makePictureThreadIsFinished());
    QVERIFY(file.open(QIODevice::ReadOnly));
    QCOMPARE(file.readAll(), before);
    QVERIFY(QFile::exists(folder + QStringLiteral("/t_960.png")));
}

// The test does not call makePictureThreadIsFinished().
void tst_thumbnailrender::slowStageDrawsWhileTheEventsGoOn()
{
    const QString folder = m_fixture.makeFolder(QStringLiteral("events"));
    paint(folder + QStringLiteral("/bg.png"), QSize(1920, 1080), QColor(20, 90, 40));
    FakeTitleChangeReporter reports;
    ThumbnailRender render;
    Reports wanted;
    for (const QString name : {"a", "b", "c"}) {
        const auto archive = LibraryFixture::makeRecord(folder, name, QStringLiteral("In order"));
        archive->setBgResourceBig(name == QLatin1String("c") ? "" : "bg.png");
        render.makeThumbnail(archive.get(), true); // the record is destroyed before the picture is drawn
        wanted.append({1, name});
    }
    Reports seen;
    QTRY_COMPARE((seen += reports.take()).size(), wanted.size());
    QCOMPARE(seen, wanted);
    QCOMPARE(QImage(folder + QStringLiteral("/b_1920.png")).pixelColor(5, 5), QColor(20, 90, 40));
    QCOMPARE(QImage(folder + QStringLiteral("/c_1920.png")).pixelColor(5, 5).alpha(), 0);
}

void tst_thumbnailrender::waitingWithoutEventsDrawsWhatIsLeft()
{
    const QString folder = m_fixture.makeFolder(QStringLiteral("blocked"));
    paint(folder + QStringLiteral("/bg.png"), QSize(1920, 1080), QColor(20, 90, 40));
    const auto archive = LibraryFixture::makeRecord(folder, QStringLiteral("t"), QStringLiteral("Blocked"));
    archive->setBgResourceBig("bg.png");
    ThumbnailRender render;
    render.makeThumbnail(archive.get(), true);
    QElapsedTimer time;
    time.start();
    while (!render.makePictureThreadIsFinished() && time.elapsed() < PATIENCE_MS)
        QThread::msleep(1); // as the window does when it closes: no events come in
    QCOMPARE(QImage(folder + QStringLiteral("/t_1920.png")).pixelColor(5, 5), QColor(20, 90, 40));
}

void tst_thumbnailrender::backgroundIsKeptForTheNextPictures()
{
    const QString folder = m_fixture.makeFolder(QStringLiteral("kept"));
    const QString path = folder + QStringLiteral("/bg.png");
    paint(path, QSize(1920, 1080), QColor(20, 90, 40));
    const auto archive = LibraryFixture::makeRecord(folder, QStringLiteral("t"), QStringLiteral("Kept"));
    archive->setBgResourceBig("bg.png");
    ThumbnailRender render;
    QVERIFY(!BackgroundPicture::find(path));
    makeFiles(render, *archive);
    QCOMPARE(airPixel(*archive), QColor(20, 90, 40));
    const std::weak_ptr<const BackgroundPicture> first = BackgroundPicture::find(path);
    QVERIFY(!first.expired());
    makeFiles(render, *archive);
    QCOMPARE(airPixel(*archive), QColor(20, 90, 40));
    QCOMPARE(BackgroundPicture::find(path), first.lock());

    // Only one is kept.
    const QString other = folder + QStringLiteral("/other.png");
    paint(other, QSize(1920, 1080), QColor(90, 40, 20));
    archive->setBgResourceBig("other.png");
    makeFiles(render, *archive);
    QCOMPARE(airPixel(*archive), QColor(90, 40, 20));
    QVERIFY(first.expired());
    QVERIFY(BackgroundPicture::find(other));
    archive->setBgResourceBig("");
    makeFiles(render, *archive);
    QCOMPARE(airPixel(*archive).alpha(), 0);
    QVERIFY(!BackgroundPicture::find(other));
}

void tst_thumbnailrender::changedBackgroundIsDrawn()
{
    const QString folder = m_fixture.makeFolder(QStringLiteral("repainted"));
    const QString path = folder + QStringLiteral("/bg.png");
    paint(path, QSize(1920, 1080), QColor(20, 90, 40));
    const auto archive = LibraryFixture::makeRecord(folder, QStringLiteral("t"), QStringLiteral("Painted"));
    archive->setBgResourceBig("bg.png");
    ThumbnailRender render;
    makeFiles(render, *archive);
    paint(path, QSize(1920, 1080), QColor(40, 20, 90));
    makeFiles(render, *archive);
    QCOMPARE(airPixel(*archive), QColor(40, 20, 90));
    // Also between the first change of the title and the making of its pictures.
    render.expectPictures(*archive);
    paint(path, QSize(1920, 1080), QColor(20, 90, 40));
    makeFiles(render, *archive);
    QCOMPARE(airPixel(*archive), QColor(20, 90, 40));
    QVERIFY(QFile::remove(path));
    makeFiles(render, *archive);
    QCOMPARE(airPixel(*archive).alpha(), 0);
}

void tst_thumbnailrender::expectedBackgroundIsDecodedBefore()
{
    const QString folder = m_fixture.makeFolder(QStringLiteral("expected"));
    const QString path = folder + QStringLiteral("/bg.png");
    paint(path, QSize(1920, 1080), QColor(20, 90, 40));
    const auto archive = LibraryFixture::makeRecord(folder, QStringLiteral("t"), QStringLiteral("Expected"));
    archive->setBgResourceBig("bg.png");
    ThumbnailRender render;
    render.expectPictures(*archive);
    QTRY_VERIFY(BackgroundPicture::find(path));
    const auto picture = BackgroundPicture::find(path);
    QVERIFY(!QFile::exists(folder + QStringLiteral("/t_1920.png")));
    QVERIFY(render.makePictureThreadIsFinished());
    makeFiles(render, *archive);
    QCOMPARE(airPixel(*archive), QColor(20, 90, 40));
    QCOMPARE(BackgroundPicture::find(path), picture);

    // A title without a background gets none.
    archive->setBgResourceBig("");
    render.expectPictures(*archive);
    makeFiles(render, *archive);
    QCOMPARE(airPixel(*archive).alpha(), 0);
}

void tst_thumbnailrender::memoryIsGivenBackWhenIdle()
{
    const QString folder = m_fixture.makeFolder(QStringLiteral("idle"));
    const QString path = folder + QStringLiteral("/bg.png");
    paint(path, QSize(1920, 1080), QColor(20, 90, 40));
    const auto archive = LibraryFixture::makeRecord(folder, QStringLiteral("t"), QStringLiteral("Idle"));
    archive->setBgResourceBig("bg.png");
    ThumbnailRender render;
    makeFiles(render, *archive);
    QVERIFY(RasterPool::keptBytes() > 0);
    QVERIFY(BackgroundPicture::find(path));
    auto* idle = render.findChild<QTimer*>();
    QVERIFY(idle && idle->isActive());
    idle->start(0); // otherwise it takes a minute
    QTRY_COMPARE(RasterPool::keptBytes(), qsizetype(0));
    QVERIFY(!BackgroundPicture::find(path));
    makeFiles(render, *archive);
    QCOMPARE(airPixel(*archive), QColor(20, 90, 40));
}

void tst_thumbnailrender::textsStandAtOneAndAHalfTimesTheirPlace()
{
    const QString folder = m_fixture.makeFolder(QStringLiteral("places"));
    const auto near = LibraryFixture::makeRecord(folder, QStringLiteral("near"), QString());
    near->setText({LibraryFixture::makeText(QStringLiteral("Hg"), 1, 40, 60)});
    const auto far = LibraryFixture::makeRecord(folder, QStringLiteral("far"), QString());
    far->setText({LibraryFixture::makeText(QStringLiteral("Hg"), 1, 440, 260)});

    const QRect nearInk = inkIn(slowPicture(*near, "_1920.png"));
    const QRect farInk = inkIn(slowPicture(*far, "_1920.png"));
    QVERIFY(!nearInk.isEmpty());
    QCOMPARE(farInk.size(), nearInk.size());
    QCOMPARE(farInk.topLeft() - nearInk.topLeft(), QPoint(600, 300));
}

void tst_thumbnailrender::textOutsideTheRasterIsHarmless()
{
    const auto archive = LibraryFixture::makeRecord(m_fixture.makeFolder(QStringLiteral("outside")),
                                                    QStringLiteral("t"), QString());
    archive->setText({LibraryFixture::makeText(QStringLiteral("far"), 1, 1e7F, -1e7F),
                      LibraryFixture::makeText(QStringLiteral("nowhere"), 2, -50000, 50000)});
    QVERIFY(inkIn(slowPicture(*archive, "_1920.png")).isEmpty());
    ThumbnailRender render;
    QVERIFY(inkIn(fastPicture(render, *archive)).isEmpty());
}

void tst_thumbnailrender::middlePictureIsTheBigOneReduced()
{
    const auto archive = LibraryFixture::makeRecord(m_fixture.makeFolder(QStringLiteral("middle")),
                                                    QStringLiteral("t"), QStringLiteral("Half"));
    const QRect big = inkIn(slowPicture(*archive, "_1920.png"));
    const QRect middle = inkIn(slowPicture(*archive, "_960.png"));
    QVERIFY(qAbs(big.left() / 2 - middle.left()) <= 2);
    QVERIFY(qAbs(big.width() / 2 - middle.width()) <= 3);
}

void tst_thumbnailrender::manyRendersLeaveNothingBehind()
{
    const auto archive = LibraryFixture::makeRecord(m_fixture.makeFolder(QStringLiteral("many")),
                                                    QStringLiteral("t"), QStringLiteral("Many"));
    ThumbnailRender render;
    const QImage first = fastPicture(render, *archive);
    for (int i = 0; i < 20; ++i)
        QCOMPARE(fastPicture(render, *archive), first);
}

QTEST_MAIN(tst_thumbnailrender)
#include "tst_thumbnailrender.moc"
