// Preloaded under a program, counts what it does to the files below one folder and makes one operation fail,
// or all from one on, or kills the process in the middle of one. Knows nothing about the program.
//
// FAULTS_ROOT   the folder; what happens elsewhere is neither counted nor changed
// FAULTS_AT     number of the operation, counted from 1; 0 or unset: none
// FAULTS_ERROR  ENOSPC, EROFS or EIO. Files opened for reading only are counted for EIO alone.
// FAULTS_HOW    once, on (this one and all that follow) or kill
//
// The program can find faults_start, faults_stop, faults_count and faults_hit by dlsym. Until faults_start is
// called nothing is counted, unless FAULTS_NOW is set.
#include <atomic>
#include <cerrno>
#include <climits>
#include <csignal>
#include <cstdarg>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <dlfcn.h>
#include <fcntl.h>
#include <stdio_ext.h>
#include <string>
#include <sys/stat.h>
#include <sys/types.h>
#include <sys/uio.h>
#include <unistd.h>

namespace
{

enum class Kind { Read, Change };
enum class How { Once, On, Kill };

constexpr int DESCRIPTORS = 65536;

struct Plan {
    std::string root;
    long at = 0;
    int error = EIO;
    How how = How::Once;

    Plan()
    {
        if (const char* folder = std::getenv("FAULTS_ROOT"))
            root = folder;
        if (const char* number = std::getenv("FAULTS_AT"))
            at = std::atol(number);
        const std::string name = std::getenv("FAULTS_ERROR") ? std::getenv("FAULTS_ERROR") : "";
        error = name == "ENOSPC" ? ENOSPC : name == "EROFS" ? EROFS : EIO;
        const std::string manner = std::getenv("FAULTS_HOW") ? std::getenv("FAULTS_HOW") : "";
        how = manner == "kill" ? How::Kill : manner == "on" ? How::On : How::Once;
    }
};

const Plan& plan()
{
    static const Plan* const made = new Plan; // used until the very end of the process
    return *made;
}

std::atomic<bool> gCounting{std::getenv("FAULTS_NOW") != nullptr};
std::atomic<long> gCount{0};
std::atomic<bool> gWatched[DESCRIPTORS];
char gHit[512];
std::atomic<bool> gHasHit{false};

template <typename Function>
Function next(Function, const char* name)
{
    return reinterpret_cast<Function>(::dlsym(RTLD_NEXT, name));
}
#define REAL(function) (next(&::function, #function))

bool isBelow(const char* path)
{
    const std::string& root = plan().root;
    return path != nullptr && !root.empty() && std::strncmp(path, root.c_str(), root.size()) == 0 &&
           (path[root.size()] == '/' || path[root.size()] == '\0');
}

bool isWatched(int descriptor)
{
    return descriptor >= 0 && descriptor < DESCRIPTORS && gWatched[descriptor];
}

void watch(int descriptor, bool on)
{
    if (descriptor >= 0 && descriptor < DESCRIPTORS)
        gWatched[descriptor] = on;
}

std::string pathOf(int descriptor)
{
    char path[PATH_MAX];
    const ssize_t length =
        ::readlink(("/proc/self/fd/" + std::to_string(descriptor)).c_str(), path, sizeof path);
    return length < 0 ? std::string() : std::string(path, static_cast<std::size_t>(length));
}

[[noreturn]] void die()
{
    ::kill(::getpid(), SIGKILL);
    for (;;)
        ::pause();
}

// Counts the operation and tells whether it is to fail, with errno set.
bool fails(Kind kind, const char* operation, const char* path)
{
    const Plan& now = plan();
    if (!gCounting || (kind == Kind::Read && (now.error != EIO || now.how == How::Kill)))
        return false;
    const long number = ++gCount;
    if (now.at <= 0 || number < now.at || (number > now.at && now.how != How::On))
        return false;
    if (!gHasHit.exchange(true))
        std::snprintf(gHit, sizeof gHit, "%s %s", operation, path ? path : "");
    errno = now.error;
    return true;
}

bool failsOrDies(Kind kind, const char* operation, const char* path)
{
    if (!fails(kind, operation, path))
        return false;
    if (plan().how == How::Kill)
        die();
    return true;
}

bool failsOn(int descriptor, const char* operation)
{
    return gCounting && isWatched(descriptor) &&
           failsOrDies(Kind::Change, operation, pathOf(descriptor).c_str());
}

// A write that fails has left a part behind, as on a disk that has become full.
template <typename Write>
bool failsInTheMiddle(int descriptor, const char* operation, std::size_t size, Write write)
{
    if (!gCounting || !isWatched(descriptor) || !fails(Kind::Change, operation, pathOf(descriptor).c_str()))
        return false;
    const int error = errno;
    if (size > 1)
        write(size / 2);
    if (plan().how == How::Kill)
        die();
    errno = error;
    return true;
}

template <typename Open>
int opened(const char* path, int flags, Open open)
{
    if (!isBelow(path))
        return open();
    const bool isRead = (flags & O_ACCMODE) == O_RDONLY && (flags & O_CREAT) == 0;
    if (failsOrDies(isRead ? Kind::Read : Kind::Change, isRead ? "open for reading" : "open", path))
        return -1;
    const int descriptor = open();
    watch(descriptor, descriptor >= 0);
    return descriptor;
}

bool hasMode(int flags)
{
    return (flags & O_CREAT) != 0 || (flags & O_TMPFILE) == O_TMPFILE;
}

std::FILE* openedFile(const char* path, const char* mode, const char* name)
{
    using Open = std::FILE* (*)(const char*, const char*);
    const auto open = reinterpret_cast<Open>(::dlsym(RTLD_NEXT, name));
    if (!isBelow(path))
        return open(path, mode);
    const bool isRead = mode[0] == 'r' && std::strchr(mode, '+') == nullptr;
    if (failsOrDies(isRead ? Kind::Read : Kind::Change, isRead ? "open for reading" : "open", path))
        return nullptr;
    std::FILE* const file = open(path, mode);
    if (file)
        watch(::fileno(file), !isRead);
    return file;
}

} // namespace

extern "C" {

void faults_start()
{
    gCounting = true;
}

void faults_stop()
{
    gCounting = false;
}

long faults_count()
{
    return gCount;
}

// What failed first; empty when nothing has.
const char* faults_hit()
{
    return gHit;
}

#define MODE_OF(flags)                                                                                       \
    mode_t mode = 0;                                                                                         \
    if (hasMode(flags)) {                                                                                    \
        va_list arguments;                                                                                   \
        va_start(arguments, flags);                                                                          \
        mode = static_cast<mode_t>(va_arg(arguments, int));                                                  \
        va_end(arguments);                                                                                   \
    }

int open(const char* path, int flags, ...)
{
    MODE_OF(flags)
    return opened(path, flags, [&] { return REAL(open)(path, flags, mode); });
}

int open64(const char* path, int flags, ...)
{
    MODE_OF(flags)
    return opened(path, flags, [&] { return REAL(open64)(path, flags, mode); });
}

int openat(int folder, const char* path, int flags, ...)
{
    MODE_OF(flags)
    const std::string whole = path[0] == '/' || folder == AT_FDCWD ? path : pathOf(folder) + '/' + path;
    return opened(whole.c_str(), flags, [&] { return REAL(openat)(folder, path, flags, mode); });
}

int openat64(int folder, const char* path, int flags, ...)
{
    MODE_OF(flags)
    const std::string whole = path[0] == '/' || folder == AT_FDCWD ? path : pathOf(folder) + '/' + path;
    return opened(whole.c_str(), flags, [&] { return REAL(openat64)(folder, path, flags, mode); });
}

int __open_2(const char* path, int flags)
{
    return opened(path, flags, [&] { return REAL(open)(path, flags, 0); });
}

int __open64_2(const char* path, int flags)
{
    return opened(path, flags, [&] { return REAL(open64)(path, flags, 0); });
}

std::FILE* fopen(const char* path, const char* mode)
{
    return openedFile(path, mode, "fopen");
}

std::FILE* fopen64(const char* path, const char* mode)
{
    return openedFile(path, mode, "fopen64");
}

// What was put into the stream reaches the file at its end.
int fclose(std::FILE* file)
{
    const int descriptor = ::fileno(file);
    const bool isLost = isWatched(descriptor) && failsOn(descriptor, "write at close");
    const int error = errno;
    watch(descriptor, false);
    if (isLost)
        ::__fpurge(file);
    const int result = REAL(fclose)(file);
    if (isLost)
        errno = error;
    return isLost ? EOF : result;
}

int close(int descriptor)
{
    watch(descriptor, false);
    return REAL(close)(descriptor);
}

ssize_t write(int descriptor, const void* bytes, std::size_t size)
{
    const auto real = REAL(write);
    if (failsInTheMiddle(descriptor, "write", size,
                         [&](std::size_t part) { return real(descriptor, bytes, part); }))
        return -1;
    return real(descriptor, bytes, size);
}

ssize_t pwrite(int descriptor, const void* bytes, std::size_t size, off_t offset)
{
    const auto real = REAL(pwrite);
    if (failsInTheMiddle(descriptor, "write", size,
                         [&](std::size_t part) { return real(descriptor, bytes, part, offset); }))
        return -1;
    return real(descriptor, bytes, size, offset);
}

ssize_t pwrite64(int descriptor, const void* bytes, std::size_t size, off64_t offset)
{
    const auto real = REAL(pwrite64);
    if (failsInTheMiddle(descriptor, "write", size,
                         [&](std::size_t part) { return real(descriptor, bytes, part, offset); }))
        return -1;
    return real(descriptor, bytes, size, offset);
}

ssize_t writev(int descriptor, const iovec* parts, int count)
{
    return failsOn(descriptor, "write") ? -1 : REAL(writev)(descriptor, parts, count);
}

ssize_t copy_file_range(int from, off64_t* fromOffset, int to, off64_t* toOffset, std::size_t size,
                        unsigned flags)
{
    return failsOn(to, "write") ? -1 : REAL(copy_file_range)(from, fromOffset, to, toOffset, size, flags);
}

int fsync(int descriptor)
{
    return failsOn(descriptor, "fsync") ? -1 : REAL(fsync)(descriptor);
}

int fdatasync(int descriptor)
{
    return failsOn(descriptor, "fdatasync") ? -1 : REAL(fdatasync)(descriptor);
}

int ftruncate(int descriptor, off_t size)
{
    return failsOn(descriptor, "ftruncate") ? -1 : REAL(ftruncate)(descriptor, size);
}

int ftruncate64(int descriptor, off64_t size)
{
    return failsOn(descriptor, "ftruncate") ? -1 : REAL(ftruncate64)(descriptor, size);
}

int rename(const char* from, const char* to)
{
    return isBelow(to) && failsOrDies(Kind::Change, "rename", to) ? -1 : REAL(rename)(from, to);
}

int renameat(int fromFolder, const char* from, int toFolder, const char* to)
{
    return isBelow(to) && failsOrDies(Kind::Change, "rename", to)
               ? -1
               : REAL(renameat)(fromFolder, from, toFolder, to);
}

int renameat2(int fromFolder, const char* from, int toFolder, const char* to, unsigned flags)
{
    return isBelow(to) && failsOrDies(Kind::Change, "rename", to)
               ? -1
               : REAL(renameat2)(fromFolder, from, toFolder, to, flags);
}

int unlink(const char* path)
{
    return isBelow(path) && failsOrDies(Kind::Change, "unlink", path) ? -1 : REAL(unlink)(path);
}

int unlinkat(int folder, const char* path, int flags)
{
    const std::string whole = path[0] == '/' || folder == AT_FDCWD ? path : pathOf(folder) + '/' + path;
    return isBelow(whole.c_str()) && failsOrDies(Kind::Change, "unlink", whole.c_str())
               ? -1
               : REAL(unlinkat)(folder, path, flags);
}

int remove(const char* path)
{
    return isBelow(path) && failsOrDies(Kind::Change, "unlink", path) ? -1 : REAL(remove)(path);
}

int rmdir(const char* path)
{
    return isBelow(path) && failsOrDies(Kind::Change, "rmdir", path) ? -1 : REAL(rmdir)(path);
}

int link(const char* from, const char* to)
{
    return isBelow(to) && failsOrDies(Kind::Change, "link", to) ? -1 : REAL(link)(from, to);
}

int linkat(int fromFolder, const char* from, int toFolder, const char* to, int flags)
{
    return isBelow(to) && failsOrDies(Kind::Change, "link", to)
               ? -1
               : REAL(linkat)(fromFolder, from, toFolder, to, flags);
}

int mkdir(const char* path, mode_t mode)
{
    return isBelow(path) && failsOrDies(Kind::Change, "mkdir", path) ? -1 : REAL(mkdir)(path, mode);
}

} // extern "C"
