// The title list: one step of a flick, filling it, a tap on a title and opening a folder.
#include "bench/BareFiles.h"
#include "bench/BenchEnvironment.h"
#include "bench/BenchTitles.h"
#include "bench/PairList.h"
#include "bench/PlainTitle.h"
#include "bench/ShownList.h"
#include "bench/TitleEditor.h"
#include "bench/Topics.h"
#include "canvas/TextObjectConstants.h"
#include "document/ArchiveController.h"
#include "library/ArchiveItem.h"
#include "library/ArchiveList.h"

#include <QApplication>
#include <QDir>
#include <QFileInfo>
#include <QGraphicsScene>
#include <QGraphicsTextItem>
#include <QGraphicsView>
#include <QLabel>
#include <QMouseEvent>
#include <QPainter>
#include <QPixmap>
#include <QPushButton>
#include <QScrollArea>
#include <QScrollBar>
#include <QVBoxLayout>
#include <array>
#include <map>
#include <memory>
#include <string>
#include <vector>

namespace
{

constexpr double FLICK_AIM = 2.0;
constexpr double BUILD_AIM = 2.0;
constexpr double TAP_LIMIT = 4; // milliseconds
constexpr double OPEN_AIM = 1.3;
constexpr double FIRST_SCREEN_AIM = 1.5;
constexpr double LONG_FIRST_SCREEN_LIMIT = 60; // milliseconds
constexpr double FIRST_SCREEN_EXPONENT = 0.5;
constexpr int TITLES = 99;
constexpr int LONG_TITLES = 998;
constexpr int TICK_PIXELS = 24; // of a fast flick
constexpr int CHARACTERS = 100;
constexpr int CHARACTER_SIZE = 36;

// Returns a folder of this many titles, which is made when it is asked for first.
QString folderOf(const BenchEnvironment& environment, long titles)
{
    static std::map<long, QString> made;
    QString& path = made[titles];
    if (path.isEmpty()) {
        path = environment.makeFolder(QStringLiteral("list%1").arg(titles));
        BenchTitles::writeIllustratedFolder(path.toStdString(), static_cast<int>(titles));
    }
    return path;
}

QString titleFolder(const BenchEnvironment& environment)
{
    return folderOf(environment, TITLES);
}

std::vector<std::string> filesOf(const QString& folder, const char* pattern)
{
    std::vector<std::string> paths;
    for (const QFileInfo& file :
         QDir(folder).entryInfoList({QLatin1String(pattern)}, QDir::Files, QDir::Name))
        paths.push_back(file.filePath().toStdString());
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
        Archive title = BenchTitles::title(file.filePath().toStdString(), CHARACTERS, CHARACTER_SIZE);
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
    for (const int first : {1, 0})
        tap(editor, first); // other pairs have taken the place of their glyphs
    for ([[maybe_unused]] auto _ : state) {
        row = 1 - row;
        tap(editor, row);
    }
    if (!isComplete(editor) || editor.shown.list.getItemIndex(editor.shown.list.getSelectedArchive()) != row)
        state.SkipWithError("the title was not selected");
}

// Measures the floor: gives four text items of Qt the texts of the other title, and two pictures of a list
// their frames, until all is painted.
void showPlainTitle(benchmark::State& state, const BenchEnvironment& environment)
{
    std::vector<PlainTitle> titles;
    for (const std::string& path : filesOf(twoTitles(environment), "*.xml"))
        titles.emplace_back(BenchTitles::title(path, CHARACTERS, CHARACTER_SIZE),
                            TextObjectConstants::SCENEPERCENTAGE);
    QGraphicsScene scene(QRectF(QPointF(0, 0), TitleEditor::CANVAS));
    std::vector<QGraphicsTextItem*> items;
    for (std::size_t i = 0; i < titles.front().count(); ++i) {
        items.push_back(scene.addText({}));
        items.back()->setPos(titles.front().position(i));
    }
    QGraphicsView view(&scene);
    view.setRenderHint(QPainter::Antialiasing);
    view.setFrameShape(QFrame::NoFrame);
    view.resize(TitleEditor::CANVAS);
    view.show();
    QWidget list;
    auto* column = new QVBoxLayout(&list);
    QPixmap picture(ArchiveItem::WIDGET_WIDTH, ArchiveItem::WIDGET_HEIGHT);
    picture.fill(Qt::gray);
    std::array<QLabel*, 2> rows{};
    for (QLabel*& row : rows) {
        row = new QLabel(&list);
        row->setPixmap(picture);
        row->setFrameShape(QFrame::Box);
        column->addWidget(row);
    }
    list.show();
    std::size_t shown = 0;
    for ([[maybe_unused]] auto _ : state) {
        shown = 1 - shown;
        for (std::size_t i = 0; i < items.size(); ++i)
            titles[shown].fill(*items[i]->document(), i);
        for (std::size_t i = 0; i < rows.size(); ++i)
            rows[i]->setLineWidth(i == shown ? 2 : 1);
        ShownList::show(list);
        ShownList::show(*view.viewport());
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

void readTitles(benchmark::State& state, const QString& folder)
{
    const std::vector<std::string> titles = filesOf(folder, "*.xml");
    for ([[maybe_unused]] auto _ : state)
        if (!BareFiles::load(titles))
            state.SkipWithError("a title cannot be read");
}

void readTitlesAndPictures(benchmark::State& state, const QString& folder)
{
    const std::vector<std::string> titles = filesOf(folder, "*.xml");
    const std::vector<std::string> pictures = filesOf(folder, "*_240.png");
    for ([[maybe_unused]] auto _ : state)
        if (!BareFiles::load(titles) || !BareFiles::decode(pictures))
            state.SkipWithError("a file cannot be read");
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
        {"title_tap", 0, PairList::Clock::Cpu, TAP_LIMIT}, benchmark::kMillisecond,
        [place](benchmark::State& state) { tapTitle(state, *place); },
        [place](benchmark::State& state) { showPlainTitle(state, *place); });
    list.add(
        {"folder_open", OPEN_AIM, PairList::Clock::Wall}, benchmark::kMillisecond,
        [place](benchmark::State& state) { openFolder(state, titleFolder(*place)); },
        [place](benchmark::State& state) { readTitlesAndPictures(state, titleFolder(*place)); });
    list.add(
        {"folder_first_screen", FIRST_SCREEN_AIM, PairList::Clock::Wall}, benchmark::kMillisecond,
        [place](benchmark::State& state) { openFirstScreen(state, titleFolder(*place)); },
        [place](benchmark::State& state) { readTitles(state, titleFolder(*place)); });
    list.add(
        {"long_folder_first_screen", 0, PairList::Clock::Wall, LONG_FIRST_SCREEN_LIMIT},
        benchmark::kMillisecond,
        [place](benchmark::State& state) { openFirstScreen(state, folderOf(*place, LONG_TITLES)); },
        [place](benchmark::State& state) { readTitles(state, titleFolder(*place)); });
    list.addGrowth({"first_screen_of_titles",
                    FIRST_SCREEN_EXPONENT,
                    PairList::Clock::Wall,
                    {10, TITLES, LONG_TITLES, 9998},
                    "titles"},
                   benchmark::kMillisecond, [place](benchmark::State& state, long titles) {
                       openFirstScreen(state, folderOf(*place, titles));
                   });
}
