#include "support/DescriptorLimit.h"

#include <sys/resource.h>

#include <algorithm>

namespace DescriptorLimit
{

void raise()
{
    rlimit limit{};
    if (getrlimit(RLIMIT_NOFILE, &limit) != 0 || limit.rlim_cur >= WANTED)
        return;
    limit.rlim_cur = std::min<rlim_t>(WANTED, limit.rlim_max);
    setrlimit(RLIMIT_NOFILE, &limit);
}

} // namespace DescriptorLimit
