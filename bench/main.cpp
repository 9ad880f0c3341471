// Measures the program against the least that the same work can cost.
//
//   titler_bench                 all pairs, then their ratios
//   titler_bench --strict        the same; the exit code is 1 when a pair misses its aim
//   titler_bench --table FILE    the same, and writes the results into the tables of a document
//   titler_bench --check-document FILE  compares the pairs of a document's tables with those of the program
//   titler_bench --peers [FILE]  a batch of titles beside other programs; writes it into a document's table
//   titler_bench --memory [N]    resident memory over N sessions (500) instead
//   titler_bench --memory-list   resident memory with a long folder in the list instead
//   titler_bench --benchmark_... any option of Google Benchmark
#include "bench/BenchDocument.h"
#include "bench/BenchEnvironment.h"
#include "bench/BenchTitles.h"
#include "bench/CallPeer.h"
#include "bench/ClosingWindow.h"
#include "bench/MachineLoad.h"
#include "bench/PairReporter.h"
#include "bench/PeerBatch.h"
#include "bench/PeerComparison.h"
#include "bench/Topics.h"
#include "support/HeapPolicy.h"

#include <QApplication>
#include <QFileInfo>
#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <string>
#include <unistd.h>
#include <vector>

namespace
{

int runRole(const char* role, int argc, char* argv[])
{
    QCoreApplication application(argc, argv);
    if (std::strcmp(role, "--raw-peer") == 0)
        return RawPeer::run();
    CallPeer peer;
    return peer.run();
}

// Runs the script that drives the programs by mouse and keys on a display.
int runMemory(const char* argument)
{
    const QByteArray build = QFileInfo(BenchEnvironment::binaryFolder()).path().toLocal8Bit();
    execlp("python3", "python3", "-B", TITLER_MEMORY_SCRIPT, build.constData(), argument, nullptr);
    std::perror("python3");
    return 2;
}

// Makes the pictures of some titles of the comparison with other programs.
int runBatch(int argc, char* argv[])
{
    HeapPolicy::keepFlat();
    QApplication application(argc, argv);
    const auto draw = std::strcmp(argv[1], "--batch-titler") == 0 ? PeerBatch::drawOurs : PeerBatch::drawByQt;
    return draw(QString::fromLocal8Bit(argv[2]), std::atoi(argv[3]), std::atoi(argv[4]));
}

int comparePeers(const char* document, const BenchEnvironment& environment)
{
    PeerComparison comparison(environment.makeFolder(QStringLiteral("peers")));
    const MachineLoad load;
    const bool isDone = comparison.run();
    const std::string machine = MachineLoad::describe(load.shares());
    std::printf("%s\n", machine.c_str());
    const bool isWritten = !document || BenchDocument(document).writePeers(comparison.table(), machine);
    return isDone && isWritten ? 0 : 1;
}

int writeTitles(const char* folder, const char* count)
{
    constexpr int TEXTS = 3; // leaves room for one more text
    const int wanted = std::atoi(count);
    return BenchTitles::writeIllustratedFolder(folder, wanted, TEXTS).size() ==
                   static_cast<std::size_t>(wanted)
               ? 0
               : 1;
}

// Takes an option with a value; null when it is not there.
const char* takeValue(std::vector<char*>& arguments, const char* option)
{
    const auto found = std::find_if(arguments.begin(), arguments.end(),
                                    [option](const char* a) { return std::strcmp(a, option) == 0; });
    if (found == arguments.end() || found + 1 == arguments.end())
        return nullptr;
    const char* value = *(found + 1);
    arguments.erase(found, found + 2);
    return value;
}

bool takeOption(std::vector<char*>& arguments, const char* option)
{
    return std::erase_if(arguments, [option](const char* a) { return std::strcmp(a, option) == 0; }) > 0;
}

void addPairs(PairList& list, const BenchEnvironment& environment)
{
    Topics::addRoad(list, environment);
    Topics::addClosing(list);
    Topics::addRendering(list, environment);
    Topics::addStyles(list);
    Topics::addPictures(list, environment);
    Topics::addTyping(list);
    Topics::addPanel(list);
    Topics::addEditing(list);
    Topics::addTitleFiles(list, environment);
    Topics::addList(list, environment);
    Topics::addPaste(list, environment);
    Topics::addFilter(list);
    Topics::addMessaging(list);
    Topics::addStart(list);
}

int runPairs(std::vector<char*> arguments, const BenchEnvironment& environment)
{
    const bool strict = takeOption(arguments, "--strict");
    const char* document = takeValue(arguments, "--table");
    // The sides of a pair alternate, so that a busy moment of the machine does not affect only one of them.
    // Options on the command line come later and take precedence.
    char repetitions[] = "--benchmark_repetitions=9";
    char interleaving[] = "--benchmark_enable_random_interleaving=true";
    char minimumTime[] = "--benchmark_min_time=0.1";
    arguments.insert(arguments.begin() + 1, {repetitions, interleaving, minimumTime});
    int count = static_cast<int>(arguments.size());
    arguments.push_back(nullptr);
    benchmark::Initialize(&count, arguments.data());
    if (benchmark::ReportUnrecognizedArguments(count, arguments.data()))
        return 2;

    PairList list;
    addPairs(list, environment);
    PairReporter reporter(list);
    const MachineLoad load;
    benchmark::RunSpecifiedBenchmarks(&reporter);
    benchmark::Shutdown();
    const std::string machine = MachineLoad::describe(load.shares());
    std::printf("\n%s\n", machine.c_str());
    if (reporter.failed())
        return 1;
    if (document && !BenchDocument(document).writeResults(reporter, machine))
        return 2;
    return strict && reporter.missed() > 0 ? 1 : 0;
}

int checkDocument(const char* path, const BenchEnvironment& environment)
{
    PairList list;
    addPairs(list, environment);
    return BenchDocument(path).names(list) ? 0 : 1;
}

} // namespace

int main(int argc, char* argv[])
{
    if (argc == 2 && (std::strcmp(argv[1], "--raw-peer") == 0 || std::strcmp(argv[1], "--call-peer") == 0))
        return runRole(argv[1], argc, argv);
    if (argc == 5 && std::strncmp(argv[1], "--batch-", 8) == 0)
        return runBatch(argc, argv);
    if (argc == 2 && std::strcmp(argv[1], "--closing-window") == 0)
        return ClosingWindow::run(argc, argv);
    if (argc == 4 && std::strcmp(argv[1], "--write-titles") == 0)
        return writeTitles(argv[2], argv[3]);
    if (argc >= 2 && std::strcmp(argv[1], "--memory") == 0)
        return runMemory(argc > 2 ? argv[2] : nullptr);
    if (argc == 2 && std::strcmp(argv[1], "--memory-list") == 0)
        return runMemory("--list");
    const std::vector<char*> arguments(argv, argv + argc);
    const BenchEnvironment environment;
    if (!environment.isValid())
        return 2;
    if (argc >= 2 && std::strcmp(argv[1], "--peers") == 0)
        return comparePeers(argc > 2 ? argv[2] : nullptr, environment);
    HeapPolicy::keepFlat(); // as the program
    QApplication application(argc, argv);
    if (argc == 3 && std::strcmp(argv[1], "--check-document") == 0)
        return checkDocument(argv[2], environment);
    return runPairs(arguments, environment);
}
