// A stack of its own for the signal handlers of a thread, so that a fault can be reported that comes from the
// end of the thread's stack. Each thread needs one for itself.
#pragma once

#include <csignal>

class AlternateStack
{
public:
    // Gives the calling thread one until it ends. Does nothing where it has one, or where memory is short.
    static void useInThisThread();

    AlternateStack(const AlternateStack&) = delete;
    AlternateStack& operator=(const AlternateStack&) = delete;

private:
    AlternateStack();
    ~AlternateStack();

    void* mPages = nullptr;
};
