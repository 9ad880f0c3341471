#include "support/SystemSignalHandler.h"

#include "support/AlternateStack.h"
#include "support/k2sys/k2sys.h"

#include <QCoreApplication>
#include <QSocketNotifier>

#include <fcntl.h>
#include <sys/mman.h>
#include <unistd.h>

#include <atomic>
#include <cerrno>
#include <csignal>
#include <cstdlib>
#include <cstring>
#include <string>

namespace
{

struct SignalText {
    int number;
    const char* text;
};

// The entry with number 0 ends the list.
const SignalText SIGNALS[] = {
    {SIGSEGV, "Segmentation Fault"},
    {SIGBUS, "Bus Error"},
    {SIGFPE, "Floating Point Exception"},
    {SIGQUIT, "Keyboard Quit"},
    {SIGTERM, "Termination"},
    {SIGINT, "Interrupt"},
    {SIGALRM, "Alarm"},
    {SIGPIPE, "Broken Pipe"},
    {SIGPWR, "Power Button Pressed"},
    {SIGUSR1, ""},
    {SIGUSR2, "User Defined Signal #2"},
    {SIGABRT, "Aborted"},
    {0, nullptr},
};

const int TABLE_ENTRIES = 65;
const int LAST_HANDLED_SIGNAL = 15;
const unsigned TRACE_SECONDS = 10;
const std::size_t TABLE_BYTES = TABLE_ENTRIES * sizeof(const char*);

std::atomic<void (*)()> g_pCallBackFun{nullptr};
std::string g_strProcessName;
std::atomic<bool> g_bIsInited{false};
std::atomic<const char**> g_SignalMsgTable{nullptr};
std::atomic<int> g_wakeUpWriteEnd{-1};
std::atomic<bool> g_isTerminationRequested{false};

// Allocates the table in pages of its own: the fault handler frees it and cannot rely on the heap, which may
// be corrupt then.
const char** allocateTable()
{
    void* pages = mmap(nullptr, TABLE_BYTES, PROT_READ | PROT_WRITE, MAP_PRIVATE | MAP_ANONYMOUS, -1, 0);
    return pages == MAP_FAILED ? nullptr : static_cast<const char**>(pages);
}

const char* textOf(int number)
{
    for (const SignalText* entry = SIGNALS; entry->number != 0; ++entry)
        if (entry->number == number)
            return entry->text;
    return nullptr;
}

void callBack()
{
    if (void (*function)() = g_pCallBackFun.load())
        function();
}

// Termination requests do blocking work, which is not allowed in a signal handler; a pipe passes them to the
// event loop.
void createWakeUpPipe()
{
    if (QCoreApplication::instance() == nullptr || g_wakeUpWriteEnd.load() != -1)
        return;
    int ends[2];
    if (pipe2(ends, O_CLOEXEC | O_NONBLOCK) != 0)
        return;
    auto* notifier = new QSocketNotifier(ends[0], QSocketNotifier::Read, QCoreApplication::instance());
    QObject::connect(notifier, &QSocketNotifier::activated, notifier, [readEnd = ends[0]] {
        char bytes[64];
        while (read(readEnd, bytes, sizeof bytes) > 0) {
        }
        callBack();
    });
    QObject::connect(notifier, &QObject::destroyed, [ends] {
        g_wakeUpWriteEnd.store(-1);
        close(ends[1]);
        close(ends[0]);
    });
    g_wakeUpWriteEnd.store(ends[1]);
}

void requestTermination()
{
    g_isTerminationRequested.store(true);
    const int writeEnd = g_wakeUpWriteEnd.load();
    if (writeEnd == -1) {
        callBack();
        return;
    }
    const int savedError = errno;
    const char byte = 1;
    // If the pipe is full, a request is pending already.
    [[maybe_unused]] const ssize_t written = write(writeEnd, &byte, 1);
    errno = savedError;
}

// The functions from here to handleSignal call only async-signal-safe functions: the fault may have happened
// with any lock held and with a corrupt heap.

void setDefaultAction(int number)
{
    struct sigaction action {
    };
    action.sa_handler = SIG_DFL;
    sigemptyset(&action.sa_mask);
    sigaction(number, &action, nullptr);
}

// Ends the process even if the trace deadlocks on a lock that the interrupted thread holds.
void limitTraceTime()
{
    setDefaultAction(SIGALRM);
    sigset_t alarmOnly;
    sigemptyset(&alarmOnly);
    sigaddset(&alarmOnly, SIGALRM);
    pthread_sigmask(SIG_UNBLOCK, &alarmOnly, nullptr);
    alarm(TRACE_SECONDS);
}

void trace()
{
    limitTraceTime();
    k2sys_print_backtrace();
    if (const char** table = g_SignalMsgTable.exchange(nullptr))
        munmap(table, TABLE_BYTES);
    g_bIsInited.store(false);
}

void traceAndAbort()
{
    trace();
    struct sigaction action {
    };
    if (sigaction(SIGABRT, nullptr, &action) == 0 && action.sa_handler == handleSignal)
        setDefaultAction(SIGABRT); // one trace is enough
    std::abort();
}

// The process ends by the signal when the handler returns.
void traceAndEnd(int number)
{
    trace();
    setDefaultAction(number);
    raise(number);
}

} // namespace

void registerSystemSignalHandler(void (*callback)(), char const* processName)
{
    g_pCallBackFun.store(callback);
    g_strProcessName = processName != nullptr ? processName : "";
    createWakeUpPipe();
    AlternateStack::useInThisThread();
    if (g_bIsInited.load())
        return;
    const char** table = allocateTable();
    if (table == nullptr) {
        k2sys_syslog(3, "%s: %s", "malloc", std::strerror(errno));
        return;
    }
    for (int number = 0; number < TABLE_ENTRIES; ++number)
        table[number] = textOf(number);
    g_SignalMsgTable.store(table);
    for (const SignalText* entry = SIGNALS; entry->number != 0; ++entry) {
        struct sigaction action {
        };
        action.sa_handler = handleSignal;
        sigemptyset(&action.sa_mask);
        action.sa_flags = SA_ONSTACK;
        sigaction(entry->number, &action, nullptr);
    }
    g_bIsInited.store(true);
}

bool isTerminationRequested()
{
    return g_isTerminationRequested.load();
}

void handleSignal(int signalNumber)
{
    if (signalNumber > LAST_HANDLED_SIGNAL)
        return;
    switch (signalNumber) {
    case SIGQUIT:
    case SIGBUS:
    case SIGFPE:
    case SIGSEGV:
        traceAndAbort();
        break;
    case SIGABRT:
        traceAndEnd(signalNumber);
        break;
    case SIGINT:
    case SIGTERM:
        requestTermination();
        break;
    default:
        break;
    }
}
