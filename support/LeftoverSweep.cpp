#include "support/LeftoverSweep.h"

#include "support/AtomicFile.h"
#include "support/FileSyncQueue.h"
#include "support/FolderLookup.h"
#include "support/HiddenName.h"
#include "support/IPathManagerEx.h"
#include "support/XmlFile.h"

#include <cstdint>
#include <dirent.h>
#include <filesystem>
#include <libdeflate.h>
#include <strings.h>
#include <sys/stat.h>
#include <tinyxml.h>
#include <unistd.h>
#include <vector>

namespace
{

constexpr std::size_t LARGEST_PICTURE = 256 * 1024 * 1024;

bool hasExtension(const std::string& path, const char* extension)
{
    const std::size_t dot = path.rfind('.');
    return dot != std::string::npos && strcasecmp(path.c_str() + dot, extension) == 0;
}

std::uint32_t bigEndian32(const char* p)
{
    const auto* b = reinterpret_cast<const unsigned char*>(p);
    return (std::uint32_t(b[0]) << 24) | (std::uint32_t(b[1]) << 16) | (std::uint32_t(b[2]) << 8) | b[3];
}

// Returns whether all chunks up to the end chunk are present and have valid check sums.
bool isWholePng(const std::string& path)
{
    std::string bytes;
    if (!AtomicFile::read(path, LARGEST_PICTURE, bytes) || !bytes.starts_with("\x89PNG\r\n\x1a\n"))
        return false;
    std::string_view rest = std::string_view(bytes).substr(8);
    while (rest.size() >= 12) {
        const std::size_t length = bigEndian32(rest.data());
        if (length > rest.size() - 12)
            return false;
        const std::string_view typeAndData = rest.substr(4, length + 4);
        if (libdeflate_crc32(0, typeAndData.data(), typeAndData.size()) !=
            bigEndian32(rest.data() + 8 + length))
            return false;
        if (typeAndData.starts_with("IEND"))
            return true;
        rest.remove_prefix(length + 12);
    }
    return false;
}

// Returns whether the file at path is complete; name decides about its type.
bool isWholeAs(const std::string& path, const std::string& name)
{
    if (hasExtension(name, ".xml")) {
        TiXmlDocument document;
        return XmlFile::load(path, document);
    }
    if (hasExtension(name, ".png"))
        return isWholePng(path);
    struct stat status = {};
    return ::stat(path.c_str(), &status) == 0 && status.st_size > 0;
}

void settleKept(const std::string& folder, const std::string& name)
{
    const std::string kept = folder + '/' + name;
    const std::string path = folder + '/' + HiddenName::keptTarget(name);
    struct stat status = {};
    if (::lstat(path.c_str(), &status) != 0)
        FileSyncQueue::settleKept(path, FileSyncQueue::Kept::Discard);
    else if (isWholeAs(path, path)) // complete in the page cache, which does not prove that it is on the disk
        FileSyncQueue::settleKept(path, FileSyncQueue::Kept::DiscardAfterSync);
    else if (isWholeAs(kept, path))
        FileSyncQueue::settleKept(path, FileSyncQueue::Kept::Restore);
    else
        FileSyncQueue::settleKept(path, FileSyncQueue::Kept::Discard);
}

std::vector<std::string> namesIn(const std::string& folder)
{
    std::vector<std::string> names;
    if (DIR* const directory = ::opendir(folder.c_str())) {
        while (const dirent* entry = ::readdir(directory))
            names.emplace_back(entry->d_name);
        ::closedir(directory);
    }
    return names;
}

} // namespace

void LeftoverSweep::sweep(const std::string& folder)
{
    const std::string base = std::filesystem::path(folder + '/').lexically_normal().parent_path().native();
    for (const std::string& name : namesIn(base)) {
        if (HiddenName::isTemporary(name)) {
            if (!HiddenName::hasLivingOwner(name))
                ::unlink((base + '/' + name).c_str());
        } else if (!HiddenName::keptTarget(name).empty()) {
            settleKept(base, name);
        }
    }
}

void LeftoverSweep::sweepWithChildren(const std::string& folder)
{
    sweep(folder);
    for (const std::string& name : namesIn(folder)) {
        const std::string child = folder + '/' + name;
        struct stat status = {};
        if (name != "." && name != ".." && ::lstat(child.c_str(), &status) == 0 && S_ISDIR(status.st_mode))
            sweep(child);
    }
}

void LeftoverSweep::sweepProgramFolders()
{
    for (const FolderLookup::Getter getter :
         {&IPathManagerEx::getSystemSettingPath, &IPathManagerEx::getTitlerTemplatesPath,
          &IPathManagerEx::getTemplatesPath}) {
        const std::string folder = FolderLookup::multiByte(getter);
        if (!folder.empty())
            sweepWithChildren(folder);
    }
}
