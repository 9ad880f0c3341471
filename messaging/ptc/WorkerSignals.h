// Signals of the process in the threads that serve its sockets.
#pragma once

namespace WorkerSignals
{

// Blocks every signal but faults in the calling thread: termination requests are for the main thread, and
// here they would only cut system calls short.
void leaveToMainThread();

} // namespace WorkerSignals
