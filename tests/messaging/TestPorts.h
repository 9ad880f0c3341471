#pragma once

#include <netinet/in.h>
#include <sys/socket.h>
#include <unistd.h>

#include <QByteArray>
#include <QtGlobal>

// Chooses free ports for each test program.
namespace TestPorts
{

inline bool isFree(int port)
{
    const int probe = socket(AF_INET, SOCK_STREAM, 0);
    sockaddr_in address{};
    address.sin_family = AF_INET;
    address.sin_addr.s_addr = htonl(INADDR_LOOPBACK);
    address.sin_port = htons(static_cast<unsigned short>(port));
    const bool free = ::bind(probe, reinterpret_cast<sockaddr*>(&address), sizeof address) == 0;
    close(probe);
    return free;
}

// Sets K2SYS_PORT_OFFSET so that the ports of the client numbers 1000 to 1008 are free and below those that
// the system assigns to clients. Returns the offset.
inline int useFreeOffset()
{
    for (int i = 0; i < 2000; ++i) {
        const int offset = 9000 + (static_cast<int>(getpid()) + i) % 2000 * 10;
        if (isFree(1000 + offset) && isFree(1002 + offset) && isFree(1003 + offset)) {
            qputenv("K2SYS_PORT_OFFSET", QByteArray::number(offset));
            return offset;
        }
    }
    qFatal("no free ports");
    return 0;
}

} // namespace TestPorts
