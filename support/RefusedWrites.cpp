#include "support/RefusedWrites.h"

#include "support/AtomicFile.h"
#include "support/HiddenName.h"

#include <algorithm>
#include <atomic>
#include <cerrno>
#include <deque>
#include <filesystem>
#include <mutex>
#include <string_view>
#include <sys/stat.h>
#include <utility>

namespace
{

struct Entry {
    RefusedWrites::File file;
    std::string bytes;
    unsigned long version = 0;
};

struct Rename {
    std::string before;
    std::string after;
};

// Folders are renamed rarely; writes to a folder older than that many renames have long finished.
constexpr std::size_t RENAMES_KEPT = 64;

std::mutex gMutex; // guards all variables below; the atomic ones are read without it
std::vector<Entry> gEntries;
std::deque<Rename> gRenames;
std::function<void()> gListener;
std::size_t gPictureBytes = 0;
std::atomic<unsigned long> gVersion = 0;
std::atomic<std::size_t> gCount = 0;
std::atomic<unsigned long> gOutages = 0;
// The version of the bytes that retry() is writing in this thread, else 0. Newer bytes that are kept
// meanwhile must not be dropped.
thread_local unsigned long tTriedVersion = 0;

std::string normal(const std::string& path)
{
    std::string text = std::filesystem::path(path).lexically_normal().native();
    while (text.size() > 1 && text.back() == '/')
        text.pop_back();
    return text;
}

bool exists(const std::string& path)
{
    struct stat status = {};
    return ::lstat(path.c_str(), &status) == 0;
}

bool isBelow(std::string_view path, std::string_view folder)
{
    return path.size() > folder.size() && path.starts_with(folder) && path[folder.size()] == '/';
}

void rebase(std::string& path, const Rename& rename)
{
    if (isBelow(path, rename.before))
        path = rename.after + path.substr(rename.before.size());
}

void followRenames(std::string& path)
{
    for (const Rename& rename : gRenames)
        if (isBelow(path, rename.before) && !exists(HiddenName::folderOf(path)))
            rebase(path, rename);
}

std::vector<Entry>::iterator entryOf(const std::string& path)
{
    return std::find_if(gEntries.begin(), gEntries.end(),
                        [&](const Entry& entry) { return entry.file.path == path; });
}

template <typename Condition>
std::vector<RefusedWrites::File> eraseIf(const Condition& condition)
{
    std::vector<RefusedWrites::File> erased;
    std::erase_if(gEntries, [&](const Entry& entry) {
        if (!condition(entry))
            return false;
        if (!entry.file.title.empty())
            gPictureBytes -= entry.bytes.size();
        erased.push_back(entry.file);
        return true;
    });
    gCount = gEntries.size();
    return erased;
}

bool take(const std::string& key, std::string& bytes, unsigned long& version)
{
    const std::lock_guard lock(gMutex);
    const auto entry = entryOf(key);
    if (entry == gEntries.end())
        return false;
    bytes = entry->bytes;
    version = entry->version;
    return true;
}

// Returns whether the title of a picture was deleted. If its whole folder is missing, the folder may have
// been renamed, and the title still exists.
bool isOrphan(const RefusedWrites::File& file)
{
    return !file.title.empty() && !exists(file.title) && exists(HiddenName::folderOf(file.title));
}

} // namespace

void RefusedWrites::keep(const std::string& path, std::string bytes, int error, const std::string& title)
{
    std::function<void()> listener;
    {
        const std::lock_guard lock(gMutex);
        Entry entry{
            {normal(path), title.empty() ? title : normal(title), error}, std::move(bytes), ++gVersion};
        followRenames(entry.file.path);
        followRenames(entry.file.title);
        const bool isFirst = gEntries.empty();
        eraseIf([&](const Entry& old) { return old.file.path == entry.file.path; });
        if (title.empty() || gPictureBytes + entry.bytes.size() <= PICTURE_BYTES) {
            gPictureBytes += title.empty() ? 0 : entry.bytes.size();
            gOutages += isFirst ? 1 : 0;
            gEntries.push_back(std::move(entry));
            gCount = gEntries.size();
        }
        listener = gListener;
    }
    if (listener)
        listener();
}

bool RefusedWrites::find(const std::string& path, std::string& bytes)
{
    unsigned long version = 0;
    return !isEmpty() && take(normal(path), bytes, version);
}

unsigned long RefusedWrites::outages()
{
    return gOutages;
}

bool RefusedWrites::isEmpty()
{
    return gCount == 0;
}

std::vector<RefusedWrites::File> RefusedWrites::files()
{
    const std::lock_guard lock(gMutex);
    std::vector<File> files;
    for (const Entry& entry : gEntries)
        files.push_back(entry.file);
    return files;
}

std::vector<RefusedWrites::File> RefusedWrites::retry()
{
    std::vector<File> written;
    if (isEmpty())
        return written;
    {
        const std::lock_guard lock(gMutex);
        eraseIf([](const Entry& entry) { return isOrphan(entry.file); });
    }
    bool isPictureRefused = false;
    for (const File& file : files()) {
        const bool isPicture = !file.title.empty();
        // Pictures are large: if one does not fit, the others are not tried.
        std::string bytes;
        if ((isPicture && isPictureRefused) || !take(file.path, bytes, tTriedVersion))
            continue;
        const bool isWritten =
            AtomicFile::write(file.path, bytes, AtomicFile::Durability::SyncLater,
                              isPicture ? AtomicFile::Links::Replace : AtomicFile::Links::Follow);
        const int error = errno;
        tTriedVersion = 0;
        if (isWritten) {
            written.push_back(file);
            continue;
        }
        isPictureRefused = isPictureRefused || isPicture;
        const std::lock_guard lock(gMutex);
        if (const auto kept = entryOf(file.path); kept != gEntries.end())
            kept->file.error = error;
    }
    return written;
}

void RefusedWrites::forget(const std::string& path)
{
    if (isEmpty())
        return;
    const std::string key = normal(path);
    const std::lock_guard lock(gMutex);
    eraseIf([&](const Entry& entry) { return entry.file.path == key; });
}

unsigned long RefusedWrites::moment()
{
    return tTriedVersion != 0 ? tTriedVersion : gVersion.load();
}

void RefusedWrites::forgetUpTo(unsigned long moment, const std::string& path)
{
    if (isEmpty())
        return;
    const std::string key = normal(path);
    const std::lock_guard lock(gMutex);
    eraseIf([&](const Entry& entry) { return entry.file.path == key && entry.version <= moment; });
}

void RefusedWrites::forgetFolder(const std::string& folder)
{
    if (isEmpty())
        return;
    const std::string key = normal(folder);
    const std::lock_guard lock(gMutex);
    eraseIf([&](const Entry& entry) { return isBelow(entry.file.path, key); });
}

std::vector<RefusedWrites::File> RefusedWrites::forgetVanished()
{
    const std::lock_guard lock(gMutex);
    return eraseIf([](const Entry& entry) { return !exists(HiddenName::folderOf(entry.file.path)); });
}

void RefusedWrites::folderRenamed(const std::string& before, const std::string& after)
{
    const Rename rename{normal(before), normal(after)};
    if (rename.before == rename.after)
        return;
    const std::lock_guard lock(gMutex);
    for (Entry& entry : gEntries) {
        rebase(entry.file.path, rename);
        rebase(entry.file.title, rename);
    }
    gRenames.push_back(rename);
    if (gRenames.size() > RENAMES_KEPT)
        gRenames.pop_front();
}

void RefusedWrites::setListener(std::function<void()> listener)
{
    const std::lock_guard lock(gMutex);
    gListener = std::move(listener);
}
