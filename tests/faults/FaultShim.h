// The preloaded shim as the program under it finds it; without it, nothing is counted and nothing fails.
#pragma once

#include <dlfcn.h>

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

// From here on the disk is well again.
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

// The first operation that was made to fail; empty when none was.
inline const char* hit()
{
    auto* function = find<const char*()>("faults_hit");
    return function ? function() : "";
}

} // namespace FaultShim
