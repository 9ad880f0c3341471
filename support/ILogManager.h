#pragma once

#include <cstdarg>
#include <cstdio>
#include <string>

// The operations of a log that the free functions of LogManager.h use.
class ILogManager
{
public:
    virtual ~ILogManager() = default;

    // Writes one line to the system log; priority as for syslog.
    virtual void logEvent(std::wstring module, int line, std::wstring text, int priority) = 0;
    // As above with a printf format, which is cut to 256 bytes before the arguments are inserted.
    virtual void logEvent(int priority, const char* module, int line, const char* format, va_list args) = 0;
    // Writes one formatted line to file, or nothing if file is null. Header and format together are cut to
    // 512 bytes.
    virtual void putLog(FILE* file, const char* module, int line, const char* format, va_list args) = 0;
    // Write one line to the operation log and to the debug log, respectively.
    virtual void logUserOperate(std::wstring area, int line, std::wstring text) = 0;
    virtual void logDebugOperate(std::wstring area, int line, std::wstring text) = 0;
};
