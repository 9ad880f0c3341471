#pragma once

#include <csignal>

// Provides a separate stack for the signal handlers of one thread, so that a stack overflow in that thread
// can still be reported.
class AlternateStack
{
public:
    // Installs an alternate stack for the calling thread until the thread ends. Does nothing if the thread
    // has one already or if memory is short.
    static void useInThisThread();

    AlternateStack(const AlternateStack&) = delete;
    AlternateStack& operator=(const AlternateStack&) = delete;

private:
    AlternateStack();
    ~AlternateStack();

    void* m_pages = nullptr;
};
