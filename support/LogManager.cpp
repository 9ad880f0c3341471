#include "support/LogManager.h"

#include "support/LocaleText.h"
#include "support/k2sys/k2sys.h"

#include <syslog.h>
#include <unistd.h>

#include <climits>
#include <cstring>
#include <ctime>

LogManager* LogManager::mpLogManager = nullptr;

namespace
{

const int LOG_OPTION = LOG_PID;
const int LOG_FACILITY = LOG_LOCAL0;
const std::size_t LINE_FORMAT_SIZE = 512;
const std::size_t EVENT_FORMAT_SIZE = 256;

ILogManager* gLogManager = nullptr;
std::wstring gProcName;

std::string logFolder()
{
    char folder[PATH_MAX];
    if (k2sys_log_dir(folder, sizeof folder) < 0) {
        return "/var/log";
    }
    return folder;
}

// Text that becomes part of a printf format must not be read as conversions.
std::string withoutConversions(const std::string& text)
{
    std::string result;
    for (const char c : text) {
        result += c;
        if (c == '%') {
            result += c;
        }
    }
    return result;
}

// A format cut to size bytes with its NUL, without a conversion that the cut would leave unfinished.
std::string cutFormat(const std::string& format, std::size_t size)
{
    if (format.size() < size) {
        return format;
    }
    std::string cut = format.substr(0, size - 1);
    std::size_t at = 0;
    while ((at = cut.find('%', at)) != std::string::npos) {
        const std::size_t end = cut.find_first_of("%diouxXeEfFgGaAcspnmC", at + 1);
        if (end == std::string::npos) {
            cut.resize(at);
            break;
        }
        at = end + 1;
    }
    return cut;
}

} // namespace

void INIT_LOGGING(std::wstring processTag)
{
    gProcName = std::move(processTag);
    gLogManager = LogManager::getInstance();
}

void UNINIT_LOGGING()
{
    gLogManager = nullptr;
    LogManager::clearUp();
}

void LOG_EVENT(std::wstring module, int line, std::wstring text, int priority)
{
    if (gLogManager != nullptr) {
        gLogManager->logEvent(std::move(module), line, std::move(text), priority);
    }
}

void LOG_EVENT(std::string module, int line, std::string text, int priority)
{
    LOG_EVENT(multiByteToWide(module), line, multiByteToWide(text), priority);
}

void LOG_USER_OPERATE(std::wstring area, int number, std::wstring text)
{
    if (gLogManager != nullptr) {
        gLogManager->logUserOperate(std::move(area), number, std::move(text));
    }
}

void LOG_DEBUG_OPERATE(std::wstring area, int number, std::wstring text)
{
    if (gLogManager != nullptr) {
        gLogManager->logDebugOperate(std::move(area), number, std::move(text));
    }
}

LogManager* LogManager::getInstance()
{
    if (mpLogManager == nullptr) {
        mpLogManager = new LogManager();
    }
    return mpLogManager;
}

void LogManager::clearUp()
{
    delete mpLogManager;
    mpLogManager = nullptr;
}

LogManager::LogManager()
{
    k2sys_init();
    m_processName = wideToMultiByte(gProcName);
    k2sys_openlog(m_processName.c_str(), LOG_OPTION, LOG_FACILITY);
    const std::string folder = logFolder();
    m_operationFile = std::fopen((folder + "/k2_ope.log").c_str(), "a+e");
    m_debugFile = std::fopen((folder + "/k2_ope_debug.log").c_str(), "a+e");
}

LogManager::~LogManager()
{
    for (FILE* file : {m_operationFile, m_debugFile, m_thirdFile}) {
        if (file != nullptr) {
            std::fclose(file);
        }
    }
}

void LogManager::logEvent(std::wstring module, int line, std::wstring text, int priority)
{
    k2sys_syslog(priority, "%s %03d: %s", wideToMultiByte(module).c_str(), line,
                 wideToMultiByte(text).c_str());
}

void LogManager::logEvent(int priority, const char* module, int line, const char* format, va_list args)
{
    char number[16];
    std::snprintf(number, sizeof number, " %03d: ", line);
    const std::string whole = withoutConversions(module) + number + format;
    k2sys_vsyslog(priority, cutFormat(whole, EVENT_FORMAT_SIZE).c_str(), args);
}

void LogManager::putLog(FILE* file, const char* module, int line, const char* format, va_list args)
{
    if (file == nullptr) {
        return;
    }
    char number[16];
    std::snprintf(number, sizeof number, "] %03d: ", line);
    const std::string whole = getCurrentTime() + " localhost " + withoutConversions(m_processName) + "[" +
                              std::to_string(getpid()) + "]: [" + withoutConversions(module) + number +
                              format;
    // One byte is kept back so that a line that is cut still ends.
    const std::string cut = cutFormat(whole, LINE_FORMAT_SIZE - 1) + "\n";
    if (std::vfprintf(file, cut.c_str(), args) >= 0) {
        std::fflush(file);
    }
}

void LogManager::logUserOperate(std::wstring area, int line, std::wstring text)
{
    writeLine(m_operationFile, area, line, text);
}

void LogManager::logDebugOperate(std::wstring area, int line, std::wstring text)
{
    writeLine(m_debugFile, area, line, text);
}

void LogManager::writeLine(FILE* file, const std::wstring& area, int number, const std::wstring& text)
{
    if (file == nullptr) {
        return;
    }
    std::fprintf(file, "%s localhost %s[%d]: [%s] %03d: %s\n", getCurrentTime().c_str(),
                 m_processName.c_str(), static_cast<int>(getpid()), wideToMultiByte(area).c_str(), number,
                 wideToMultiByte(text).c_str());
    std::fflush(file);
}

std::string LogManager::getCurrentTime()
{
    timeval moment{};
    gettimeofday(&moment, nullptr);
    return formatTime(moment);
}

std::string LogManager::formatTime(const timeval& moment)
{
    tm local{};
    if (localtime_r(&moment.tv_sec, &local) == nullptr) {
        return std::string();
    }
    char date[64];
    if (std::strftime(date, sizeof date, "%FT%T", &local) == 0) {
        return std::string();
    }
    const int offset = static_cast<int>(local.tm_gmtoff);
    char stamp[128];
    std::snprintf(stamp, sizeof stamp, "%s.%06ld%+03d:%02d", date, static_cast<long>(moment.tv_usec),
                  offset / 3600, (offset < 0 ? -offset : offset) % 3600 / 60);
    return stamp;
}
