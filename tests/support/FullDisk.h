// A disk that takes no more bytes, as the limit on the size of files makes it. What is written meanwhile, by
// any thread, is refused; files can still be made, renamed and removed. One at a time.
#pragma once

#include <csignal>
#include <sys/resource.h>

class FullDisk
{
public:
    FullDisk()
    {
        ::signal(SIGXFSZ, SIG_IGN);
        ::getrlimit(RLIMIT_FSIZE, &mLimit);
        const rlimit full = {0, mLimit.rlim_max};
        ::setrlimit(RLIMIT_FSIZE, &full);
    }
    ~FullDisk() { ::setrlimit(RLIMIT_FSIZE, &mLimit); }
    FullDisk(const FullDisk&) = delete;
    FullDisk& operator=(const FullDisk&) = delete;

private:
    rlimit mLimit = {};
};
