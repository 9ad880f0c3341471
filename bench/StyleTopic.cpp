// Showing a text of 300 outlined characters of one style: for the first time, when the shape of each glyph
// has to be computed, and again. Compared with Qt's own layout and the same work for each glyph that is in
// it.
#include "bench/BenchTitles.h"
#include "bench/PairList.h"
#include "bench/PlainTitle.h"
#include "bench/Topics.h"
#include "canvas/GraphicsText.h"
#include "canvas/TextObjectConstants.h"
#include "document/Archive.h"
#include "document/TText.h"

#include <QAbstractTextDocumentLayout>
#include <QGlyphRun>
#include <QGraphicsScene>
#include <QHash>
#include <QImage>
#include <QPainter>
#include <QPainterPathStroker>
#include <QRawFont>
#include <QTextBlock>
#include <QTextDocument>
#include <QTextLayout>
#include <memory>

namespace
{

constexpr double COLD_AIM = 1.5;
constexpr double WARM_AIM = 1.5;
constexpr int CHARACTERS = 300;
constexpr int EDGE_WIDTH = 4; // pixels of the 1920 raster
// More styles than any cache of glyphs holds, each of which is seen again only after all others.
constexpr int STYLES = 41;
constexpr int STYLE_STEP = 17;
constexpr int SMALLEST_SIZE = 40;
const QSize CANVAS(1280, 720);

// Returns a title of one text; a different style for each number up to STYLES.
Archive titleInStyle(int number)
{
    const int size = SMALLEST_SIZE + number * STYLE_STEP % STYLES;
    Archive archive;
    archive.setText({BenchTitles::text(1, 10, 10,
                                       {.characters = CHARACTERS,
                                        .size = size,
                                        .edgeWidth = EDGE_WIDTH,
                                        .shadow = false,
                                        .mixed = false})
                         .release()});
    return archive;
}

// Goes on from one repetition to the next, so that each begins with styles not seen for long.
int nextStyle()
{
    static int last = 0;
    return ++last;
}

enum class Sight { First, Again };

// Calls prepare with each title outside the measured time, then show with the result.
template <typename Prepare, typename Show>
void showStyles(benchmark::State& state, Sight sight, Prepare prepare, Show show)
{
    QImage image(CANVAS, QImage::Format_ARGB32_Premultiplied);
    const auto paint = [&](const auto& title) {
        image.fill(Qt::transparent);
        QPainter painter(&image);
        painter.setRenderHint(QPainter::Antialiasing);
        show(painter, title);
    };
    if (sight == Sight::Again)
        paint(prepare(titleInStyle(0)));
    for ([[maybe_unused]] auto _ : state) {
        state.PauseTiming();
        const auto title = prepare(titleInStyle(sight == Sight::First ? nextStyle() : 0));
        state.ResumeTiming();
        paint(title);
    }
    QImage nothing(CANVAS, image.format());
    nothing.fill(Qt::transparent);
    if (image == nothing)
        state.SkipWithError("nothing was drawn");
}

void showOurs(benchmark::State& state, Sight sight)
{
    const auto prepare = [](const Archive& archive) { return archive; };
    showStyles(state, sight, prepare, [](QPainter& painter, const Archive& archive) {
        QGraphicsScene scene(QRectF(QPointF(0, 0), CANVAS));
        auto* text = new GraphicsText(archive.text().front(), 1);
        text->initShowText();
        scene.addItem(text);
        scene.render(&painter);
    });
}

// The pictures of the glyphs of one style.
class GlyphSheet
{
public:
    void draw(QPainter& painter, QPointF origin, const QGlyphRun& run)
    {
        const QRawFont font = run.rawFont();
        const QList<quint32> indexes = run.glyphIndexes();
        const QList<QPointF> positions = run.positions();
        for (qsizetype i = 0; i < indexes.size(); ++i) {
            auto known = m_glyphs.constFind(indexes[i]);
            if (known == m_glyphs.constEnd())
                known = m_glyphs.insert(indexes[i], made(font.pathForGlyph(indexes[i])));
            if (!known->image.isNull())
                painter.drawImage((origin + positions[i]).toPoint() + known->corner, known->image);
        }
    }

private:
    struct Glyph {
        QImage image;
        QPoint corner;
    };

    static Glyph made(const QPainterPath& path)
    {
        if (path.isEmpty())
            return {};
        QPainterPathStroker stroker;
        stroker.setWidth(EDGE_WIDTH * TextObjectConstants::SCENEPERCENTAGE);
        const QPainterPath edge = stroker.createStroke(path);
        const QRect area = edge.controlPointRect().toAlignedRect();
        Glyph glyph{QImage(area.size(), QImage::Format_ARGB32_Premultiplied), area.topLeft()};
        glyph.image.fill(Qt::transparent);
        QPainter painter(&glyph.image);
        painter.setRenderHint(QPainter::Antialiasing);
        painter.translate(-area.topLeft());
        painter.fillPath(edge, Qt::darkBlue);
        painter.fillPath(path, Qt::white);
        return glyph;
    }

    QHash<quint32, Glyph> m_glyphs;
};

void showPlain(benchmark::State& state, Sight sight)
{
    auto sheet = std::make_unique<GlyphSheet>();
    const auto prepare = [](const Archive& archive) {
        return PlainTitle(archive, TextObjectConstants::SCENEPERCENTAGE);
    };
    showStyles(state, sight, prepare, [&sheet, sight](QPainter& painter, const PlainTitle& title) {
        if (sight == Sight::First)
            sheet = std::make_unique<GlyphSheet>();
        QTextDocument document;
        document.setUndoRedoEnabled(false);
        title.fill(document, 0);
        for (QTextBlock block = document.begin(); block.isValid(); block = block.next()) {
            // The layout is made as far as it is asked for.
            const QPointF origin =
                title.position(0) + document.documentLayout()->blockBoundingRect(block).topLeft();
            for (const QGlyphRun& run : block.layout()->glyphRuns(0, block.length()))
                sheet->draw(painter, origin, run);
        }
    });
}

} // namespace

void Topics::addStyles(PairList& list)
{
    const auto add = [&list](const char* name, double aim, Sight sight) {
        list.add(
            {name, aim, PairList::Clock::Cpu}, benchmark::kMillisecond,
            [sight](benchmark::State& state) { showOurs(state, sight); },
            [sight](benchmark::State& state) { showPlain(state, sight); });
    };
    add("drawing_cold", COLD_AIM, Sight::First);
    add("drawing_warm", WARM_AIM, Sight::Again);
}
