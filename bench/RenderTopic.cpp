// Painting texts, compared with QPainter drawing ready pictures of the same glyphs.
#include "bench/BenchEnvironment.h"
#include "bench/BenchTitles.h"
#include "bench/GlyphPictures.h"
#include "bench/PairList.h"
#include "bench/PathRecorder.h"
#include "bench/Topics.h"
#include "canvas/GraphicsText.h"
#include "library/ThumbnailRender.h"

#include <QGraphicsDropShadowEffect>
#include <QGraphicsScene>
#include <QPainter>
#include <QThread>

// Declared here, since the widgets library exports it without a header. The effects blur with it.
void qt_blurImage(QPainter* painter, QImage& image, qreal radius, bool quality, bool alphaOnly,
                  int transposed = 0);

namespace
{

constexpr double SLOW_PASS_AIM = 1.5;
constexpr double REPAINT_AIM = 1.3;
constexpr double BIG_POSITION = 1.5;       // from the 1280 canvas to the 1920 raster
constexpr double TITLE_PIXELS_OFF = 0.002; // largest share of pixels in which the two drawings may differ
constexpr unsigned long POLL = 50;         // microseconds
// The characters are large enough that the program draws each of them as a path.
constexpr int CHARACTERS = 24;
constexpr int SIZE = 96;
const QSize CANVAS(1280, 720);

// One text as pictures of its glyphs, with its shadow.
struct Drawing {
    GlyphPictures glyphs;
    bool shadow = false;
    QPointF offset;
    qreal blur = 0;
    QColor shadowColor;
    QRect bounds; // of the text, in device pixels
};

// Draws the text on a separate layer, with the layer blurred and coloured below it.
void drawWithShadow(QPainter& painter, const Drawing& drawing)
{
    const int margin = qCeil(drawing.blur + qMax(qAbs(drawing.offset.x()), qAbs(drawing.offset.y())));
    const QRect area = drawing.bounds.adjusted(-margin, -margin, margin, margin);
    QImage text(area.size(), QImage::Format_ARGB32_Premultiplied);
    text.fill(Qt::transparent);
    QPainter textPainter(&text);
    drawing.glyphs.draw(textPainter, -area.topLeft());
    textPainter.end();

    QImage shadow(area.size(), QImage::Format_ARGB32_Premultiplied);
    shadow.fill(Qt::transparent);
    QImage unblurred = text;
    QPainter shadowPainter(&shadow);
    qt_blurImage(&shadowPainter, unblurred, drawing.blur, false, true);
    shadowPainter.setCompositionMode(QPainter::CompositionMode_SourceIn);
    shadowPainter.fillRect(shadow.rect(), drawing.shadowColor);
    shadowPainter.end();
    painter.drawImage(area.topLeft() + drawing.offset, shadow);
    painter.drawImage(area.topLeft(), text);
}

void draw(QPainter& painter, const std::vector<Drawing>& drawings)
{
    painter.setRenderHint(QPainter::Antialiasing);
    for (const Drawing& drawing : drawings)
        if (drawing.shadow)
            drawWithShadow(painter, drawing);
        else
            drawing.glyphs.draw(painter);
}

// Records what the text paints without its shadow.
Drawing record(QGraphicsScene& scene, GraphicsText& text, bool& complete)
{
    QGraphicsDropShadowEffect* effect = text.shadowEffect();
    const bool hasShadow = effect->isEnabled();
    const QRect bounds = text.sceneBoundingRect().toAlignedRect();
    effect->setEnabled(false);
    PathRecorder recorder(scene.sceneRect().size().toSize());
    QPainter painter(&recorder);
    scene.render(&painter);
    painter.end();
    effect->setEnabled(hasShadow);
    complete = complete && recorder.isComplete() && !recorder.paths().empty();
    return {GlyphPictures(recorder.paths()),
            hasShadow,
            effect->offset(),
            effect->blurRadius(),
            effect->color(),
            bounds};
}

std::vector<Drawing> recordTitle(const Archive& archive, bool& complete)
{
    std::vector<Drawing> drawings;
    for (TText* record : archive.text()) {
        QGraphicsScene scene(ThumbnailRender::BIG_SIZE_SCENE_RECT_SIZE);
        auto* text = new GraphicsText(record, record->getTextObjectID());
        text->setRadio(1.0, true);
        text->setPos(record->getXValue() * BIG_POSITION, record->getYValue() * BIG_POSITION);
        text->initShowText();
        scene.addItem(text);
        text->setBoundingRectFlag(true);
        drawings.push_back(::record(scene, *text, complete));
    }
    return drawings;
}

QImage drawTitle(const std::vector<Drawing>& drawings)
{
    QImage big(ThumbnailRender::THUMBNAIL_BIG_SIZE, QImage::Format_ARGB32_Premultiplied);
    big.fill(Qt::transparent);
    QPainter painter(&big);
    draw(painter, drawings);
    return big;
}

QImage scaled(const QImage& big)
{
    return big.scaled(ThumbnailRender::THUMBNAIL_MIDDLE_SIZE, Qt::IgnoreAspectRatio,
                      Qt::SmoothTransformation);
}

// Returns the share of the pixels that differ.
double difference(const QImage& one, const QImage& other)
{
    if (one.size() != other.size())
        return 1;
    const QImage a = one.convertToFormat(QImage::Format_ARGB32_Premultiplied);
    const QImage b = other.convertToFormat(QImage::Format_ARGB32_Premultiplied);
    int different = 0;
    constexpr int LEVELS = 8;
    for (int y = 0; y < a.height(); ++y) {
        for (int x = 0; x < a.width(); ++x) {
            const QRgb p = a.pixel(x, y);
            const QRgb q = b.pixel(x, y);
            different += qAbs(qAlpha(p) - qAlpha(q)) > LEVELS || qAbs(qRed(p) - qRed(q)) > LEVELS ||
                         qAbs(qGreen(p) - qGreen(q)) > LEVELS || qAbs(qBlue(p) - qBlue(q)) > LEVELS;
        }
    }
    return static_cast<double>(different) / (static_cast<double>(a.width()) * a.height());
}

void waitForPictures(ThumbnailRender& render)
{
    while (!render.makePictureThreadIsFinished())
        QThread::usleep(POLL);
}

void slowPass(benchmark::State& state, const Archive& archive)
{
    ThumbnailRender render;
    render.makeThumbnail(&archive, true); // other pairs have taken the place of its glyphs
    waitForPictures(render);
    for ([[maybe_unused]] auto _ : state) {
        render.makeThumbnail(&archive, true);
        render.makePictureThreadIsFinished(); // draws the pictures that are queued
        state.PauseTiming();
        waitForPictures(render);
        state.ResumeTiming();
    }
}

void plainTitle(benchmark::State& state, const Archive& archive)
{
    bool complete = true;
    const std::vector<Drawing> drawings = recordTitle(archive, complete);
    ThumbnailRender render;
    render.makeThumbnail(&archive, true);
    waitForPictures(render);
    const QString path = QString::fromStdString(archive.getPath()).chopped(4) + QStringLiteral("_1920.png");
    if (!complete || difference(QImage(path), drawTitle(drawings)) > TITLE_PIXELS_OFF) {
        state.SkipWithError("the floor draws another picture");
        return;
    }
    for ([[maybe_unused]] auto _ : state) {
        const QImage big = drawTitle(drawings);
        benchmark::DoNotOptimize(scaled(big).constBits());
    }
}

// A text of 300 outlined characters on the canvas.
struct OutlinedText {
    QGraphicsScene scene{QRectF(QPointF(0, 0), CANVAS)};
    std::unique_ptr<TText> record = BenchTitles::text(
        1, 10, 10, {.characters = 300, .size = 48, .edgeWidth = 4, .shadow = false, .mixed = true});
    GraphicsText* text; // owned by the scene

    OutlinedText() : text(new GraphicsText(record.get(), 1))
    {
        text->initShowText();
        scene.addItem(text);
    }
};

void repaint(benchmark::State& state)
{
    OutlinedText outlined;
    QImage image(CANVAS, QImage::Format_ARGB32_Premultiplied);
    const auto paint = [&] {
        image.fill(Qt::transparent);
        QPainter painter(&image);
        painter.setRenderHint(QPainter::Antialiasing);
        outlined.scene.render(&painter);
    };
    paint(); // other pairs have taken the place of its glyphs
    for ([[maybe_unused]] auto _ : state)
        paint();
}

void repaintPictures(benchmark::State& state)
{
    OutlinedText outlined;
    bool complete = true;
    const std::vector<Drawing> drawings = {record(outlined.scene, *outlined.text, complete)};
    QImage expected(CANVAS, QImage::Format_ARGB32_Premultiplied);
    expected.fill(Qt::transparent);
    QPainter expectedPainter(&expected);
    expectedPainter.setRenderHint(QPainter::Antialiasing);
    outlined.scene.render(&expectedPainter);
    expectedPainter.end();
    QImage image(CANVAS, QImage::Format_ARGB32_Premultiplied);
    for ([[maybe_unused]] auto _ : state) {
        image.fill(Qt::transparent);
        QPainter painter(&image);
        draw(painter, drawings);
    }
    if (!complete || difference(image, expected) > 0)
        state.SkipWithError("the floor draws another picture");
}

} // namespace

void Topics::addRendering(PairList& list, const BenchEnvironment& environment)
{
    const std::string folder = environment.makeFolder(QStringLiteral("rendering")).toStdString();
    const Archive archive = BenchTitles::title(folder + "/title.xml", CHARACTERS, SIZE);
    list.add(
        {"slow_pass_drawing", SLOW_PASS_AIM, PairList::Clock::Cpu}, benchmark::kMillisecond,
        [archive](benchmark::State& state) { slowPass(state, archive); },
        [archive](benchmark::State& state) { plainTitle(state, archive); });
    list.add({"outline_repaint", REPAINT_AIM, PairList::Clock::Cpu}, benchmark::kMillisecond, repaint,
             repaintPictures);
}
