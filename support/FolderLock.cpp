#include "support/FolderLock.h"

#include <cerrno>
#include <fcntl.h>
#include <sys/file.h>
#include <unistd.h>

FolderLock::~FolderLock()
{
    release();
}

FolderLock::Result FolderLock::take(const std::string& folder, Kind kind)
{
    if (isHeld() && folder == m_folder && kind == m_kind)
        return Result::Taken;
    release();
    const int descriptor = ::open(folder.c_str(), O_RDONLY | O_DIRECTORY | O_CLOEXEC);
    if (descriptor < 0)
        return Result::Failed;
    const int operation = kind == Kind::Exclusive ? LOCK_EX : LOCK_SH;
    if (::flock(descriptor, operation | LOCK_NB) != 0) {
        const bool isBusy = errno == EWOULDBLOCK;
        ::close(descriptor);
        return isBusy ? Result::Busy : Result::Failed;
    }
    m_descriptor = descriptor;
    m_folder = folder;
    m_kind = kind;
    return Result::Taken;
}

void FolderLock::release()
{
    if (isHeld())
        ::close(m_descriptor);
    m_descriptor = -1;
}
