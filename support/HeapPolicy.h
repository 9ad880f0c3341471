#pragma once

// How this process uses the heap.
namespace HeapPolicy
{

// Returns large blocks to the system at once. The program runs all day and renders a few large pictures at a
// time, which would otherwise enlarge the heaps of the GUI and picture threads permanently. Call before other
// threads are started.
void keepFlat();

} // namespace HeapPolicy
