// What the process does on signals: faults leave a stack trace and abort, termination requests call back.
#pragma once

// Installs the handler of the eleven signals. callback is called on SIGTERM and SIGINT: from the event loop
// of the thread that registered when a QCoreApplication exists there, and from within the signal handler
// otherwise. Null is allowed. A second call replaces callback and name. Call from the GUI thread.
void registerSystemSignalHandler(void (*callback)(), char const* processName);

// The handler itself.
void handleSignal(int signalNumber);
