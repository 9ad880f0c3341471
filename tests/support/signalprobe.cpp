// A program for the signal tests to signal: it registers the handler, says "ready" and tells what happens to
// it.
#include "support/AlternateStack.h"
#include "support/SystemSignalHandler.h"

#include <QCoreApplication>
#include <QThread>
#include <QTimer>

#include <sys/socket.h>
#include <unistd.h>

#include <csignal>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <memory>

namespace
{

void say(const char* text)
{
    std::puts(text);
    std::fflush(stdout);
}

void quitFromEventLoop()
{
    say(QThread::currentThread() == QCoreApplication::instance()->thread() ? "callback in the main thread"
                                                                           : "callback elsewhere");
    QCoreApplication::quit();
}

void endAtOnce()
{
    const char text[] = "callback in the handler\n";
    [[maybe_unused]] const ssize_t written = write(STDOUT_FILENO, text, sizeof text - 1);
    _exit(7);
}

void wrongCallback()
{
    say("the wrong callback");
}

int waitForSignals()
{
    say("ready");
    while (true)
        pause();
}

int runEventLoop(int argc, char** argv, bool twice)
{
    QCoreApplication application(argc, argv);
    if (twice)
        registerSystemSignalHandler(wrongCallback, "first");
    registerSystemSignalHandler(quitFromEventLoop, "probe");
    QTimer::singleShot(0, &application, [] { say("ready"); });
    const int result = QCoreApplication::exec();
    say("after the event loop");
    return result;
}

int surviveTheHarmless()
{
    registerSystemSignalHandler(nullptr, nullptr);
    for (const int number : {SIGALRM, SIGPIPE, SIGPWR, SIGUSR1, SIGUSR2, SIGTERM, SIGINT})
        raise(number);
    int ends[2];
    if (socketpair(AF_UNIX, SOCK_STREAM, 0, ends) != 0)
        return 1;
    close(ends[1]);
    const bool failed = write(ends[0], "x", 1) == -1; // raises SIGPIPE
    say(failed ? "alive" : "written");
    return 0;
}

int faultAfterFault()
{
    registerSystemSignalHandler(nullptr, "probe");
    // The abort of the first fault is caught once, so that a second fault finds the table gone.
    struct sigaction once {
    };
    once.sa_handler = [](int) {
        signal(SIGABRT, SIG_DFL);
        say("aborted once");
        handleSignal(SIGSEGV);
    };
    sigaction(SIGABRT, &once, nullptr);
    handleSignal(SIGBUS);
    return 0;
}

// Goes down until the stack ends.
int fillStack(int depth)
{
    volatile char block[4096];
    block[0] = static_cast<char>(depth);
    const int result = depth < 0 ? 0 : fillStack(depth + 1);
    return result + block[0];
}

void giveUp()
{
    std::abort();
}

void fillOwnStack()
{
    AlternateStack::useInThisThread(); // in the main thread the registration does
    say(fillStack(1) != 0 ? "the stack has no end" : "");
}

void fault()
{
    raise(SIGSEGV);
}

int endBy(void (*end)())
{
    registerSystemSignalHandler(nullptr, "probe");
    end();
    return 0;
}

int endInThreadBy(void (*end)())
{
    registerSystemSignalHandler(nullptr, "probe");
    std::unique_ptr<QThread> thread(QThread::create([end] { end(); }));
    thread->start();
    thread->wait();
    return 0;
}

} // namespace

int main(int argc, char** argv)
{
    const char* mode = argc > 1 ? argv[1] : "";
    if (std::strcmp(mode, "loop") == 0)
        return runEventLoop(argc, argv, false);
    if (std::strcmp(mode, "twice") == 0)
        return runEventLoop(argc, argv, true);
    if (std::strcmp(mode, "plain") == 0) {
        registerSystemSignalHandler(endAtOnce, "probe");
        return waitForSignals();
    }
    if (std::strcmp(mode, "harmless") == 0)
        return surviveTheHarmless();
    if (std::strcmp(mode, "again") == 0)
        return faultAfterFault();
    if (std::strcmp(mode, "abort") == 0)
        return endBy(giveUp);
    if (std::strcmp(mode, "abort-thread") == 0)
        return endInThreadBy(giveUp);
    if (std::strcmp(mode, "fault") == 0)
        return endBy(fault);
    if (std::strcmp(mode, "overflow") == 0)
        return endBy(fillOwnStack);
    if (std::strcmp(mode, "overflow-thread") == 0)
        return endInThreadBy(fillOwnStack);
    return 2;
}
