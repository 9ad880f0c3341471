#pragma once

// Sets the signal mask of the threads that serve sockets.
namespace WorkerSignals
{

// Blocks every signal except faults in the calling thread: termination requests are handled in the main
// thread and would only interrupt system calls here.
void leaveToMainThread();

} // namespace WorkerSignals
