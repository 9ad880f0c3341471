// Pasting a title with a photograph as background while the pictures of the previous title are still to be
// made.
#include "bench/BenchEnvironment.h"
#include "bench/BenchTitles.h"
#include "bench/PairList.h"
#include "bench/PlainTitle.h"
#include "bench/TitleEditor.h"
#include "bench/Topics.h"
#include "canvas/TextObjectConstants.h"
#include "document/ArchiveController.h"
#include "document/ITitleChangeReporter.h"
#include "library/ArchiveAction.h"
#include "library/ThumbnailRender.h"
#include "support/FileSyncQueue.h"

#include <QCoreApplication>
#include <QDir>
#include <QElapsedTimer>
#include <QFile>
#include <QFileInfo>
#include <algorithm>
#include <atomic>
#include <chrono>

namespace
{

constexpr double PASTE_AIM = 3.0;
constexpr double LONGEST_STEP = 50; // milliseconds
constexpr double NANOSECONDS = 1e9;
constexpr std::chrono::seconds SYNC_TIME(10);
constexpr int CHARACTERS = 40;
constexpr int CHARACTER_SIZE = 48;
const QSize AIR(1920, 1080);

// Makes a folder of two titles with different photographs.
QString photographFolder(const BenchEnvironment& environment)
{
    static const QString folder = [&environment] {
        const QString path = environment.makeFolder(QStringLiteral("paste"));
        QImage photograph = BenchTitles::photograph(AIR);
        for (const std::string& title : BenchTitles::writeFolder(path.toStdString(), 2)) {
            Archive archive = BenchTitles::title(title, CHARACTERS, CHARACTER_SIZE);
            BenchTitles::illustrate(archive, photograph);
            ArchiveController().saveNewArchive(path, &archive);
            photograph.mirror();
        }
        return path;
    }();
    return folder;
}

// Counts the titles whose pictures were written.
class PictureCount : public ITitleChangeReporter
{
public:
    PictureCount() { ITitleChangeReporter::setInstance(this); }
    ~PictureCount() override { ITitleChangeReporter::setInstance(nullptr); }
    int count() const { return m_count; }

    void changeTitlerStatus(FileManagerDefine::emTITLECHANGE_TYPE change, QString) override
    {
        if (change == FileManagerDefine::TITLE_PICTURES_CHANGED)
            ++m_count;
    }

private:
    std::atomic<int> m_count = 0;
};

// Calls, then runs the event loop until everything that follows is painted and the pictures of one title are
// written. Returns the longest pass in seconds.
template <typename Call>
double longestPass(TitleEditor& editor, const PictureCount& pictures, Call call)
{
    const int before = pictures.count();
    QMetaObject::invokeMethod(&editor.scene, call, Qt::QueuedConnection);
    double longest = 0;
    const auto measure = [&longest](auto pass) {
        QElapsedTimer time;
        time.start();
        pass();
        longest = std::max(longest, static_cast<double>(time.nsecsElapsed()) / NANOSECONDS);
    };
    bool isWritten = false;
    do {
        isWritten = pictures.count() > before;
        measure([] { QCoreApplication::processEvents(); });
        for (QWidget* window :
             {static_cast<QWidget*>(&editor.shown.list), static_cast<QWidget*>(&editor.view)})
            measure([window] { QCoreApplication::sendPostedEvents(window, QEvent::UpdateRequest); });
    } while (!isWritten);
    return longest;
}

void pasteTitle(benchmark::State& state, const BenchEnvironment& environment)
{
    const PictureCount pictures;
    TitleEditor editor(photographFolder(environment), std::make_unique<ThumbnailRender>());
    ArchiveList& list = editor.shown.list;
    ArchiveAction copy(QString(), ArchiveAction::ACTION_COPY, nullptr);
    ArchiveAction paste(QString(), ArchiveAction::ACTION_PASTE, nullptr);
    list.selectOperationArchive(1); // the canvas shows the other title
    list.selectOptionMenuItem(&copy);
    for ([[maybe_unused]] auto _ : state) {
        editor.scene.saveArchiveFlag(); // marks the previous title as changed
        state.SetIterationTime(longestPass(editor, pictures, [&] { list.selectOptionMenuItem(&paste); }));
        if (list.count() != 3)
            state.SkipWithError("the title was not pasted");
        longestPass(editor, pictures, [&editor] { editor.undo.undo(); });
        list.synchronizationFolderFile();
        // Waits for the disk, since an operator pastes less often than it writes.
        FileSyncQueue::flush(SYNC_TIME);
    }
}

// Measures the floor: copies the files of the title, and lays out and draws its texts over its background.
void copyAndDraw(benchmark::State& state, const BenchEnvironment& environment)
{
    const QString folder = photographFolder(environment);
    const QFileInfo title(QDir(folder).entryInfoList({QStringLiteral("*.xml")}, QDir::Files).constFirst());
    const QFileInfoList files =
        QDir(folder).entryInfoList({title.completeBaseName() + QLatin1Char('*')}, QDir::Files);
    const QString target = environment.makeFolder(QStringLiteral("copies")) + QLatin1Char('/');
    const PlainTitle texts(BenchTitles::title(title.filePath().toStdString(), CHARACTERS, CHARACTER_SIZE),
                           TextObjectConstants::SCENEPERCENTAGE);
    const QImage background = BenchTitles::photograph(TitleEditor::CANVAS);
    for ([[maybe_unused]] auto _ : state) {
        QElapsedTimer time;
        time.start();
        for (const QFileInfo& file : files)
            QFile::copy(file.filePath(), target + file.fileName());
        benchmark::DoNotOptimize(texts.draw(TitleEditor::CANVAS, background));
        state.SetIterationTime(static_cast<double>(time.nsecsElapsed()) / NANOSECONDS);
        for (const QFileInfo& file : files)
            QFile::remove(target + file.fileName());
    }
}

} // namespace

void Topics::addPaste(PairList& list, const BenchEnvironment& environment)
{
    const BenchEnvironment* place = &environment;
    list.add(
        {"paste_step", PASTE_AIM, PairList::Clock::Step, LONGEST_STEP}, benchmark::kMillisecond,
        [place](benchmark::State& state) { pasteTitle(state, *place); },
        [place](benchmark::State& state) { copyAndDraw(state, *place); });
}
