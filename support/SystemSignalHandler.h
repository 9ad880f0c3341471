// What the process does on signals: faults and aborts leave a stack trace and end it, termination requests
// call back.
#pragma once

// Installs the handler of the twelve signals, and a stack for it in the calling thread; other threads that
// want a trace also when their stack is full take one with AlternateStack. callback is called on SIGTERM and
// SIGINT: from the event loop of the thread that registered when a QCoreApplication exists there, and from
// within the signal handler otherwise. Null is allowed. A second call replaces callback and name. Call from
// the GUI thread.
void registerSystemSignalHandler(void (*callback)(), char const* processName);

// Whether SIGTERM or SIGINT has come, for waits that hold the event loop up. Any thread.
bool isTerminationRequested();

// The handler itself.
void handleSignal(int signalNumber);
