#include "messaging/ptc/SocketFrame.h"

#include "support/k2sys/k2sys.h"

namespace SocketFrame
{

unsigned short portOf(long identity)
{
    const long offset = k2sys_port_offset();
    if (identity < 1 || identity > 65535 || identity + offset < 1 || identity + offset > 65535)
        return 0;
    return static_cast<unsigned short>(identity + offset);
}

} // namespace SocketFrame
