#include "support/LogFile.h"

#include <cerrno>
#include <cstdio>
#include <fcntl.h>
#include <sys/file.h>
#include <sys/stat.h>
#include <unistd.h>
#include <utility>

namespace
{

constexpr mode_t MODE = 0640;

} // namespace

LogFile::LogFile(std::string path) : mPath(std::move(path))
{
    open();
}

LogFile::~LogFile()
{
    close();
}

void LogFile::write(std::string_view line)
{
    const std::lock_guard lock(mMutex);
    if (mDescriptor < 0 || !isThatOfPath()) {
        close();
        open();
    }
    if (isFullWith(line.size()))
        makeRoomFor(line.size());
    if (mDescriptor < 0)
        return;
    while (::write(mDescriptor, line.data(), line.size()) < 0 && errno == EINTR) {
    }
}

void LogFile::open()
{
    mDescriptor = ::open(
        mPath.c_str(), O_WRONLY | O_APPEND | O_CREAT | O_NOFOLLOW | O_NONBLOCK | O_CLOEXEC | O_NOCTTY, MODE);
    if (mDescriptor < 0)
        return;
    struct stat status = {};
    if (::fstat(mDescriptor, &status) != 0 || !S_ISREG(status.st_mode)) {
        close();
        return;
    }
    // Independent of the umask, and also for files that an older version left open to others. Fails, without
    // effect, if another user owns the file.
    if ((status.st_mode & 07777) != MODE && ::fchmod(mDescriptor, MODE) != 0)
        errno = 0;
}

void LogFile::close()
{
    if (mDescriptor >= 0)
        ::close(mDescriptor);
    mDescriptor = -1;
}

// Returns false after another process has renamed the file or somebody has deleted it.
bool LogFile::isThatOfPath() const
{
    struct stat own = {};
    struct stat named = {};
    return ::fstat(mDescriptor, &own) == 0 && ::lstat(mPath.c_str(), &named) == 0 &&
           own.st_dev == named.st_dev && own.st_ino == named.st_ino;
}

bool LogFile::isFullWith(std::size_t size) const
{
    struct stat status = {};
    return mDescriptor >= 0 && ::fstat(mDescriptor, &status) == 0 && status.st_size > 0 &&
           static_cast<long long>(status.st_size) + static_cast<long long>(size) > MAX_BYTES;
}

void LogFile::makeRoomFor(std::size_t size)
{
    if (::flock(mDescriptor, LOCK_EX | LOCK_NB) != 0)
        return; // another process is rotating the files; this line still goes into the full one
    // Another process may have rotated the files after the size was read and before the lock was taken.
    if (isThatOfPath() && isFullWith(size) && !moveAside() && ::ftruncate(mDescriptor, 0) != 0)
        errno = 0;
    if (isThatOfPath()) {
        ::flock(mDescriptor, LOCK_UN);
        return;
    }
    close(); // also releases the lock
    open();
}

bool LogFile::moveAside() const
{
    const auto numbered = [this](int number) { return mPath + '.' + std::to_string(number); };
    for (int number = OLD_FILES; number > 1; --number)
        std::rename(numbered(number - 1).c_str(), numbered(number).c_str());
    return std::rename(mPath.c_str(), numbered(1).c_str()) == 0;
}
