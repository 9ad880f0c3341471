#pragma once

struct simplebuffer {
    unsigned long size = 0;        // bytes used
    unsigned char* data = nullptr; // storage
    unsigned long capacity = 0;    // bytes allocated; 0 if the buffer does not own data
};

using simplebuffer_alloc = void* (*)(unsigned long);
using simplebuffer_free = void (*)(void*);

void* myMalloc(unsigned long size);
void myFree(void* memory);

// The growing byte buffer that the packing functions use.
class CSimpleBuffer
{
public:
    // Sets the allocator of all buffers and the least number of bytes by which they grow. Call before any
    // packing.
    static void simplebuffer_system_init(unsigned long minimumUnit, simplebuffer_alloc allocate,
                                         simplebuffer_free release);
    // Wraps size bytes at data without owning them; null and 0 make an empty buffer.
    static void simplebuffer_init(simplebuffer* buffer, unsigned char* data, unsigned long size);
    // Reserves n bytes at the end and returns a pointer to them; null, with the buffer unchanged, if memory
    // is short.
    static unsigned char* simplebuffer_checksize(simplebuffer* buffer, unsigned long n);
    static bool simplebuffer_write(simplebuffer* buffer, const unsigned char* data, unsigned long n);
    // Passes ownership of the data to the caller and empties the buffer.
    static unsigned char* simplebuffer_release(simplebuffer* buffer);
    static void simplebuffer_destroy(simplebuffer* buffer);

    static unsigned long s_minimum_allocate_unit;
    static simplebuffer_alloc s_allocate_function;
    static simplebuffer_free s_free_function;
};
