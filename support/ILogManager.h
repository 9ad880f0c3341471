// What the free functions of LogManager.h need of a log.
#pragma once

#include <cstdarg>
#include <cstdio>
#include <string>

class ILogManager
{
public:
    virtual ~ILogManager() = default;

    // One line to the system log. priority is that of syslog.
    virtual void logEvent(std::wstring module, int line, std::wstring text, int priority) = 0;
    // The same with a printf format; what is longer than 256 bytes before the arguments are put in is cut.
    virtual void logEvent(int priority, const char* module, int line, const char* format, va_list args) = 0;
    // One formatted line to file; null does nothing. Header and format together are cut at 512 bytes.
    virtual void putLog(FILE* file, const char* module, int line, const char* format, va_list args) = 0;
    // One line to the operation log and to the debug log.
    virtual void logUserOperate(std::wstring area, int line, std::wstring text) = 0;
    virtual void logDebugOperate(std::wstring area, int line, std::wstring text) = 0;
};
