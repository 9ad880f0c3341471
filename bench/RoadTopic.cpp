// The whole road of a changed title that the operator leaves, to its four picture files on the disk. Compared
// with drawing, reducing, encoding and writing the same pictures by the libraries alone.
#include "bench/BareFiles.h"
#include "bench/BenchEnvironment.h"
#include "bench/BenchTitles.h"
#include "bench/FastPng.h"
#include "bench/PairList.h"
#include "bench/PlainTitle.h"
#include "bench/TitleEditor.h"
#include "bench/Topics.h"
#include "document/ArchiveController.h"
#include "library/ArchiveItem.h"
#include "library/ThumbnailRender.h"
#include "support/FileSyncQueue.h"

#include <QFile>
#include <QImage>
#include <array>
#include <chrono>
#include <memory>
#include <utility>
#include <vector>

namespace
{

constexpr double TEXTS_LIMIT = 20; // milliseconds of all threads
constexpr double PHOTOGRAPH_LIMIT = 60;
constexpr double OUTLINED_LIMIT = 30;
constexpr std::chrono::seconds SYNC_TIME(10);
constexpr int OUTLINED_CHARACTERS = 300;
constexpr std::array SUFFIXES = {"_1920.png", "_960.png", "_240S.png", "_240.png"};

enum class Kind { Texts, Photograph, Outlined };

Archive makeTitle(const std::string& path, Kind kind)
{
    constexpr int CHARACTERS = 24;
    constexpr int SIZE = 96;
    if (kind != Kind::Outlined)
        return BenchTitles::title(path, CHARACTERS, SIZE);
    Archive archive = BenchTitles::title(path, 0, SIZE, 0);
    archive.setText(
        {BenchTitles::text(1, 10, 10, {.characters = OUTLINED_CHARACTERS, .size = 48, .edgeWidth = 4})
             .release()});
    return archive;
}

// Fills an empty folder with one title.
void fillFolder(const QString& folder, Kind kind)
{
    const std::string path = BenchTitles::writeFolder(folder.toStdString(), 1).front();
    Archive archive = makeTitle(path, kind);
    if (kind == Kind::Photograph)
        BenchTitles::illustrate(archive, BenchTitles::photograph(ThumbnailRender::THUMBNAIL_BIG_SIZE));
    ArchiveController().saveNewArchive(folder, &archive);
}

QString pictureOf(const TitleEditor& editor, const char* suffix)
{
    return editor.shown.list.archiveItem(0)->getArchiveDataPath().chopped(4) + QLatin1String(suffix);
}

void leaveTitle(benchmark::State& state, const QString& folder)
{
    TitleEditor editor(folder, std::make_unique<ThumbnailRender>());
    const auto leave = [&] {
        editor.scene.saveArchiveFlag(); // marks the title as changed
        editor.scene.leaveTitle();
        if (!editor.scene.waitForPictures())
            state.SkipWithError("the pictures are not written");
        FileSyncQueue::flush(SYNC_TIME);
    };
    leave(); // other pairs have taken the place of its glyphs
    for ([[maybe_unused]] auto _ : state) {
        leave();
        state.PauseTiming();
        for (const char* suffix : SUFFIXES)
            if (!QFile::remove(pictureOf(editor, suffix)))
                state.SkipWithError("a picture is missing");
        state.ResumeTiming();
    }
}

// What the libraries need for the same pictures.
class PlainRoad
{
public:
    explicit PlainRoad(Kind kind) : m_title(makeTitle("/floor.xml", kind), 1)
    {
        if (kind == Kind::Photograph)
            m_background = BenchTitles::photograph(SIZE).convertToFormat(QImage::Format_ARGB32_Premultiplied);
        const QImage picture = m_title.draw(SIZE, m_background);
        m_encoders.push_back(FastPng::fastestFor(picture, BareFiles::processors()));
        for (const QImage& reduced : PlainTitle::reduced(picture))
            m_encoders.push_back(FastPng::fastestFor(reduced, 1));
    }

    // Returns false when a file cannot be written.
    bool makePictures(const QString& folder) const
    {
        const QImage big = m_title.draw(SIZE, m_background);
        benchmark::DoNotOptimize(PlainTitle::reduced(big));
        // The pictures are equal each time, and the encoders know them.
        bool isWritten = true;
        for (std::size_t i = 0; i < m_encoders.size(); ++i)
            isWritten = BareFiles::write(folder + QStringLiteral("/floor") + QLatin1String(SUFFIXES[i]),
                                         m_encoders[i]->encode()) &&
                        isWritten;
        return isWritten;
    }

private:
    static constexpr QSize SIZE{1920, 1080};

    PlainTitle m_title;
    QImage m_background;
    std::vector<std::unique_ptr<FastPng>> m_encoders;
};

// The titles of one pair, which are made when it is measured first.
struct Titles {
    Titles(const QString& path, Kind titleKind) : folder(path), kind(titleKind) {}

    QString folder;
    Kind kind;
    bool isFilled = false;
    std::unique_ptr<PlainRoad> plain;
};

void measureOurs(benchmark::State& state, Titles& titles)
{
    if (!std::exchange(titles.isFilled, true))
        fillFolder(titles.folder, titles.kind);
    leaveTitle(state, titles.folder);
}

void measurePlain(benchmark::State& state, Titles& titles)
{
    if (!titles.plain)
        titles.plain = std::make_unique<PlainRoad>(titles.kind);
    for ([[maybe_unused]] auto _ : state)
        if (!titles.plain->makePictures(titles.folder))
            state.SkipWithError("a picture cannot be written");
}

} // namespace

void Topics::addRoad(PairList& list, const BenchEnvironment& environment)
{
    const auto add = [&](const char* name, double limit, Kind kind) {
        const auto titles = std::make_shared<Titles>(environment.makeFolder(QString::fromLatin1(name)), kind);
        list.add(
            {name, 0, PairList::Clock::Process, limit}, benchmark::kMillisecond,
            [titles](benchmark::State& state) { measureOurs(state, *titles); },
            [titles](benchmark::State& state) { measurePlain(state, *titles); });
    };
    add("road_texts", TEXTS_LIMIT, Kind::Texts);
    add("road_photograph", PHOTOGRAPH_LIMIT, Kind::Photograph);
    add("road_outlined", OUTLINED_LIMIT, Kind::Outlined);
}
