// The functions of k2sys.h that are part of the program, not of the platform library.
#include "support/k2sys/k2sys.h"

#include <cstdlib>
#include <cstring>

namespace
{

const long MIN_PORT_OFFSET = -1000;
const long MAX_PORT_OFFSET = 60000;

} // namespace

int k2sys_log_dir(char* buffer, size_t size)
{
    const char* folder = std::getenv("K2SYS_LOG_DIR");
    if (folder == nullptr || *folder == '\0')
        folder = "/var/log";
    const std::size_t length = std::strlen(folder);
    if (buffer == nullptr || size == 0)
        return -1;
    if (length >= size) {
        buffer[0] = '\0';
        return -1;
    }
    std::memcpy(buffer, folder, length + 1);
    return 1;
}

int k2sys_port_offset(void)
{
    const char* offset = std::getenv("K2SYS_PORT_OFFSET");
    if (offset == nullptr || *offset == '\0')
        return 0;
    char* end = nullptr;
    const long value = std::strtol(offset, &end, 10);
    return *end == '\0' && value >= MIN_PORT_OFFSET && value <= MAX_PORT_OFFSET ? static_cast<int>(value) : 0;
}
