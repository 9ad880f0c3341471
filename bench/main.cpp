// Measures the program against the least that the same work can cost.
//
//   titler_bench                 all pairs, then their ratios
//   titler_bench --strict        the same; the exit code is 1 when a pair misses its aim
//   titler_bench --memory [N]    resident memory over N sessions (500) instead
//   titler_bench --memory-list   resident memory with a long folder in the list instead
//   titler_bench --benchmark_... any option of Google Benchmark
#include "bench/BenchEnvironment.h"
#include "bench/BenchTitles.h"
#include "bench/CallPeer.h"
#include "bench/PairReporter.h"
#include "bench/Topics.h"

#include <QApplication>
#include <QFileInfo>
#include <algorithm>
#include <cstdio>
#include <cstdlib>
#include <cstring>
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

int writeTitles(const char* folder, const char* count)
{
    constexpr int TEXTS = 3; // leaves room for one more text
    const int wanted = std::atoi(count);
    return BenchTitles::writeIllustratedFolder(folder, wanted, TEXTS).size() ==
                   static_cast<std::size_t>(wanted)
               ? 0
               : 1;
}

bool takeOption(std::vector<char*>& arguments, const char* option)
{
    return std::erase_if(arguments, [option](const char* a) { return std::strcmp(a, option) == 0; }) > 0;
}

int runPairs(std::vector<char*> arguments, const BenchEnvironment& environment)
{
    const bool strict = takeOption(arguments, "--strict");
    // The sides of a pair alternate, so that a busy moment of the machine does not affect only one of them.
    // Options on the command line come later and take precedence.
    char repetitions[] = "--benchmark_repetitions=5";
    char interleaving[] = "--benchmark_enable_random_interleaving=true";
    char minimumTime[] = "--benchmark_min_time=0.2";
    arguments.insert(arguments.begin() + 1, {repetitions, interleaving, minimumTime});
    int count = static_cast<int>(arguments.size());
    arguments.push_back(nullptr);
    benchmark::Initialize(&count, arguments.data());
    if (benchmark::ReportUnrecognizedArguments(count, arguments.data()))
        return 2;

    PairList list;
    Topics::addRendering(list, environment);
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
    PairReporter reporter(list);
    benchmark::RunSpecifiedBenchmarks(&reporter);
    benchmark::Shutdown();
    return reporter.failed() || (strict && reporter.missed() > 0) ? 1 : 0;
}

} // namespace

int main(int argc, char* argv[])
{
    if (argc == 2 && (std::strcmp(argv[1], "--raw-peer") == 0 || std::strcmp(argv[1], "--call-peer") == 0))
        return runRole(argv[1], argc, argv);
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
    QApplication application(argc, argv);
    return runPairs(arguments, environment);
}
