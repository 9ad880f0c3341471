#include "support/AtomicFile.h"

#include "support/FileSyncQueue.h"
#include "support/HiddenName.h"
#include "support/OwnerOnlyFiles.h"
#include "support/RefusedWrites.h"

#include <cerrno>
#include <climits>
#include <cstdlib>
#include <fcntl.h>
#include <filesystem>
#include <sys/stat.h>
#include <sys/syscall.h>
#include <unistd.h>

namespace
{

constexpr int READ_ATTEMPTS = 3;

// Closes its file descriptor in the destructor.
class Descriptor
{
public:
    explicit Descriptor(int descriptor) : m_descriptor(descriptor) {}
    Descriptor(const Descriptor&) = delete;
    Descriptor& operator=(const Descriptor&) = delete;
    ~Descriptor() { close(); }

    int get() const { return m_descriptor; }
    bool isOpen() const { return m_descriptor >= 0; }

    bool close()
    {
        const int descriptor = m_descriptor;
        m_descriptor = -1;
        return descriptor < 0 || ::close(descriptor) == 0;
    }

private:
    int m_descriptor;
};

bool isMainThread()
{
    return ::syscall(SYS_gettid) == ::getpid();
}

bool writeAll(int descriptor, std::string_view bytes)
{
    while (!bytes.empty()) {
        const ssize_t written = ::write(descriptor, bytes.data(), bytes.size());
        if (written < 0 && errno == EINTR)
            continue;
        if (written <= 0)
            return false;
        bytes.remove_prefix(static_cast<std::size_t>(written));
    }
    return true;
}

bool copyAll(int from, int to)
{
    char buffer[64 * 1024];
    for (;;) {
        const ssize_t count = ::read(from, buffer, sizeof buffer);
        if (count < 0 && errno == EINTR)
            continue;
        if (count <= 0)
            return count == 0;
        if (!writeAll(to, {buffer, static_cast<std::size_t>(count)}))
            return false;
    }
}

// The file to be written, after links are resolved, and its status if it exists.
struct Target {
    std::string path;
    struct stat status = {};
    bool exists = false;
};

bool resolve(const std::string& path, AtomicFile::Links links, Target& target)
{
    if (path.empty() || path.find('\0') != std::string::npos) {
        errno = EINVAL;
        return false;
    }
    target.path = std::filesystem::path(path).lexically_normal().native();
    if (::lstat(target.path.c_str(), &target.status) != 0)
        return errno == ENOENT;
    target.exists = true;
    if (!S_ISLNK(target.status.st_mode))
        return true;
    if (links == AtomicFile::Links::Replace) {
        target.exists = false; // the link itself is replaced, not the file it leads to
        return true;
    }
    char resolved[PATH_MAX];
    if (!::realpath(path.c_str(), resolved))
        return false;
    target.path = resolved;
    return ::stat(resolved, &target.status) == 0;
}

Descriptor openTemporary(const Target& target, std::string& name)
{
    const std::string folder = HiddenName::folderOf(target.path);
    int descriptor = -1;
    do {
        name = HiddenName::temporary(folder);
        descriptor =
            ::open(name.c_str(), O_WRONLY | O_CREAT | O_EXCL | O_CLOEXEC, 0666 & ~OwnerOnlyFiles::REFUSED);
    } while (descriptor < 0 && (errno == EEXIST || errno == EINTR));
    if (descriptor >= 0 && target.exists) {
        if (target.status.st_uid != ::geteuid() || target.status.st_gid != ::getegid()) {
            // Only root can give a file to another owner; other users become the owner of what they save.
            if (::fchown(descriptor, target.status.st_uid, target.status.st_gid) != 0)
                errno = 0;
        }
        ::fchmod(descriptor, target.status.st_mode & 07777 & ~OwnerOnlyFiles::REFUSED);
    }
    return Descriptor(descriptor);
}

// Has fill(descriptor) write a temporary file and renames it over the file at path.
template <typename Fill>
bool replaceFile(const std::string& path, AtomicFile::Durability durability, AtomicFile::Links links,
                 Fill fill)
{
    Target target;
    if (!resolve(path, links, target))
        return false;
    if (target.exists) {
        if (S_ISDIR(target.status.st_mode)) {
            errno = EISDIR;
            return false;
        }
        if (!S_ISREG(target.status.st_mode)) { // devices and pipes are written directly
            Descriptor device(::open(target.path.c_str(), O_WRONLY | O_CLOEXEC | O_NONBLOCK));
            return device.isOpen() && fill(device.get()) && device.close();
        }
        if (::faccessat(AT_FDCWD, target.path.c_str(), W_OK, AT_EACCESS) != 0)
            return false;
    }
    if (durability == AtomicFile::Durability::Automatic)
        durability = isMainThread() ? AtomicFile::Durability::SyncLater : AtomicFile::Durability::SyncNow;
    const bool isNow = durability == AtomicFile::Durability::SyncNow;

    std::string temporary;
    Descriptor descriptor = openTemporary(target, temporary);
    if (!descriptor.isOpen())
        return false;
    errno = 0;
    bool isDone = fill(descriptor.get()) && (!isNow || ::fdatasync(descriptor.get()) == 0);
    const int reason = errno;
    isDone = descriptor.close() && isDone;
    if (reason != 0)
        errno = reason;
    if (isDone) {
        isDone = isNow ? FileSyncQueue::publishSynced(temporary, target.path)
                       : FileSyncQueue::publish(temporary, target.path);
    }
    if (!isDone) {
        const int error = errno;
        ::unlink(temporary.c_str());
        errno = error;
    } else if (isNow && !FileSyncQueue::syncFolder(HiddenName::folderOf(target.path))) {
        // renamed already, so readers see it; the sync is tried again later
        FileSyncQueue::enqueue(target.path);
    }
    return isDone;
}

bool readOnce(const std::string& path, std::size_t maximum, std::string& bytes)
{
    const Descriptor descriptor(::open(path.c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK));
    struct stat status = {};
    if (!descriptor.isOpen() || ::fstat(descriptor.get(), &status) != 0)
        return false;
    if (!S_ISREG(status.st_mode) || static_cast<std::uintmax_t>(status.st_size) > maximum) {
        errno = EINVAL;
        return false;
    }
    bytes.resize(static_cast<std::size_t>(status.st_size));
    std::size_t size = 0;
    while (size < bytes.size()) {
        const ssize_t count = ::read(descriptor.get(), bytes.data() + size, bytes.size() - size);
        if (count < 0 && errno == EINTR)
            continue;
        if (count < 0)
            return false;
        if (count == 0)
            break;
        size += static_cast<std::size_t>(count);
    }
    bytes.resize(size);
    return true;
}

} // namespace

bool AtomicFile::write(const std::string& path, std::string_view bytes, Durability durability, Links links)
{
    const unsigned long moment = RefusedWrites::moment();
    if (!replaceFile(path, durability, links,
                     [bytes](int descriptor) { return writeAll(descriptor, bytes); }))
        return false;
    RefusedWrites::forgetUpTo(moment, path);
    return true;
}

bool AtomicFile::copy(const std::string& source, const std::string& target, Durability durability)
{
    const Descriptor from(::open(source.c_str(), O_RDONLY | O_CLOEXEC | O_NONBLOCK));
    struct stat status = {};
    if (!from.isOpen() || ::fstat(from.get(), &status) != 0 || !S_ISREG(status.st_mode))
        return false;
    return replaceFile(target, durability, Links::Replace,
                       [&from](int descriptor) { return copyAll(from.get(), descriptor); });
}

bool AtomicFile::read(const std::string& path, std::size_t maximum, std::string& bytes)
{
    // A disk that stumbles once must not make a title disappear from its list.
    for (int attempt = 1; attempt < READ_ATTEMPTS; ++attempt) {
        if (readOnce(path, maximum, bytes))
            return true;
        if (errno != EIO)
            return false;
    }
    return readOnce(path, maximum, bytes);
}
