#include "support/ConfinedPath.h"

#include "support/IPathManagerEx.h"
#include "support/LocaleText.h"
#include "support/LogManager.h"

#include <array>
#include <cerrno>
#include <climits>
#include <cstdlib>
#include <mutex>
#include <set>
#include <string_view>
#include <sys/stat.h>
#include <unistd.h>

namespace
{

constexpr int REFUSAL_NUMBER = 400;
constexpr std::size_t REMEMBERED_REFUSALS = 256;

// The templates come first because asking for a folder creates it: a data path is filled with templates
// before it has a folder of titles.
constexpr std::array<FolderLookup::Getter, 3> TITLE_ROOTS{&IPathManagerEx::getTemplatesPath,
                                                          &IPathManagerEx::getTitlerTemplatesPath,
                                                          &IPathManagerEx::getTitleResourcesPath};

std::string currentFolder()
{
    char buffer[PATH_MAX];
    return ::getcwd(buffer, sizeof buffer) ? buffer : "";
}

// Returns the absolute path without links, "." and "..", or an empty string if it cannot be resolved. The
// last components need not exist.
std::string resolved(std::string path)
{
    if (path.empty() || path.find('\0') != std::string::npos)
        return {};
    // as with the appliance's own paths, which are relative if its root folder is "/"
    if (path.front() != '/')
        path.insert(0, currentFolder() + '/');
    std::string missing;
    for (;;) {
        char buffer[PATH_MAX];
        if (::realpath(path.c_str(), buffer)) {
            std::string whole = buffer;
            if (whole == "/" && !missing.empty())
                whole.clear();
            return whole + missing;
        }
        struct stat status = {};
        // refuse a dangling link: its target may be created later
        if (errno != ENOENT || ::lstat(path.c_str(), &status) == 0)
            return {};
        const std::size_t slash = path.rfind('/');
        const std::string name = path.substr(slash + 1);
        if (name == "..")
            return {};
        if (!name.empty() && name != ".")
            missing.insert(0, '/' + name);
        path.resize(slash == 0 ? 1 : slash);
    }
}

bool isPrefix(const std::string& folder, const std::string& path)
{
    const std::size_t length = folder == "/" ? 0 : folder.size();
    return !folder.empty() && path.size() > length + 1 && path[length] == '/' &&
           path.compare(0, length, folder, 0, length) == 0;
}

bool isBelowTitleRoots(const std::string& path)
{
    for (const FolderLookup::Getter root : TITLE_ROOTS)
        if (ConfinedPath::isBelow(root, path))
            return true;
    return false;
}

bool isLink(const std::string& path)
{
    struct stat status = {};
    return ::lstat(path.c_str(), &status) == 0 && S_ISLNK(status.st_mode);
}

// Returns whether the name is a direct entry of its folder. This needs no disk access; the caller checks
// whether the entry is a link.
bool isEntryName(std::string_view name)
{
    return name.find('/') == std::string_view::npos && name.find('\0') == std::string_view::npos &&
           name != "." && name != "..";
}

bool climbs(std::string_view name)
{
    while (!name.empty()) {
        const std::size_t slash = name.find('/');
        if (name.substr(0, slash) == "..")
            return true;
        name.remove_prefix(slash == std::string_view::npos ? name.size() : slash + 1);
    }
    return false;
}

// Titles are read repeatedly; each refusal is logged only once.
bool isNewRefusal(const std::string& path)
{
    static std::mutex mutex;
    static std::set<std::string> refusals;
    const std::lock_guard lock(mutex);
    if (refusals.size() >= REMEMBERED_REFUSALS)
        refusals.clear();
    return refusals.insert(path).second;
}

std::string refuse(const std::wstring& what, const std::string& path)
{
    if (isNewRefusal(path))
        ConfinedPath::logRefusal(what, path);
    return {};
}

} // namespace

bool ConfinedPath::isBelow(const std::string& folder, const std::string& path)
{
    return isPrefix(resolved(folder), resolved(path));
}

bool ConfinedPath::isBelow(FolderLookup::Getter root, const std::string& path)
{
    const std::string folder = FolderLookup::multiByte(root);
    return !folder.empty() && isBelow(folder, path);
}

std::string ConfinedPath::namedByTitle(const std::string& folder, const std::string& path)
{
    const bool isBeside = path.starts_with(folder) && path.size() > folder.size() &&
                          path[folder.size()] == '/' && isEntryName(path.substr(folder.size() + 1));
    if ((isBeside && !isLink(path)) || isBelow(folder, path) || isBelowTitleRoots(path))
        return path;
    return refuse(L"a title names what lies outside: ", path);
}

std::string ConfinedPath::namedByOrder(const std::string& folder, const std::string& name)
{
    if (name.empty())
        return {};
    const std::string path = folder + '/' + name;
    if (isEntryName(name) && !isLink(path))
        return path;
    if (!climbs(name) && (isBelow(folder, path) || isBelowTitleRoots(path)))
        return path;
    return refuse(L"an order names what lies outside: ", path);
}

void ConfinedPath::logRefusal(const std::wstring& what, const std::string& path)
{
    LOG_DEBUG_OPERATE(L"ConfinedPath", REFUSAL_NUMBER, L"Refused, " + what + multiByteToWide(path));
}
