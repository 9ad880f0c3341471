// Reading and writing title files, compared with the XML library alone on the same files.
#include "bench/BareFiles.h"
#include "bench/BenchEnvironment.h"
#include "bench/BenchTitles.h"
#include "bench/PairList.h"
#include "bench/Topics.h"
#include "document/TitleParser.h"
#include "support/FileSyncQueue.h"

#include <chrono>
#include <memory>
#include <tinyxml.h>

namespace
{

constexpr double AIM = 1.3;
constexpr double EXPONENT = 1.1;
constexpr int CHARACTERS = 300;
constexpr int FOLDER_TITLES = 99;
constexpr std::chrono::seconds SYNC_TIME(10);

bool writeTitle(const std::string& path, int characters, int texts)
{
    Archive archive = BenchTitles::title(path, characters, 24, texts);
    return TitleParser().writeOneTitle(&archive) == 1;
}

void readAndWrite(benchmark::State& state, const std::string& path, int characters, int texts)
{
    if (!writeTitle(path, characters, texts))
        state.SkipWithError("the title cannot be written");
    TitleParser parser;
    for ([[maybe_unused]] auto _ : state) {
        Archive archive;
        if (parser.readOneTitle(path, &archive) != 1 ||
            archive.text().size() != static_cast<std::size_t>(texts) || parser.writeOneTitle(&archive) != 1) {
            state.SkipWithError("the title does not come back");
            break;
        }
        // Waits outside the measurement until the background thread has synced the file, since operators do
        // not save a title again at once.
        state.PauseTiming();
        FileSyncQueue::flush(SYNC_TIME);
        state.ResumeTiming();
    }
}

void loadAndSave(benchmark::State& state, const std::string& path)
{
    if (!writeTitle(path, CHARACTERS, BenchTitles::TEXTS))
        state.SkipWithError("the title cannot be written");
    for ([[maybe_unused]] auto _ : state) {
        TiXmlDocument document;
        if (!document.LoadFile(path.c_str()) || !document.SaveFile()) {
            state.SkipWithError("the file does not come back");
            break;
        }
    }
}

void readFolder(benchmark::State& state, const std::string& folder, std::size_t count)
{
    TitleParser parser;
    for ([[maybe_unused]] auto _ : state) {
        const std::vector<Archive*> titles = parser.getFilsByOrderInFolder(folder);
        const std::vector<std::unique_ptr<Archive>> owner(titles.begin(), titles.end());
        if (titles.size() != count) {
            state.SkipWithError("titles are missing");
            break;
        }
    }
}

void loadFiles(benchmark::State& state, const std::vector<std::string>& paths)
{
    for ([[maybe_unused]] auto _ : state)
        if (!BareFiles::load(paths))
            state.SkipWithError("a file cannot be read");
}

// Returns the titles of the folder, which are written when they are asked for first.
const std::vector<std::string>& titlesIn(const std::string& folder)
{
    static const std::vector<std::string> paths = BenchTitles::writeFolder(folder, FOLDER_TITLES);
    return paths;
}

} // namespace

void Topics::addTitleFiles(PairList& list, const BenchEnvironment& environment)
{
    const std::string one = environment.makeFolder(QStringLiteral("one")).toStdString();
    list.add(
        {"title_read_write", AIM, PairList::Clock::Wall}, benchmark::kMillisecond,
        [one](benchmark::State& state) {
            readAndWrite(state, one + "/ours.xml", CHARACTERS, BenchTitles::TEXTS);
        },
        [one](benchmark::State& state) { loadAndSave(state, one + "/floor.xml"); });
    list.addGrowth({"title_read_write_of_characters",
                    EXPONENT,
                    PairList::Clock::Wall,
                    {10, CHARACTERS, 1200},
                    "characters"},
                   benchmark::kMillisecond, [one](benchmark::State& state, long characters) {
                       const int texts = BenchTitles::textsFor(characters);
                       readAndWrite(state, one + "/growing.xml", static_cast<int>(characters) / texts, texts);
                   });

    const std::string folder = environment.makeFolder(QStringLiteral("folder")).toStdString();
    list.add(
        {"folder_load", AIM, PairList::Clock::Wall}, benchmark::kMillisecond,
        [folder](benchmark::State& state) { readFolder(state, folder, titlesIn(folder).size()); },
        [folder](benchmark::State& state) { loadFiles(state, titlesIn(folder)); });
}
