// The trace of what the operator did: two text files that the appliance's processes share, and the system
// log. A text is one line of at most 2,000 characters: control characters in it are written as "\n", "\x1b"
// and the like, and the rest is cut.
//
// The free functions below are the only way in. Before INIT_LOGGING and after UNINIT_LOGGING they do nothing.
// INIT_LOGGING and UNINIT_LOGGING belong to the GUI thread; the others may be called from any thread between
// the two.
#pragma once

#include "support/ILogManager.h"

#include <sys/time.h>

#include <memory>
#include <string>

class LogFile;

// Starts logging under a process tag.
void INIT_LOGGING(std::wstring processTag);
void UNINIT_LOGGING();
// To the system log; priority is that of syslog.
void LOG_EVENT(std::wstring module, int line, std::wstring text, int priority);
void LOG_EVENT(std::string module, int line, std::string text, int priority);
// To the operation log. number is a free code of the call site: 200 for what the operator does.
void LOG_USER_OPERATE(std::wstring area, int number, std::wstring text);
// To the debug log.
void LOG_DEBUG_OPERATE(std::wstring area, int number, std::wstring text);

class LogManager : public ILogManager
{
public:
    // The one manager, made on first use with the tag of INIT_LOGGING. GUI thread.
    static LogManager* getInstance();
    // Deletes it and closes its files.
    static void clearUp();

    void logEvent(std::wstring module, int line, std::wstring text, int priority) override;
    void logEvent(int priority, const char* module, int line, const char* format, va_list args) override
        __attribute__((format(printf, 5, 0)));
    void putLog(FILE* file, const char* module, int line, const char* format, va_list args) override
        __attribute__((format(printf, 5, 0)));
    void logUserOperate(std::wstring area, int line, std::wstring text) override;
    void logDebugOperate(std::wstring area, int line, std::wstring text) override;

    // RFC 3339 stamp in local time with microseconds; empty when the local time is unknown.
    static std::string getCurrentTime();
    static std::string formatTime(const timeval& moment);

private:
    LogManager();
    ~LogManager() override;
    void writeLine(LogFile& file, const std::wstring& area, int number, const std::wstring& text);

    static LogManager* mpLogManager;
    std::unique_ptr<LogFile> m_operationFile;
    std::unique_ptr<LogFile> m_debugFile;
    std::string m_processName; // as it stands in a line
};
