#pragma once

#include <csignal>
#include <sys/resource.h>

// Simulates a full disk by limiting the size of files to 0. Writes by any thread fail meanwhile; files can
// still be created, renamed and removed. Only one may exist at a time.
class FullDisk
{
public:
    FullDisk()
    {
        ::signal(SIGXFSZ, SIG_IGN);
        ::getrlimit(RLIMIT_FSIZE, &m_limit);
        const rlimit full = {0, m_limit.rlim_max};
        ::setrlimit(RLIMIT_FSIZE, &full);
    }
    ~FullDisk() { ::setrlimit(RLIMIT_FSIZE, &m_limit); }
    FullDisk(const FullDisk&) = delete;
    FullDisk& operator=(const FullDisk&) = delete;

private:
    rlimit m_limit = {};
};
