#pragma once

#include "support/ILogManager.h"

#include <sys/time.h>

#include <memory>
#include <string>

class LogFile;

// Starts logging; processTag appears in every line.
void INIT_LOGGING(std::wstring processTag);
void UNINIT_LOGGING();
// Write to the system log; priority as for syslog.
void LOG_EVENT(std::wstring module, int line, std::wstring text, int priority);
void LOG_EVENT(std::string module, int line, std::string text, int priority);
// Writes to the operation log. number is a code chosen by the call site: 200 for actions of the operator.
void LOG_USER_OPERATE(std::wstring area, int number, std::wstring text);
// Writes to the debug log.
void LOG_DEBUG_OPERATE(std::wstring area, int number, std::wstring text);

// Writes the trace of what the operator did: two text files that the appliance's processes share, and the
// system log. Each entry is one line of at most 2,000 characters; control characters are escaped ("\n",
// "\x1b"), and longer texts are cut.
//
// Callers use the free functions above. Before INIT_LOGGING and after UNINIT_LOGGING they do nothing.
// INIT_LOGGING and UNINIT_LOGGING are called in the GUI thread; the others may be called from any thread
// between the two.
class LogManager : public ILogManager
{
public:
    // Returns the only manager, which is created on first use with the tag of INIT_LOGGING. GUI thread.
    static LogManager* getInstance();
    // Deletes the manager and closes its files.
    static void clearUp();

    void logEvent(std::wstring module, int line, std::wstring text, int priority) override;
    void logEvent(int priority, const char* module, int line, const char* format, va_list args) override
        __attribute__((format(printf, 5, 0)));
    void putLog(FILE* file, const char* module, int line, const char* format, va_list args) override
        __attribute__((format(printf, 5, 0)));
    void logUserOperate(std::wstring area, int line, std::wstring text) override;
    void logDebugOperate(std::wstring area, int line, std::wstring text) override;

    // Returns the local time in RFC 3339 form with microseconds, or an empty string if it is unknown.
    static std::string getCurrentTime();
    static std::string formatTime(const timeval& moment);

private:
    LogManager();
    ~LogManager() override;
    void writeLine(LogFile& file, const std::wstring& area, int number, const std::wstring& text);

    static LogManager* mpLogManager;
    std::unique_ptr<LogFile> m_operationFile;
    std::unique_ptr<LogFile> m_debugFile;
    std::string m_processName; // as it appears in a line
};
