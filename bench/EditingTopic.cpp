// Edits of a text of 300 characters on the canvas: one frame of a drag, a change of style, its undo.
#include "bench/BenchTitles.h"
#include "bench/PairList.h"
#include "bench/Topics.h"
#include "canvas/CanvasScene.h"
#include "canvas/CharacterFormat.h"
#include "canvas/GraphicsText.h"
#include "canvas/GraphicsView.h"
#include "canvas/IThumbnailRender.h"
#include "canvas/StyleDocument.h"
#include "canvas/TextObjectConstants.h"

#include <QApplication>
#include <QGraphicsPixmapItem>
#include <QGraphicsTextItem>
#include <QGraphicsView>
#include <QMouseEvent>
#include <QTextCursor>
#include <QTextDocument>
#include <QUndoStack>
#include <algorithm>

namespace
{

constexpr double DRAG_AIM = 4.0;
constexpr double STYLE_AIM = 1.6;
constexpr double STYLE_EXPONENT = 1.1;
constexpr int CHARACTERS = 300;
constexpr int STEP = 6; // pixels that the finger moves in one frame
constexpr int OBJECT = 1;
const QSize CANVAS(1280, 720);

// Carries out the queued updates of the scene and the paint event of the view.
void show(QGraphicsView& view)
{
    QCoreApplication::processEvents();
    QCoreApplication::sendPostedEvents(view.viewport(), QEvent::UpdateRequest);
}

void prepare(QGraphicsView& view)
{
    view.setRenderHint(QPainter::Antialiasing);
    view.setFrameShape(QFrame::NoFrame);
    view.setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    view.setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    view.resize(CANVAS);
    view.show();
    view.activateWindow();
    show(view);
}

void mouse(QGraphicsView& view, QEvent::Type type, QPoint point)
{
    const Qt::MouseButton button = type == QEvent::MouseMove ? Qt::NoButton : Qt::LeftButton;
    const Qt::MouseButtons held = type == QEvent::MouseButtonRelease ? Qt::NoButton : Qt::LeftButton;
    QMouseEvent event(type, point, view.viewport()->mapToGlobal(point), button, held, {});
    QCoreApplication::sendEvent(view.viewport(), &event);
}

// The object on the canvas with its undo stack, as in the window. It is not part of a title, so undo steps
// are not saved: another pair measures saving.
struct Canvas {
    // The text under test, and others that are only shown.
    explicit Canvas(const BenchTitles::Look& look, int texts = 1)
    {
        scene.setSceneRect(QRectF(QPointF(0, 0), CANVAS));
        view.setScene(&scene);
        prepare(view);
        QObject::connect(&scene, &CanvasScene::signalPushUndoCommandIntoStack, &stack,
                         [this](QUndoCommand* command) { stack.push(command); });
        for (int id = OBJECT + texts - 1; id >= OBJECT; --id) {
            const std::unique_ptr<TText> record = BenchTitles::text(id, 100, 60, look);
            TText lastAlpha;
            lastAlpha.setTextItems({new TextStyle(*record->textItems().front())});
            text = scene.rebuildItem(record.get(), lastAlpha);
        }
    }

    QUndoStack stack;
    CanvasScene scene{nullptr};
    GraphicsView view{&scene};
    GraphicsText* text = nullptr; // owned by the scene
};

constexpr BenchTitles::Look OUTLINED_TEXT{
    .characters = CHARACTERS, .size = 48, .edgeWidth = 4, .shadow = true, .mixed = true};
constexpr BenchTitles::Look PLAIN_TEXT{
    .characters = CHARACTERS, .size = 48, .edgeWidth = 0, .shadow = false, .mixed = true};

// Measures dragging an object of the canvas to and fro with a finger that is down already.
void drag(benchmark::State& state, QGraphicsView& view, QPoint from, const std::function<QPointF()>& place)
{
    mouse(view, QEvent::MouseButtonPress, from);
    show(view);
    bool right = true;
    for ([[maybe_unused]] auto _ : state) {
        const QPointF before = place();
        mouse(view, QEvent::MouseMove, right ? from + QPoint(STEP, STEP) : from);
        show(view);
        right = !right;
        if (place() == before) {
            state.SkipWithError("the object did not move");
            break;
        }
    }
    mouse(view, QEvent::MouseButtonRelease, from);
}

void dragText(benchmark::State& state)
{
    Canvas canvas(OUTLINED_TEXT);
    drag(state, canvas.view, canvas.view.mapFromScene(canvas.text->sceneBoundingRect().center()),
         [&canvas] { return canvas.text->scenePos(); });
}

void dragPixmap(benchmark::State& state)
{
    Canvas canvas(OUTLINED_TEXT);
    const QRectF area = canvas.text->sceneBoundingRect();
    QPixmap pixmap(area.size().toSize());
    pixmap.fill(Qt::transparent);
    QPainter painter(&pixmap);
    painter.setRenderHint(QPainter::Antialiasing);
    canvas.scene.render(&painter, pixmap.rect(), area);
    painter.end();

    QGraphicsScene scene(QRectF(QPointF(0, 0), CANVAS));
    scene.setItemIndexMethod(QGraphicsScene::NoIndex);
    QGraphicsPixmapItem* item = scene.addPixmap(pixmap);
    item->setPos(area.topLeft().toPoint());
    item->setFlag(QGraphicsItem::ItemIsMovable);
    QGraphicsView view(&scene);
    prepare(view);
    drag(state, view, view.mapFromScene(item->sceneBoundingRect().center()),
         [item] { return item->scenePos(); });
}

// Returns the styles of the selection as the panel sends them, with all characters bold or none.
TText withBold(const TText& record, bool bold)
{
    TText source = record;
    for (TextStyle* style : source.textItems())
        style->setFontBold(bold);
    return source;
}

void selectAll(GraphicsText& text)
{
    text.initNewTextSelectAll();
    text.getSelectionInfo(0, 0, 0, 2);
}

void changeStyle(benchmark::State& state, const BenchTitles::Look& look, int texts)
{
    Canvas canvas(look, texts);
    canvas.stack.setUndoLimit(25);
    selectAll(*canvas.text);
    TText sources[] = {withBold(*canvas.text->getItemTText(), true),
                       withBold(*canvas.text->getItemTText(), false)};
    int turn = 0;
    for ([[maybe_unused]] auto _ : state) {
        canvas.scene.slotChangeObjectTextStyle(&sources[turn], TextObjectConstants::PropertyBold, 1);
        turn = 1 - turn;
        if (!canvas.text->textCursor().hasSelection()) {
            state.SkipWithError("the selection is gone");
            break;
        }
    }
}

void undoStyle(benchmark::State& state)
{
    Canvas canvas(PLAIN_TEXT);
    TText source = withBold(*canvas.text->getItemTText(), true);
    selectAll(*canvas.text);
    canvas.scene.slotChangeObjectTextStyle(&source, TextObjectConstants::PropertyBold, 1);
    for ([[maybe_unused]] auto _ : state) {
        canvas.stack.undo();
        state.PauseTiming();
        canvas.stack.redo();
        if (!canvas.text->getItemTText()->textItems().front()->isFontBold()) {
            state.SkipWithError("nothing was undone");
            break;
        }
        state.ResumeTiming();
    }
}

// A run of characters with the same format.
struct PlainRun {
    QString text;
    QTextCharFormat formats[2]; // bold, and not bold
};

std::vector<PlainRun> runsOf(const TText& record)
{
    std::vector<PlainRun> runs;
    for (const TextStyle* style : record.textItems()) {
        PlainRun run;
        TextStyle changed = *style;
        for (const int bold : {0, 1}) {
            changed.setFontBold(bold);
            run.formats[bold].setFont(CharacterFormat::font(changed, TextObjectConstants::SCENEPERCENTAGE));
            run.formats[bold].setForeground(CharacterFormat::color(style->getFontColor()));
        }
        if (runs.empty() || runs.back().formats[0] != run.formats[0])
            runs.push_back(run);
        runs.back().text += QString::fromStdString(style->getText());
    }
    return runs;
}

void setPlainText(benchmark::State& state)
{
    const std::vector<PlainRun> runs = runsOf(*BenchTitles::text(OBJECT, 100, 60, PLAIN_TEXT));
    QGraphicsScene scene(QRectF(QPointF(0, 0), CANVAS));
    auto* item = new QGraphicsTextItem;
    scene.addItem(item);
    QGraphicsView view(&scene);
    prepare(view);
    int turn = 0;
    for ([[maybe_unused]] auto _ : state) {
        QTextCursor cursor(item->document());
        cursor.beginEditBlock();
        cursor.select(QTextCursor::Document);
        cursor.removeSelectedText();
        for (const PlainRun& run : runs)
            cursor.insertText(run.text, run.formats[turn]);
        cursor.endEditBlock();
        turn = 1 - turn;
        benchmark::DoNotOptimize(item->boundingRect());
    }
}

} // namespace

void Topics::addEditing(PairList& list)
{
    list.add({"drag_frame", DRAG_AIM, PairList::Clock::Cpu}, benchmark::kMillisecond, dragText, dragPixmap);
    list.add(
        {"style_change", STYLE_AIM, PairList::Clock::Cpu}, benchmark::kMillisecond,
        [](benchmark::State& state) { changeStyle(state, PLAIN_TEXT, 1); }, setPlainText);
    list.add({"style_undo", STYLE_AIM, PairList::Clock::Cpu}, benchmark::kMillisecond, undoStyle,
             setPlainText);
    list.addGrowth({"style_change_of_characters",
                    STYLE_EXPONENT,
                    PairList::Clock::Cpu,
                    {10, CHARACTERS, 1200},
                    "characters"},
                   benchmark::kMillisecond, [](benchmark::State& state, long characters) {
                       BenchTitles::Look look = PLAIN_TEXT;
                       look.characters = static_cast<int>(std::min<long>(characters, CHARACTERS));
                       changeStyle(state, look, BenchTitles::textsFor(characters));
                   });
}
