// The title list: one step of a flick, filling it, a tap on a title and opening a folder.
#include "bench/BenchEnvironment.h"
#include "bench/BenchTitles.h"
#include "bench/PairList.h"
#include "bench/ShownList.h"
#include "bench/TitleEditor.h"
#include "bench/Topics.h"
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
#include <QVBoxLayout>
#include <memory>
#include <vector>

namespace
{

constexpr double FLICK_AIM = 1.3;
constexpr double BUILD_AIM = 2.0;
constexpr double TAP_AIM = 1.5;
constexpr double OPEN_AIM = 1.5;
constexpr double FIRST_SCREEN_AIM = 0.15;
constexpr double LONG_FIRST_SCREEN_AIM = 1.5;
constexpr int TITLES = 99;
constexpr int LONG_TITLES = 998;
constexpr int TICK_PIXELS = 24; // of a fast flick
constexpr int CHARACTERS = 100;

QString titleFolder(const BenchEnvironment& environment)
{
    static const QString folder = [&environment] {
        const QString path = environment.makeFolder(QStringLiteral("list"));
        BenchTitles::writeIllustratedFolder(path.toStdString(), TITLES);
        return path;
    }();
    return folder;
}

QString longFolder(const BenchEnvironment& environment)
{
    static const QString folder = [&environment] {
        const QString path = environment.makeFolder(QStringLiteral("long"));
        BenchTitles::writeIllustratedFolder(path.toStdString(), LONG_TITLES);
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
    shown.completeAll();
    QScrollBar& bar = *shown.list.verticalScrollBar();
    int value = 0;
    int step = TICK_PIXELS;
    for ([[maybe_unused]] auto _ : state) {
        scrollTo(bar, value, step);
        shown.list.slotSetScrollBarValue(value);
        ShownList::show(shown.list);
    }
    if (bar.value() != value || shown.list.count() != TITLES)
        state.SkipWithError("the list did not scroll");
}

void scrollBareArea(benchmark::State& state, const QString& folder)
{
    ShownList shown;
    shown.open(folder);
    shown.completeAll();
    QScrollArea area;
    area.setFrameShape(QFrame::NoFrame);
    area.setHorizontalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    area.setVerticalScrollBarPolicy(Qt::ScrollBarAlwaysOff);
    area.setFixedSize(shown.list.size());
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
    ShownList::show(area);
    QScrollBar& bar = *area.verticalScrollBar();
    int value = 0;
    int step = TICK_PIXELS;
    for ([[maybe_unused]] auto _ : state) {
        scrollTo(bar, value, step);
        bar.setValue(value);
        ShownList::show(area);
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

// Makes a folder with two titles of four texts each, for a list that selects them and a canvas that shows
// them.
QString twoTitles(const BenchEnvironment& environment)
{
    const QString folder = environment.makeFolder(QStringLiteral("tap"));
    BenchTitles::writeFolder(folder.toStdString(), 2);
    ArchiveController controller;
    for (const QFileInfo& file : QDir(folder).entryInfoList({QStringLiteral("*.xml")}, QDir::Files)) {
        Archive title = BenchTitles::title(file.filePath().toStdString(), CHARACTERS, 36);
        controller.saveNewArchive(folder, &title);
    }
    return folder;
}

bool isComplete(const TitleEditor& editor)
{
    return editor.shown.list.count() == 2 && editor.scene.getTextItemList().size() == 4;
}

void tap(TitleEditor& editor, int row)
{
    QWidget* port = editor.shown.list.viewport();
    const QPointF pos(120, 143 * row + 60);
    for (const QEvent::Type type : {QEvent::MouseButtonPress, QEvent::MouseButtonRelease}) {
        QMouseEvent event(type, pos, port->mapToGlobal(pos), Qt::LeftButton, Qt::LeftButton, Qt::NoModifier);
        QApplication::sendEvent(port, &event);
    }
    editor.show();
}

void tapTitle(benchmark::State& state, const BenchEnvironment& environment)
{
    TitleEditor editor(twoTitles(environment), nullptr);
    int row = 0;
    for ([[maybe_unused]] auto _ : state) {
        row = 1 - row;
        tap(editor, row);
    }
    if (!isComplete(editor) || editor.shown.list.getItemIndex(editor.shown.list.getSelectedArchive()) != row)
        state.SkipWithError("the title was not selected");
}

// Measures the floor: draws all texts once.
void renderTitle(benchmark::State& state, const BenchEnvironment& environment)
{
    TitleEditor editor(twoTitles(environment), nullptr);
    if (!isComplete(editor))
        state.SkipWithError("the title does not show");
    QImage picture(TitleEditor::CANVAS, QImage::Format_ARGB32_Premultiplied);
    for ([[maybe_unused]] auto _ : state) {
        picture.fill(Qt::transparent);
        QPainter painter(&picture);
        painter.setRenderHint(QPainter::Antialiasing);
        editor.scene.render(&painter);
    }
}

// Detects when the first screen of thumbnails has been painted.
class FirstScreen : public QObject
{
public:
    explicit FirstScreen(ArchiveList& list) : m_list(list) { list.viewport()->installEventFilter(this); }
    bool isPainting() const { return m_isPainting; }
    void begin() { m_isPainting = false; }

    bool eventFilter(QObject* object, QEvent* event) override
    {
        const ArchiveItem* last = m_list.archiveItem(m_list.lastVisibleItem());
        if (object == m_list.viewport() && event->type() == QEvent::Paint)
            m_isPainting = last && last->hasChildWidgets();
        return false;
    }

private:
    ArchiveList& m_list;
    bool m_isPainting = false;
};

void closeFolder(ShownList& shown)
{
    shown.list.cleanArchiveList();
    ShownList::show(shown.list);
}

void openFolder(benchmark::State& state, const QString& folder)
{
    ShownList shown;
    for ([[maybe_unused]] auto _ : state) {
        shown.open(folder);
        shown.completeAll();
        state.PauseTiming();
        if (shown.list.count() != TITLES)
            state.SkipWithError("the folder was not opened");
        closeFolder(shown);
        state.ResumeTiming();
    }
}

void openFirstScreen(benchmark::State& state, const QString& folder)
{
    ShownList shown;
    FirstScreen first(shown.list);
    for ([[maybe_unused]] auto _ : state) {
        first.begin();
        shown.list.refreshArchiveList(folder);
        while (!first.isPainting())
            QCoreApplication::processEvents();
        state.PauseTiming();
        closeFolder(shown);
        state.ResumeTiming();
    }
}

void decodePictures(benchmark::State& state, const QStringList& paths)
{
    for ([[maybe_unused]] auto _ : state)
        for (const QString& path : paths)
            benchmark::DoNotOptimize(QImageReader(path).read());
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
    list.add(
        {"folder_first_screen", FIRST_SCREEN_AIM, PairList::Clock::Wall}, benchmark::kMillisecond,
        [place](benchmark::State& state) { openFirstScreen(state, titleFolder(*place)); },
        [place](benchmark::State& state) { openFolder(state, titleFolder(*place)); });
    list.add(
        {"long_folder_first_screen", LONG_FIRST_SCREEN_AIM, PairList::Clock::Wall}, benchmark::kMillisecond,
        [place](benchmark::State& state) { openFirstScreen(state, longFolder(*place)); },
        [place](benchmark::State& state) { openFirstScreen(state, titleFolder(*place)); });
}
