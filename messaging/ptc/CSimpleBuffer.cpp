#include "messaging/ptc/CSimpleBuffer.h"

#include <algorithm>
#include <climits>
#include <cstdlib>
#include <cstring>

void* myMalloc(unsigned long size)
{
    return std::malloc(size);
}

void myFree(void* memory)
{
    std::free(memory);
}

unsigned long CSimpleBuffer::s_minimum_allocate_unit = 4;
simplebuffer_alloc CSimpleBuffer::s_allocate_function = myMalloc;
simplebuffer_free CSimpleBuffer::s_free_function = myFree;

void CSimpleBuffer::simplebuffer_system_init(unsigned long minimumUnit, simplebuffer_alloc allocate,
                                             simplebuffer_free release)
{
    s_minimum_allocate_unit = minimumUnit;
    s_allocate_function = allocate;
    s_free_function = release;
}

void CSimpleBuffer::simplebuffer_init(simplebuffer* buffer, unsigned char* data, unsigned long size)
{
    buffer->size = size;
    buffer->data = data;
    buffer->capacity = 0;
}

unsigned char* CSimpleBuffer::simplebuffer_checksize(simplebuffer* buffer, unsigned long n)
{
    if (n > ULONG_MAX - buffer->size)
        return nullptr;
    const unsigned long end = buffer->size + n;
    if (end > buffer->capacity) {
        const unsigned long spare = std::max(n, s_minimum_allocate_unit);
        if (spare > ULONG_MAX - end)
            return nullptr;
        auto* storage = static_cast<unsigned char*>(s_allocate_function(end + spare));
        if (storage == nullptr)
            return nullptr;
        if (buffer->size != 0)
            std::memcpy(storage, buffer->data, buffer->size);
        if (buffer->capacity != 0)
            s_free_function(buffer->data);
        buffer->data = storage;
        buffer->capacity = end + spare;
    }
    unsigned char* place = buffer->data + buffer->size;
    buffer->size = end;
    return place;
}

bool CSimpleBuffer::simplebuffer_write(simplebuffer* buffer, const unsigned char* data, unsigned long n)
{
    if (n == 0)
        return true;
    unsigned char* place = simplebuffer_checksize(buffer, n);
    if (place == nullptr)
        return false;
    std::memcpy(place, data, n);
    return true;
}

unsigned char* CSimpleBuffer::simplebuffer_release(simplebuffer* buffer)
{
    unsigned char* data = buffer->data;
    *buffer = simplebuffer();
    return data;
}

void CSimpleBuffer::simplebuffer_destroy(simplebuffer* buffer)
{
    if (buffer->capacity != 0)
        s_free_function(buffer->data);
    *buffer = simplebuffer();
}
