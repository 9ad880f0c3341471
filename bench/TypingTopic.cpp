// Typing one key into a long text until it is painted, compared with a plain text item with the same formats.
#include "bench/BenchTitles.h"
#include "bench/PairList.h"
#include "bench/Topics.h"
#include "canvas/CanvasScene.h"
#include "canvas/CharacterFormat.h"
#include "canvas/GraphicsView.h"
#include "canvas/IThumbnailRender.h"
#include "canvas/StyleDocument.h"

#include <QApplication>
#include <QGraphicsTextItem>
#include <QGraphicsView>
#include <QKeyEvent>
#include <QTextCursor>
#include <QTextDocument>
#include <algorithm>
#include <memory>
#include <utility>
#include <vector>

namespace
{

constexpr double AIM = 2.0;
constexpr double EXPONENT = 0.5;
constexpr int CHARACTERS = 299;
constexpr int CHARACTER_SIZE = 48;
constexpr int SMALL_SIZE = 20; // 1,200 characters of it fit on the canvas
const QSize CANVAS(1280, 720);

void key(QGraphicsView& view, Qt::Key code, const QString& text)
{
    QKeyEvent press(QEvent::KeyPress, code, Qt::NoModifier, text);
    QApplication::sendEvent(&view, &press);
    QKeyEvent release(QEvent::KeyRelease, code, Qt::NoModifier, text);
    QApplication::sendEvent(&view, &release);
}

// Does at once what the event loop would do: the queued updates of the scene and the paint event of the view.
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
    view.setFocus();
    show(view);
}

// Types keys and removes them; only the typing is measured. Returns false when a key did not arrive.
void typeKeys(benchmark::State& state, QGraphicsView& view, const QTextDocument& document)
{
    const int before = document.characterCount();
    for ([[maybe_unused]] auto _ : state) {
        key(view, Qt::Key_A, QStringLiteral("a"));
        show(view);
        state.PauseTiming();
        if (document.characterCount() != before + 1) {
            state.SkipWithError("the key did not arrive");
            break;
        }
        key(view, Qt::Key_Backspace, QString(QChar(8)));
        show(view);
        state.ResumeTiming();
    }
}

std::unique_ptr<TText> makeText(int characters, int size, int id = 1)
{
    constexpr float LINES = 170; // pixels of the canvas, from one text to the next
    return BenchTitles::text(id, 10, 10 + LINES * static_cast<float>(id - 1),
                             {.characters = characters, .size = size, .edgeWidth = 0, .shadow = false});
}

// Types at the end of the first of several equal texts.
void typeOnCanvas(benchmark::State& state, int characters, int size, int texts)
{
    Archive archive;
    archive.setPath("unsaved.xml");
    std::vector<TText*> records;
    for (int id = 1; id <= texts; ++id)
        records.push_back(makeText(characters, size, id).release());
    archive.setText(std::move(records));
    CanvasScene scene(nullptr);
    scene.setSceneRect(QRectF(QPointF(0, 0), CANVAS));
    GraphicsView view(&scene);
    prepare(view);
    scene.slotUpdateArchive(&archive);
    GraphicsText* text = scene.findTextItem(1);
    if (!text) {
        state.SkipWithError("the title does not show");
        return;
    }
    text->initNewTextSelectAll();
    key(view, Qt::Key_End, {});
    show(view);
    typeKeys(state, view, *text->document());
}

void typeInPlainItem(benchmark::State& state)
{
    const std::unique_ptr<TText> record = makeText(CHARACTERS, CHARACTER_SIZE);
    QGraphicsScene scene(QRectF(QPointF(0, 0), CANVAS));
    auto* item = new QGraphicsTextItem;
    QTextCursor cursor(item->document());
    for (const TextStyle* style : record->textItems()) {
        QTextCharFormat format;
        format.setFont(CharacterFormat::font(*style, TextObjectConstants::SCENEPERCENTAGE));
        format.setForeground(CharacterFormat::color(style->getFontColor()));
        cursor.insertText(QString::fromStdString(style->getText()), format);
    }
    item->setTextInteractionFlags(Qt::TextEditorInteraction);
    item->setPos(record->getXValue(), record->getYValue());
    scene.addItem(item);
    QGraphicsView view(&scene);
    prepare(view);
    item->setFocus();
    cursor.movePosition(QTextCursor::End);
    item->setTextCursor(cursor);
    show(view);
    typeKeys(state, view, *item->document());
}

} // namespace

void Topics::addTyping(PairList& list)
{
    list.add(
        {"key_to_repaint", AIM, PairList::Clock::Cpu}, benchmark::kMicrosecond,
        [](benchmark::State& state) { typeOnCanvas(state, CHARACTERS, CHARACTER_SIZE, 1); }, typeInPlainItem);
    list.addGrowth({"key_of_characters", EXPONENT, PairList::Clock::Cpu, {10, 300, 1200}, "characters"},
                   benchmark::kMicrosecond, [](benchmark::State& state, long characters) {
                       // One character less than allowed, so that a key has room.
                       typeOnCanvas(state, static_cast<int>(std::min<long>(characters, CHARACTERS)),
                                    SMALL_SIZE, BenchTitles::textsFor(characters));
                   });
}
