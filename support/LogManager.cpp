#include "support/LogManager.h"

#include "support/LocaleText.h"
#include "support/LogFile.h"
#include "support/k2sys/k2sys.h"

#include <syslog.h>
#include <unistd.h>

#include <algorithm>
#include <climits>
#include <cstring>
#include <ctime>
#include <cwchar>
#include <iterator>

LogManager* LogManager::mpLogManager = nullptr;

namespace
{

const int LOG_OPTION = LOG_PID;
const int LOG_FACILITY = LOG_LOCAL0;
const std::size_t LINE_FORMAT_SIZE = 512;
const std::size_t EVENT_FORMAT_SIZE = 256;
const std::size_t TEXT_LIMIT = 2000; // characters
const std::size_t FORMATTED_LIMIT = 8192;

ILogManager* gLogManager = nullptr;
std::wstring gProcName;

std::string logFolder()
{
    char folder[PATH_MAX];
    if (k2sys_log_dir(folder, sizeof folder) < 0)
        return "/var/log";
    return folder;
}

bool isControl(char32_t c)
{
    return c < 0x20 || (c >= 0x7F && c < 0xA0);
}

// Returns whether c is a line or paragraph separator or changes the text direction.
bool isMisleading(char32_t c)
{
    return c == 0x2028 || c == 0x2029 || (c >= 0x202A && c <= 0x202E) || (c >= 0x2066 && c <= 0x2069);
}

// Replaces control characters. Texts come from keyboards, files and other processes and must not start new
// lines or control the terminal on which the log is read.
std::wstring escaped(const std::wstring& text)
{
    std::wstring result;
    result.reserve(text.size());
    for (const wchar_t c : text) {
        const auto code = static_cast<char32_t>(c);
        wchar_t number[16];
        if (c == L'\n')
            result += L"\\n";
        else if (c == L'\r')
            result += L"\\r";
        else if (c == L'\t')
            result += L"\\t";
        else if (isControl(code) || isMisleading(code)) {
            std::swprintf(number, std::size(number), code < 0x100 ? L"\\x%02x" : L"\\u%04x",
                          static_cast<unsigned>(code));
            result += number;
        } else
            result += c;
    }
    return result;
}

// Returns the text as it is written: escaped, in bytes, and cut to the limit.
std::string lineText(const std::wstring& text)
{
    return wideToMultiByte(escaped(text.size() > TEXT_LIMIT ? text.substr(0, TEXT_LIMIT) : text));
}

// Formats the arguments; the result is cut to a limit.
__attribute__((format(printf, 1, 0))) std::string formatted(const char* format, va_list args)
{
    std::string text(FORMATTED_LIMIT, '\0');
    const int size = std::vsnprintf(text.data(), text.size(), format, args);
    text.resize(size < 0 ? 0 : std::min(static_cast<std::size_t>(size), text.size() - 1));
    return text;
}

// Escapes "%" in a text that becomes part of a printf format.
std::string withoutConversions(const std::string& text)
{
    std::string result;
    for (const char c : text) {
        result += c;
        if (c == '%')
            result += c;
    }
    return result;
}

// Cuts a format to size bytes including its NUL, without leaving an incomplete conversion at the end.
std::string cutFormat(const std::string& format, std::size_t size)
{
    if (format.size() < size)
        return format;
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
    if (gLogManager != nullptr)
        gLogManager->logEvent(std::move(module), line, std::move(text), priority);
}

void LOG_EVENT(std::string module, int line, std::string text, int priority)
{
    LOG_EVENT(multiByteToWide(module), line, multiByteToWide(text), priority);
}

void LOG_USER_OPERATE(std::wstring area, int number, std::wstring text)
{
    if (gLogManager != nullptr)
        gLogManager->logUserOperate(std::move(area), number, std::move(text));
}

void LOG_DEBUG_OPERATE(std::wstring area, int number, std::wstring text)
{
    if (gLogManager != nullptr)
        gLogManager->logDebugOperate(std::move(area), number, std::move(text));
}

LogManager* LogManager::getInstance()
{
    if (mpLogManager == nullptr)
        mpLogManager = new LogManager();
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
    m_processName = lineText(gProcName);
    k2sys_openlog(m_processName.c_str(), LOG_OPTION, LOG_FACILITY);
    const std::string folder = logFolder();
    m_operationFile = std::make_unique<LogFile>(folder + "/k2_ope.log");
    m_debugFile = std::make_unique<LogFile>(folder + "/k2_ope_debug.log");
}

LogManager::~LogManager() = default;

void LogManager::logEvent(std::wstring module, int line, std::wstring text, int priority)
{
    k2sys_syslog(priority, "%s %03d: %s", lineText(module).c_str(), line, lineText(text).c_str());
}

void LogManager::logEvent(int priority, const char* module, int line, const char* format, va_list args)
{
    char number[16];
    std::snprintf(number, sizeof number, " %03d: ", line);
    const std::string whole = withoutConversions(module) + number + format;
    const std::string text = formatted(cutFormat(whole, EVENT_FORMAT_SIZE).c_str(), args);
    k2sys_syslog(priority, "%s", lineText(multiByteToWide(text)).c_str());
}

void LogManager::putLog(FILE* file, const char* module, int line, const char* format, va_list args)
{
    if (file == nullptr)
        return;
    char number[16];
    std::snprintf(number, sizeof number, "] %03d: ", line);
    const std::string whole = getCurrentTime() + " localhost " + withoutConversions(m_processName) + "[" +
                              std::to_string(getpid()) + "]: [" + withoutConversions(module) + number +
                              format;
    const std::string text = formatted(cutFormat(whole, LINE_FORMAT_SIZE - 1).c_str(), args);
    if (std::fprintf(file, "%s\n", lineText(multiByteToWide(text)).c_str()) >= 0)
        std::fflush(file);
}

void LogManager::logUserOperate(std::wstring area, int line, std::wstring text)
{
    writeLine(*m_operationFile, area, line, text);
}

void LogManager::logDebugOperate(std::wstring area, int line, std::wstring text)
{
    writeLine(*m_debugFile, area, line, text);
}

void LogManager::writeLine(LogFile& file, const std::wstring& area, int number, const std::wstring& text)
{
    char code[16];
    std::snprintf(code, sizeof code, "%03d", number);
    file.write(getCurrentTime() + " localhost " + m_processName + '[' + std::to_string(getpid()) + "]: [" +
               lineText(area) + "] " + code + ": " + lineText(text) + '\n');
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
    if (localtime_r(&moment.tv_sec, &local) == nullptr)
        return std::string();
    char date[64];
    if (std::strftime(date, sizeof date, "%FT%T", &local) == 0)
        return std::string();
    const int offset = static_cast<int>(local.tm_gmtoff);
    char stamp[128];
    std::snprintf(stamp, sizeof stamp, "%s.%06ld%+03d:%02d", date, static_cast<long>(moment.tv_usec),
                  offset / 3600, (offset < 0 ? -offset : offset) % 3600 / 60);
    return stamp;
}
