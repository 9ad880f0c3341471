// Handling of signals: faults and aborts write a stack trace and end the process, termination requests call a
// function.
#pragma once

// Installs the handler for the twelve signals, and an alternate stack in the calling thread; other threads
// that want a trace even after a stack overflow use AlternateStack. callback is called on SIGTERM and SIGINT:
// from the event loop of the calling thread if a QCoreApplication exists, otherwise from the signal handler.
// It may be null. A second call replaces callback and name. Call from the GUI thread.
void registerSystemSignalHandler(void (*callback)(), char const* processName);

// Returns whether SIGTERM or SIGINT was received; for waits that block the event loop. Any thread.
bool isTerminationRequested();

// The signal handler itself.
void handleSignal(int signalNumber);
