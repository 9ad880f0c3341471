#include "support/k2sys/k2sys.h"

#include <execinfo.h>
#include <pwd.h>
#include <sys/statvfs.h>
#include <syslog.h>
#include <unistd.h>

#include <cerrno>
#include <climits>
#include <cstdlib>
#include <cstring>
#include <fstream>
#include <mutex>
#include <string>

namespace
{

const int BACKTRACE_DEPTH = 64;

std::mutex& stateMutex()
{
    static std::mutex mutex;
    return mutex;
}

// openlog stores the pointer, so the tag is kept here.
std::string& logTag()
{
    static std::string tag;
    return tag;
}

int writePath(const std::string& path, char* buffer, size_t size, int state)
{
    if (buffer == nullptr || size == 0)
        return -1;
    if (path.size() >= size) {
        buffer[0] = '\0';
        return -1;
    }
    std::memcpy(buffer, path.c_str(), path.size() + 1);
    return state;
}

std::string environment(const char* name)
{
    const char* value = std::getenv(name);
    return value != nullptr ? value : "";
}

std::string homeFolder()
{
    const std::string home = environment("HOME");
    if (!home.empty())
        return home;
    char storage[4096];
    passwd entry{};
    passwd* found = nullptr;
    if (getpwuid_r(getuid(), &entry, storage, sizeof storage, &found) == 0 && found != nullptr)
        return found->pw_dir;
    return "/";
}

std::string parentOf(const std::string& path)
{
    const auto slash = path.rfind('/');
    if (slash == std::string::npos || slash == 0)
        return "/";
    return path.substr(0, slash);
}

std::string programPrefix()
{
    char path[PATH_MAX];
    const ssize_t length = readlink("/proc/self/exe", path, sizeof path - 1);
    if (length <= 0)
        return "/usr";
    path[length] = '\0';
    return parentOf(parentOf(path));
}

// Returns the zone name in the path of a zone file, or an empty string.
std::string zoneNameOfFile(const std::string& path)
{
    const std::string marker = "zoneinfo/";
    const auto at = path.find(marker);
    return at == std::string::npos ? std::string() : path.substr(at + marker.size());
}

std::string zoneName()
{
    std::string zone = environment("TZ");
    if (!zone.empty() && zone.front() == ':')
        zone.erase(0, 1);
    if (!zone.empty() && zone.front() == '/')
        zone = zoneNameOfFile(zone);
    if (zone.find('/') != std::string::npos)
        return zone;
    char target[PATH_MAX];
    const ssize_t length = readlink("/etc/localtime", target, sizeof target - 1);
    if (length > 0) {
        target[length] = '\0';
        zone = zoneNameOfFile(target);
        if (!zone.empty())
            return zone;
    }
    std::ifstream file("/etc/timezone");
    zone.clear();
    std::getline(file, zone);
    return zone;
}

// The first call of backtrace loads a library, which must not happen in a signal handler.
__attribute__((constructor)) void prepareBacktrace()
{
    void* frames[1];
    backtrace(frames, 1);
}

} // namespace

int k2sys_init(void)
{
    return 0;
}

void k2sys_exit(void)
{
    const std::lock_guard<std::mutex> lock(stateMutex());
    closelog();
}

void k2sys_openlog(const char* tag, int option, int facility)
{
    const std::lock_guard<std::mutex> lock(stateMutex());
    closelog();
    logTag() = tag != nullptr ? tag : "";
    openlog(logTag().c_str(), option, facility);
}

void k2sys_syslog(int priority, const char* format, ...)
{
    va_list args;
    va_start(args, format);
    vsyslog(priority, format, args);
    va_end(args);
}

void k2sys_vsyslog(int priority, const char* format, va_list args)
{
    vsyslog(priority, format, args);
}

void k2sys_print_backtrace(void)
{
    void* frames[BACKTRACE_DEPTH];
    const int count = backtrace(frames, BACKTRACE_DEPTH);
    backtrace_symbols_fd(frames, count, STDERR_FILENO);
}

int k2sys_getenv_ac_root(char* buffer, size_t size)
{
    const std::string root = environment("K2SYS_AC_ROOT");
    return writePath(root, buffer, size, root == "/" ? 1 : 2);
}

int k2sys_getenv_ac_data(char* buffer, size_t size)
{
    std::string data = environment("K2SYS_AC_DATA");
    if (data.empty()) {
        const std::string base = environment("XDG_DATA_HOME");
        data = (base.empty() ? homeFolder() + "/.local/share" : base) + "/titler";
    }
    return writePath(data, buffer, size, 1);
}

int k2sys_getenv_ac_prefix(char* buffer, size_t size)
{
    const std::string prefix = environment("K2SYS_AC_PREFIX");
    return writePath(prefix.empty() ? programPrefix() : prefix, buffer, size, 1);
}

int k2sys_get_time(struct tm* now)
{
    const time_t seconds = time(nullptr);
    if (now == nullptr || localtime_r(&seconds, now) == nullptr)
        return -1;
    return 1;
}

long long k2sys_fs_size(const char* path)
{
    struct statvfs status {
    };
    if (path == nullptr || statvfs(path, &status) != 0)
        return -1;
    return static_cast<long long>(status.f_blocks) * static_cast<long long>(status.f_frsize);
}

long long k2sys_fs_remain(const char* path)
{
    const std::string fixed = environment("K2SYS_FS_REMAIN");
    if (!fixed.empty()) {
        char* end = nullptr;
        errno = 0;
        const long long remain = std::strtoll(fixed.c_str(), &end, 10);
        if (errno == 0 && *end == '\0' && remain >= 0)
            return remain;
    }
    struct statvfs status {
    };
    if (path == nullptr || statvfs(path, &status) != 0)
        return -1;
    return static_cast<long long>(status.f_bavail) * static_cast<long long>(status.f_frsize);
}

int k2sys_get_current_timezone(char* buffer, size_t size)
{
    const std::string zone = zoneName();
    if (zone.empty()) {
        if (buffer != nullptr && size > 0)
            buffer[0] = '\0';
        return 0;
    }
    return writePath(zone, buffer, size, 1) == 1 ? 1 : 0;
}
