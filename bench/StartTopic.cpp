// The start of the process up to a listening port and up to the answer to its first request, with the
// siblings running, compared with a program that shows and hides an empty window.
#include "bench/BenchEnvironment.h"
#include "bench/BenchTitles.h"
#include "bench/PairList.h"
#include "bench/PeerProcess.h"
#include "bench/Topics.h"
#include "messaging/ptc/SocketFrame.h"
#include "support/IPathManagerEx.h"

#include <QDeadlineTimer>
#include <QThread>
#include <cerrno>
#include <netinet/in.h>
#include <sys/resource.h>
#include <sys/socket.h>
#include <unistd.h>

namespace
{

constexpr double AIM = 2.0;
constexpr double ANSWER_AIM = 2.5;
constexpr int START_TIME = 60000;                   // milliseconds
constexpr unsigned long POLL = 200;                 // microseconds
const QByteArray READY = "{\"event\":\"ready\"}\n"; // the appliance's first line
const QByteArray ANSWER = "\"setTopWindow\"";       // the first call of a titler that shows itself
constexpr long MAIN = 1000;
constexpr long SUB_PANEL = 1002;
constexpr long TITLER = 1003;

QString program(const char* name)
{
    return BenchEnvironment::binaryFolder() + QLatin1Char('/') + QLatin1String(name);
}

// Checks by binding the port for a moment, which fails only when somebody listens. A connection would keep
// the listener busy, and reading the kernel's table of sockets takes longer than the start of the titler.
bool isListening(long client)
{
    const int descriptor = ::socket(AF_INET, SOCK_STREAM | SOCK_CLOEXEC, 0);
    const int reuse = 1;
    ::setsockopt(descriptor, SOL_SOCKET, SO_REUSEADDR, &reuse, sizeof reuse);
    sockaddr_in address{};
    address.sin_family = AF_INET;
    address.sin_port = htons(quint16(SocketFrame::portOf(client)));
    address.sin_addr.s_addr = htonl(INADDR_LOOPBACK);
    const int result = ::bind(descriptor, reinterpret_cast<const sockaddr*>(&address), sizeof address);
    const bool refused = result != 0 && errno == EADDRINUSE;
    ::close(descriptor);
    return refused;
}

bool waitListening(long client)
{
    const QDeadlineTimer deadline(START_TIME);
    while (!isListening(client)) {
        if (deadline.hasExpired())
            return false;
        QThread::usleep(POLL);
    }
    return true;
}

// Creates what the titler needs on the appliance: pictures, templates and folders.
bool provide()
{
    static const bool done = [] {
        PeerProcess provision;
        return provision.start(program("titler_provision")) && provision.finished(START_TIME);
    }();
    return done;
}

void startTitler(benchmark::State& state)
{
    if (!provide()) {
        state.SkipWithError("the data path cannot be filled");
        return;
    }
    for ([[maybe_unused]] auto _ : state) {
        state.PauseTiming();
        {
            PeerProcess appliance;
            PeerProcess titler;
            bool listens = appliance.start(program("appliance"), {QStringLiteral("--stay")}) &&
                           waitListening(MAIN) && waitListening(SUB_PANEL);
            state.ResumeTiming();
            listens = listens && titler.start(program("titler")) && waitListening(TITLER);
            state.PauseTiming();
            if (!listens)
                state.SkipWithError("the programs do not listen");
        }
        state.ResumeTiming();
    }
}

// Returns the processor time in seconds of the child processes that have ended.
double timeOfEndedChildren()
{
    rusage usage{};
    ::getrusage(RUSAGE_CHILDREN, &usage);
    const auto seconds = [](const timeval& time) { return double(time.tv_sec) + double(time.tv_usec) / 1e6; };
    return seconds(usage.ru_utime) + seconds(usage.ru_stime);
}

// Returns the path of a title in the data path of the titler.
QString requestedTitle()
{
    static const std::string path = [] {
        const std::wstring titles = IPathManagerEx::getInstance()->getTitleResourcesPath();
        const std::string folder = QString::fromStdWString(titles).toStdString() + "/Requested";
        return BenchTitles::writeFolder(folder, 1).front();
    }();
    return QString::fromStdString(path);
}

// Measures processor time: the titler takes two connections a second, so the time on the clock depends on
// which sibling connects first.
void answerFirstRequest(benchmark::State& state)
{
    if (!provide()) {
        state.SkipWithError("the data path cannot be filled");
        return;
    }
    const QByteArray request = "wait-titler\nedit \"" + requestedTitle().toUtf8() + "\"\n";
    for ([[maybe_unused]] auto _ : state) {
        PeerProcess appliance;
        if (!appliance.startAndAwait(program("appliance"), {QStringLiteral("--stay")}, READY) ||
            !waitListening(SUB_PANEL)) {
            state.SkipWithError("the siblings do not listen");
            break;
        }
        const double before = timeOfEndedChildren();
        {
            PeerProcess titler;
            appliance.process().write(request);
            if (!titler.start(program("titler")) || !appliance.awaitLine(ANSWER)) {
                state.SkipWithError("the titler does not answer");
                break;
            }
        }
        state.SetIterationTime(timeOfEndedChildren() - before);
    }
}

void showBareWindow(benchmark::State& state)
{
    for ([[maybe_unused]] auto _ : state) {
        const double before = timeOfEndedChildren();
        {
            PeerProcess window;
            if (!window.startAndAwait(program("bare_window"), {}, "hidden\n") || !window.finished(START_TIME))
                state.SkipWithError("the window does not show");
        }
        state.SetIterationTime(timeOfEndedChildren() - before);
    }
}

void startBareWindow(benchmark::State& state)
{
    for ([[maybe_unused]] auto _ : state) {
        PeerProcess window;
        if (!window.startAndAwait(program("bare_window"), {}, "hidden\n"))
            state.SkipWithError("the window does not show");
        state.PauseTiming();
        window.finished(START_TIME);
        state.ResumeTiming();
    }
}

} // namespace

void Topics::addStart(PairList& list)
{
    list.add({"start_to_listening", AIM, PairList::Clock::Wall}, benchmark::kMillisecond, startTitler,
             startBareWindow);
    list.add({"first_answer", ANSWER_AIM, PairList::Clock::Children}, benchmark::kMillisecond,
             answerFirstRequest, showBareWindow);
}
