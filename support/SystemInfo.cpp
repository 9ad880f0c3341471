#include "support/SystemInfo.h"

#include "support/AtomicFile.h"
#include "support/HiddenName.h"
#include "support/LocaleText.h"
#include "support/k2sys/k2sys.h"

#include <algorithm>
#include <boost/filesystem.hpp>
#include <ctime>
#include <mutex>
#include <vector>

namespace fs = boost::filesystem;

SystemInfo* SystemInfo::mInstance = nullptr;

namespace
{

constexpr std::size_t PATH_BUFFER_SIZE = 100;
constexpr long long BYTES_PER_KILOBYTE = 1000;

std::mutex gInstanceMutex;

std::wstring environmentPath(int (*query)(char*, std::size_t))
{
    char buffer[PATH_BUFFER_SIZE] = {};
    return query(buffer, sizeof buffer) > 0 ? multiByteToWide(buffer) : std::wstring();
}

long long kilobytes(long long bytes)
{
    return bytes < 0 ? -1 : bytes / BYTES_PER_KILOBYTE;
}

// Returns whether the entry is neither temporary nor a kept version, which exist only while a file is saved.
bool isContent(const fs::path& path)
{
    return !HiddenName::isHidden(path.filename().native());
}

long long folderBytes(const fs::path& folder)
{
    long long sum = 0;
    boost::system::error_code error;
    for (fs::directory_iterator entry(folder, error), end; !error && entry != end; entry.increment(error)) {
        boost::system::error_code entryError;
        const fs::path& path = entry->path();
        const fs::file_status status = fs::symlink_status(path, entryError);
        if (fs::is_directory(status)) {
            sum += folderBytes(path);
        } else if (fs::is_regular_file(status) && isContent(path)) {
            const auto size = fs::file_size(path, entryError);
            if (!entryError)
                sum += static_cast<long long>(size);
        }
    }
    return sum;
}

// Returns whether path is folder itself or below it.
bool isWithin(const fs::path& folder, const fs::path& path)
{
    boost::system::error_code error;
    const fs::path outer = fs::weakly_canonical(folder, error);
    const fs::path inner = fs::weakly_canonical(path, error);
    const auto mismatch = std::mismatch(outer.begin(), outer.end(), inner.begin(), inner.end());
    return mismatch.first == outer.end();
}

bool copyContents(const fs::path& source, const fs::path& target)
{
    boost::system::error_code error;
    fs::create_directories(target, error);
    if (error || !fs::is_directory(target, error))
        return false;
    // List all entries before copying, so that a copy into a folder below the source does not copy itself.
    std::vector<fs::path> entries;
    for (fs::directory_iterator entry(source, error), end; !error && entry != end; entry.increment(error))
        entries.push_back(entry->path());
    bool isDone = !error;
    for (const fs::path& entry : entries) {
        // A link that leads out of the folder is not copied.
        const bool isForeign = fs::is_symlink(entry, error) && !isWithin(source, entry);
        if (isContent(entry) && entry != target && !isForeign)
            isDone = SystemInfo::copyFile(entry, target / entry.filename()) && isDone;
    }
    return isDone;
}

} // namespace

SystemInfo* SystemInfo::getInstance()
{
    const std::lock_guard lock(gInstanceMutex);
    if (!mInstance)
        mInstance = new SystemInfo;
    return mInstance;
}

void SystemInfo::cleanUp()
{
    const std::lock_guard lock(gInstanceMutex);
    delete mInstance;
    mInstance = nullptr;
}

bool SystemInfo::initialize()
{
    return k2sys_init() == 0;
}

void SystemInfo::uninitialize()
{
    k2sys_exit();
}

std::wstring SystemInfo::getRootPath()
{
    return environmentPath(k2sys_getenv_ac_root);
}

std::wstring SystemInfo::getDataPath()
{
    return environmentPath(k2sys_getenv_ac_data);
}

std::wstring SystemInfo::getPrefixPath()
{
    return environmentPath(k2sys_getenv_ac_prefix);
}

bool SystemInfo::getSystemTime(std::tm** now)
{
    if (!now)
        return false;
    std::tm time = {};
    const bool isKnown = k2sys_get_time(&time) > 0;
    *now = isKnown ? new std::tm(time) : nullptr;
    return isKnown;
}

void SystemInfo::getSystemTimeZone(std::wstring& region, std::wstring& city)
{
    char buffer[PATH_BUFFER_SIZE] = {};
    if (k2sys_get_current_timezone(buffer, sizeof buffer) == 0) {
        region = L"Asia";
        city = L"Tokyo";
        return;
    }
    const std::wstring zone = multiByteToWide(buffer);
    const std::size_t slash = zone.find(L'/');
    region = zone.substr(0, slash);
    city = slash == std::wstring::npos ? std::wstring() : zone.substr(slash + 1);
}

long long SystemInfo::getDiskSize(const std::wstring& path)
{
    return kilobytes(k2sys_fs_size(wideToMultiByte(path).c_str()));
}

long long SystemInfo::getDiskRemainSize(const std::wstring& path)
{
    return kilobytes(k2sys_fs_remain(wideToMultiByte(path).c_str()));
}

long long SystemInfo::getFolderSize(const std::wstring& folder)
{
    return (folderBytes(wideToMultiByte(folder)) + BYTES_PER_KILOBYTE - 1) / BYTES_PER_KILOBYTE;
}

bool SystemInfo::deleteFile(const std::string& path)
{
    boost::system::error_code error;
    return fs::remove(path, error) && !error;
}

bool SystemInfo::copyFile(const fs::path& source, const fs::path& target)
{
    boost::system::error_code error;
    if (fs::is_directory(source, error))
        return !isWithin(source, target) && copyContents(source, target);
    if (!fs::is_regular_file(source, error) || fs::equivalent(source, target, error))
        return false;
    if (target.has_parent_path())
        fs::create_directories(target.parent_path(), error);
    if (!AtomicFile::copy(source.native(), target.native()))
        return false;
    // The copied picture keeps its age relative to its copied title, whatever the order of copying: a picture
    // older than its title would be generated again.
    const std::time_t written = fs::last_write_time(source, error);
    if (!error)
        fs::last_write_time(target, written, error);
    return true;
}

bool SystemInfo::copyFolderFiles(const std::string& source, const std::string& target)
{
    boost::system::error_code error;
    return fs::is_directory(source, error) && copyFile(source, target);
}

bool SystemInfo::copyFolderFile(const std::string& source, const std::string& target)
{
    return copyFile(source, target);
}

bool SystemInfo::createFolders(const std::wstring& folder)
{
    boost::system::error_code error;
    return fs::create_directories(wideToMultiByte(folder), error) && !error;
}

std::wstring SystemInfo::stringToWstring(const std::string& text)
{
    return multiByteToWide(text);
}

std::string SystemInfo::wstringToStringType(const std::wstring& text)
{
    return wideToMultiByte(text);
}
