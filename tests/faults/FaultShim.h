#pragma once

#include <dlfcn.h>

// Calls the functions of the preloaded fault library. Without the library they do nothing.
namespace FaultShim
{

template <typename Function>
Function* find(const char* name)
{
    return reinterpret_cast<Function*>(::dlsym(RTLD_DEFAULT, name));
}

inline void start()
{
    if (auto* function = find<void()>("faults_start"))
        function();
}

// Stops the faults: later file operations succeed.
inline void stop()
{
    if (auto* function = find<void()>("faults_stop"))
        function();
}

inline long count()
{
    auto* function = find<long()>("faults_count");
    return function ? function() : 0;
}

// Returns the first operation that failed on purpose; empty when none did.
inline const char* hit()
{
    auto* function = find<const char*()>("faults_hit");
    return function ? function() : "";
}

} // namespace FaultShim
