#include "support/HiddenName.h"

#include <atomic>
#include <charconv>
#include <climits>
#include <fstream>
#include <iterator>
#include <unistd.h>

namespace
{

constexpr std::string_view TEMPORARY_PREFIX = ".titler-new-";
constexpr std::string_view KEPT_PREFIX = ".titler-kept-";

// Returns the start time of a process in clock ticks since boot, or 0 if there is no such process. Process id
// and start time together identify a process, even if ids are reused.
unsigned long long startTime(long pid)
{
    std::ifstream file("/proc/" + std::to_string(pid) + "/stat");
    const std::string line((std::istreambuf_iterator<char>(file)), std::istreambuf_iterator<char>());
    std::size_t at = line.rfind(')'); // skip the process name, which may contain blanks
    if (at == std::string::npos)
        return 0;
    ++at;
    for (int field = 3; field < 22 && at != std::string::npos; ++field)
        at = line.find(' ', at + 1);
    if (at == std::string::npos || at + 1 >= line.size())
        return 0;
    unsigned long long ticks = 0;
    std::from_chars(line.data() + at + 1, line.data() + line.size(), ticks);
    return ticks;
}

std::string ownerTag()
{
    struct Tag {
        long pid;
        std::string text;
    };
    static thread_local Tag tag{-1, {}};
    const long pid = getpid();
    if (tag.pid != pid) // the process id changes after a fork
        tag = {pid, std::to_string(pid) + '-' + std::to_string(startTime(pid)) + '-'};
    return tag.text;
}

} // namespace

std::string HiddenName::folderOf(const std::string& path)
{
    const std::size_t slash = path.rfind('/');
    if (slash == std::string::npos)
        return ".";
    return slash == 0 ? "/" : path.substr(0, slash);
}

std::string HiddenName::temporary(const std::string& folder)
{
    static std::atomic<unsigned long> counter{0};
    std::string name = folder;
    name += '/';
    name += TEMPORARY_PREFIX;
    name += ownerTag();
    name += std::to_string(counter.fetch_add(1, std::memory_order_relaxed));
    return name;
}

std::string HiddenName::kept(const std::string& path)
{
    const std::size_t slash = path.rfind('/');
    const std::string_view base = std::string_view(path).substr(slash == std::string::npos ? 0 : slash + 1);
    std::string name(KEPT_PREFIX);
    for (const char c : base)
        if (c == '.')
            name += "%2E";
        else if (c == '%')
            name += "%25";
        else
            name += c;
    return name.size() > NAME_MAX ? std::string() : folderOf(path) + '/' + name;
}

std::string HiddenName::keptTarget(std::string_view name)
{
    if (!name.starts_with(KEPT_PREFIX))
        return {};
    name.remove_prefix(KEPT_PREFIX.size());
    std::string target;
    while (!name.empty()) {
        if (name.starts_with("%2E") || name.starts_with("%25")) {
            target += name[2] == 'E' ? '.' : '%';
            name.remove_prefix(3);
        } else {
            target += name.front();
            name.remove_prefix(1);
        }
    }
    return target;
}

bool HiddenName::isTemporary(std::string_view name)
{
    return name.starts_with(TEMPORARY_PREFIX);
}

bool HiddenName::hasLivingOwner(std::string_view name)
{
    if (!isTemporary(name))
        return false;
    name.remove_prefix(TEMPORARY_PREFIX.size());
    long pid = 0;
    unsigned long long ticks = 0;
    const char* const end = name.data() + name.size();
    const auto [afterPid, pidError] = std::from_chars(name.data(), end, pid);
    if (pidError != std::errc() || afterPid == end || pid <= 0)
        return false;
    const auto [afterTicks, ticksError] = std::from_chars(afterPid + 1, end, ticks);
    return ticksError == std::errc() && ticks != 0 && startTime(pid) == ticks;
}

bool HiddenName::isHidden(std::string_view name)
{
    return isTemporary(name) || name.starts_with(KEPT_PREFIX);
}
