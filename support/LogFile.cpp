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

LogFile::LogFile(std::string path) : m_path(std::move(path))
{
    open();
}

LogFile::~LogFile()
{
    close();
}

void LogFile::write(std::string_view line)
{
    const std::lock_guard lock(m_mutex);
    if (m_descriptor < 0 || !isThatOfPath()) {
        close();
        open();
    }
    if (isFullWith(line.size()))
        makeRoomFor(line.size());
    if (m_descriptor < 0)
        return;
    while (::write(m_descriptor, line.data(), line.size()) < 0 && errno == EINTR) {
    }
}

void LogFile::open()
{
    m_descriptor = ::open(
        m_path.c_str(), O_WRONLY | O_APPEND | O_CREAT | O_NOFOLLOW | O_NONBLOCK | O_CLOEXEC | O_NOCTTY, MODE);
    if (m_descriptor < 0)
        return;
    struct stat status = {};
    if (::fstat(m_descriptor, &status) != 0 || !S_ISREG(status.st_mode)) {
        close();
        return;
    }
    // Independent of the umask, and also for files that an older version left open to others. Fails, without
    // effect, if another user owns the file.
    if ((status.st_mode & 07777) != MODE && ::fchmod(m_descriptor, MODE) != 0)
        errno = 0;
}

void LogFile::close()
{
    if (m_descriptor >= 0)
        ::close(m_descriptor);
    m_descriptor = -1;
}

// Returns false after another process has renamed the file or somebody has deleted it.
bool LogFile::isThatOfPath() const
{
    struct stat own = {};
    struct stat named = {};
    return ::fstat(m_descriptor, &own) == 0 && ::lstat(m_path.c_str(), &named) == 0 &&
           own.st_dev == named.st_dev && own.st_ino == named.st_ino;
}

bool LogFile::isFullWith(std::size_t size) const
{
    struct stat status = {};
    return m_descriptor >= 0 && ::fstat(m_descriptor, &status) == 0 && status.st_size > 0 &&
           static_cast<long long>(status.st_size) + static_cast<long long>(size) > MAX_BYTES;
}

void LogFile::makeRoomFor(std::size_t size)
{
    if (::flock(m_descriptor, LOCK_EX | LOCK_NB) != 0)
        return; // another process is rotating the files; this line still goes into the full one
    // Another process may have rotated the files after the size was read and before the lock was taken.
    if (isThatOfPath() && isFullWith(size) && !moveAside() && ::ftruncate(m_descriptor, 0) != 0)
        errno = 0;
    if (isThatOfPath()) {
        ::flock(m_descriptor, LOCK_UN);
        return;
    }
    close(); // also releases the lock
    open();
}

bool LogFile::moveAside() const
{
    const auto numbered = [this](int number) { return m_path + '.' + std::to_string(number); };
    for (int number = OLD_FILES; number > 1; --number)
        std::rename(numbered(number - 1).c_str(), numbered(number).c_str());
    return std::rename(m_path.c_str(), numbered(1).c_str()) == 0;
}
