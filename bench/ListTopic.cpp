// The title list: one tick of a flick, filling it, a tap on a title and opening a folder.
#include "bench/BenchEnvironment.h"
#include "bench/BenchTitles.h"
#include "bench/PairList.h"
#include "bench/Topics.h"
#include "canvas/CanvasScene.h"
#include "canvas/GraphicsView.h"
#include "canvas/IThumbnailRender.h"
#include "document/ArchiveController.h"
#include "library/ArchiveItem.h"
#include "library/ArchiveList.h"

#include <QApplication>
#include <QDir>
#include <QFileInfo>
#include <QImageReader>
#include <QLabel>
#include <QMouseEvent>
#include <QPainter>
#include <QPushButton>
#include <QScrollArea>
#include <QScrollBar>
#include <QUndoCommand>
#include <QVBoxLayout>
#include <memory>
#include <vector>

namespace
{

constexpr double FLICK_AIM = 1.3;
constexpr double BUILD_AIM = 2.0;
constexpr double TAP_AIM = 1.5;
constexpr double OPEN_AIM = 1.5;
constexpr int TITLES = 99;
constexpr int TICK_PIXELS = 24; // of a brisk flick
constexpr int CHARACTERS = 100;
const QSize LIST_SIZE(549, 997);
const QSize SMALL_PICTURE(240, 135);
const QSize CANVAS(1280, 720);

// What the program does at once: layouts, queued calls, updates and the paint events of the window.
void show(QWidget& window)
{
    QCoreApplication::processEvents();
    QCoreApplication::sendPostedEvents(&window, QEvent::UpdateRequest);
}

QStringList picturePaths(const QString& folder)
{
    QStringList paths;
    for (const std::string& title : BenchTitles::writeFolder(folder.toStdString(), TITLES)) {
        const QFileInfo info(QString::fromStdString(title));
        paths.append(folder + QLatin1Char('/') + info.completeBaseName() + QStringLiteral("_240.png"));
        QImage picture = BenchTitles::photograph(SMALL_PICTURE);
        picture.save(paths.constLast());
    }
    return paths;
}

QString titleFolder(const BenchEnvironment& environment)
{
    static const QString folder = [&environment] {
        const QString path = environment.makeFolder(QStringLiteral("list"));
        picturePaths(path);
        return path;
    }();
    return folder;
}

QStringList smallPictures(const QString& folder)
{
    QStringList paths;
    for (const QString& name : QDir(folder).entryList({QStringLiteral("*_240.png")}, QDir::Files, QDir::Name))
        paths.append(folder + QLatin1Char('/') + name);
    return paths;
}

// The list of a window, with its label, that shows the folder.
class ShownList
{
public:
    ShownList() : list(&mLabel, false)
    {
        list.setFixedSize(LIST_SIZE);
        list.show();
        show(list);
    }
    void open(const QString& folder)
    {
        list.refreshArchiveList(folder);
        while (list.count() > 0 && !list.archiveItem(list.count() - 1)->hasChildWidgets())
            show(list);
        show(list);
    }

private:
    QLabel mLabel;

public:
    ArchiveList list;
};

void scrollTo(QScrollBar& bar, int& value, int& step)
{
    if (value + step > bar.maximum() || value + step < 0)
        step = -step;
    value += step;
}

void flickList(benchmark::State& state, const QString& folder)
{
    ShownList shown;
    shown.open(folder);
    QScrollBar& bar = *shown.list.verticalScrollBar();
    int value = 0;
    int step = TICK_PIXELS;
    for ([[maybe_unused]] auto _ : state) {
        scrollTo(bar, value, step);
        shown.list.slotSetScrollBarValue(value);
        show(shown.list);
    }
    if (bar.value() != value || shown.list.count() != TITLES)
        state.SkipWithError("the list did not scroll");
}

void scrollBareArea(benchmark::State& state, const QString& folder)
{
    ShownList shown;
    shown.open(folder);
    QScrollArea area;
    area.setFrameShape(QFrame::NoFrame);
    area.setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    area.setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    area.setFixedSize(LIST_SIZE);
    auto* board = new QWidget;
    auto* column = new QVBoxLayout(board);
    column->setContentsMargins(38, 0, 0, 0);
    column->setSpacing(4);
    for (int i = 0; i < shown.list.count(); ++i) {
        auto* label = new QLabel(board);
        label->setPixmap(shown.list.archiveItem(i)->grab());
        label->setFixedSize(ArchiveItem::WIDGET_WIDTH, ArchiveItem::WIDGET_HEIGHT);
        column->addWidget(label);
    }
    area.setWidget(board);
    area.show();
    show(area);
    QScrollBar& bar = *area.verticalScrollBar();
    int value = 0;
    int step = TICK_PIXELS;
    for ([[maybe_unused]] auto _ : state) {
        scrollTo(bar, value, step);
        bar.setValue(value);
        show(area);
    }
}

void fillList(benchmark::State& state)
{
    std::vector<Archive> records(TITLES);
    for ([[maybe_unused]] auto _ : state) {
        auto list = std::make_unique<KSScrollViewerWidget>();
        QList<KSBaseItemWidget*> items;
        for (Archive& record : records)
            items.append(new ArchiveItem(&record, ArchiveItem::LIST_ITEM, list.get()));
        list->addWidgetItems(&items, -1);
        state.PauseTiming();
        list.reset();
        state.ResumeTiming();
    }
}

void fillBareArea(benchmark::State& state)
{
    for ([[maybe_unused]] auto _ : state) {
        auto area = std::make_unique<QScrollArea>();
        auto* board = new QWidget;
        auto* column = new QVBoxLayout(board);
        for (int i = 0; i < TITLES; ++i) {
            auto* button = new QPushButton(board);
            button->setFixedSize(ArchiveItem::WIDGET_WIDTH, ArchiveItem::WIDGET_HEIGHT);
            button->setStyleSheet(ArchiveItem::UN_OPERATE_AND_UN_SELECT_STATE);
            column->addWidget(button);
        }
        area->setWidget(board);
        column->activate();
        state.PauseTiming();
        area.reset();
        state.ResumeTiming();
    }
}

// Two titles of four texts each, the list that selects them and the canvas that shows them.
class Editor
{
public:
    explicit Editor(const BenchEnvironment& environment)
        : view(&scene), mFolder(environment.makeFolder(QStringLiteral("tap")))
    {
        BenchTitles::writeFolder(mFolder.toStdString(), 2);
        ArchiveController controller;
        for (const QFileInfo& file : QDir(mFolder).entryInfoList({QStringLiteral("*.xml")}, QDir::Files)) {
            Archive title = BenchTitles::title(file.filePath().toStdString(), CHARACTERS, 36);
            controller.saveNewArchive(mFolder, &title);
        }
        scene.setSceneRect(QRectF(QPointF(0, 0), CANVAS));
        view.setFrameShape(QFrame::NoFrame);
        view.setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
        view.setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
        view.resize(CANVAS);
        view.show();
        QObject::connect(&shown.list, &ArchiveList::signalUpdateCanvas, &scene,
                         &CanvasScene::slotUpdateArchive);
        QObject::connect(&shown.list, &ArchiveList::itemSetDefaultState, &scene,
                         &CanvasScene::slotMakeSceneThumnail);
        QObject::connect(&shown.list, &ArchiveList::focusCommandSignal, &shown.list,
                         [](QUndoCommand* command) { delete command; });
        shown.open(mFolder);
        show(view);
    }
    bool isComplete() const { return shown.list.count() == 2 && scene.getTextItemList().size() == 4; }
    void tap(int row)
    {
        QWidget* port = shown.list.viewport();
        const QPointF pos(120, 143 * row + 60);
        for (const QEvent::Type type : {QEvent::MouseButtonPress, QEvent::MouseButtonRelease}) {
            QMouseEvent event(type, pos, port->mapToGlobal(pos), Qt::LeftButton, Qt::LeftButton,
                              Qt::NoModifier);
            QApplication::sendEvent(port, &event);
        }
        show(shown.list);
        show(view);
    }

    CanvasScene scene{nullptr};
    GraphicsView view;
    ShownList shown;

private:
    QString mFolder;
};

void tapTitle(benchmark::State& state, const BenchEnvironment& environment)
{
    Editor editor(environment);
    int row = 0;
    for ([[maybe_unused]] auto _ : state) {
        row = 1 - row;
        editor.tap(row);
    }
    if (!editor.isComplete() || editor.shown.list.getItemIndex(editor.shown.list.getSelectedArchive()) != row)
        state.SkipWithError("the title was not selected");
}

// Every text is laid out and drawn once.
void renderTitle(benchmark::State& state, const BenchEnvironment& environment)
{
    Editor editor(environment);
    if (!editor.isComplete())
        state.SkipWithError("the title does not show");
    QImage picture(CANVAS, QImage::Format_ARGB32_Premultiplied);
    for ([[maybe_unused]] auto _ : state) {
        picture.fill(Qt::transparent);
        QPainter painter(&picture);
        painter.setRenderHint(QPainter::Antialiasing);
        editor.scene.render(&painter);
    }
}

// Stops the clock when the first screen of thumbnails is painted.
class FirstScreen : public QObject
{
public:
    FirstScreen(benchmark::State& state, ArchiveList& list) : mState(state), mList(list)
    {
        list.viewport()->installEventFilter(this);
        list.installEventFilter(this);
    }
    bool isPainting() const { return mIsPainting; }
    bool isPainted() const { return mIsPainted; }
    void begin()
    {
        mIsPainting = false;
        mIsPainted = false;
    }
    void end()
    {
        if (!mIsPainted)
            mState.PauseTiming();
        mIsPainted = true;
    }

    bool eventFilter(QObject* object, QEvent* event) override
    {
        const ArchiveItem* last = mList.archiveItem(mList.lastVisibleItem());
        if (object == mList.viewport() && event->type() == QEvent::Paint)
            mIsPainting = last && last->hasChildWidgets();
        else if (mIsPainting && event->type() == QEvent::MetaCall) // the next title's turn
            end();
        return false;
    }

private:
    benchmark::State& mState;
    ArchiveList& mList;
    bool mIsPainting = false;
    bool mIsPainted = false;
};

void openFolder(benchmark::State& state, const QString& folder)
{
    ShownList shown;
    FirstScreen first(state, shown.list);
    for ([[maybe_unused]] auto _ : state) {
        first.begin();
        shown.list.refreshArchiveList(folder);
        while (!first.isPainting())
            QCoreApplication::processEvents();
        first.end();
        shown.list.cleanArchiveList();
        show(shown.list);
        state.ResumeTiming();
    }
}

void decodePictures(benchmark::State& state, const QStringList& paths)
{
    for ([[maybe_unused]] auto _ : state) {
        for (const QString& path : paths)
            benchmark::DoNotOptimize(QImageReader(path).read());
    }
}

} // namespace

void Topics::addList(PairList& list, const BenchEnvironment& environment)
{
    const BenchEnvironment* place = &environment;
    list.add(
        {"list_flick_tick", FLICK_AIM, PairList::Clock::Cpu}, benchmark::kMillisecond,
        [place](benchmark::State& state) { flickList(state, titleFolder(*place)); },
        [place](benchmark::State& state) { scrollBareArea(state, titleFolder(*place)); });
    list.add({"list_fill", BUILD_AIM, PairList::Clock::Cpu}, benchmark::kMillisecond, fillList, fillBareArea);
    list.add(
        {"title_tap", TAP_AIM, PairList::Clock::Cpu}, benchmark::kMillisecond,
        [place](benchmark::State& state) { tapTitle(state, *place); },
        [place](benchmark::State& state) { renderTitle(state, *place); });
    list.add(
        {"folder_open", OPEN_AIM, PairList::Clock::Wall}, benchmark::kMillisecond,
        [place](benchmark::State& state) { openFolder(state, titleFolder(*place)); },
        [place](benchmark::State& state) { decodePictures(state, smallPictures(titleFolder(*place))); });
}
