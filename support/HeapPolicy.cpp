#include "support/HeapPolicy.h"

#include <malloc.h>

void HeapPolicy::keepFlat()
{
    constexpr int LARGE_BLOCK = 256 * 1024;
    constexpr int HEAPS = 2;
    mallopt(M_MMAP_THRESHOLD, LARGE_BLOCK);
    mallopt(M_TRIM_THRESHOLD, LARGE_BLOCK);
    mallopt(M_ARENA_MAX, HEAPS);
}
