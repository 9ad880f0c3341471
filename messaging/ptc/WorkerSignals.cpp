#include "messaging/ptc/WorkerSignals.h"

#include <csignal>
#include <initializer_list>

#include <pthread.h>

namespace WorkerSignals
{

void leaveToMainThread()
{
    sigset_t signals;
    sigfillset(&signals);
    for (const int fault : {SIGSEGV, SIGBUS, SIGFPE, SIGILL, SIGABRT})
        sigdelset(&signals, fault);
    pthread_sigmask(SIG_BLOCK, &signals, nullptr);
}

} // namespace WorkerSignals
