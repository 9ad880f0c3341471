#pragma once

#include "messaging/ptc/SocketFrame.h"

#include <linux/sockios.h>
#include <netinet/in.h>
#include <netinet/tcp.h>
#include <poll.h>
#include <sys/ioctl.h>
#include <sys/socket.h>
#include <unistd.h>

#include <QByteArray>
#include <QDeadlineTimer>

#include <cerrno>
#include <cstring>
#include <utility>

// A peer with a plain socket that builds its frames itself.
class TestSocket
{
public:
    enum Mode { Wait, DoNotWait };
    static constexpr int PATIENCE_MS = 20000;

    explicit TestSocket(long client, Mode mode = Wait)
        : m_socket(socket(AF_INET, SOCK_STREAM | (mode == DoNotWait ? SOCK_NONBLOCK : 0), 0))
    {
        const int on = 1;
        setsockopt(m_socket, IPPROTO_TCP, TCP_NODELAY, &on, sizeof on);
        const sockaddr_in address = addressOf(client);
        [[maybe_unused]] const int result =
            connect(m_socket, reinterpret_cast<const sockaddr*>(&address), sizeof address);
    }
    TestSocket(TestSocket&& other) noexcept : m_socket(std::exchange(other.m_socket, -1)) {}
    TestSocket(const TestSocket&) = delete;
    TestSocket& operator=(const TestSocket&) = delete;
    ~TestSocket()
    {
        if (m_socket != -1)
            close(m_socket);
    }

    static TestSocket fromDescriptor(int descriptor) { return TestSocket(descriptor, Adopt()); }

    static sockaddr_in addressOf(long client)
    {
        sockaddr_in address{};
        address.sin_family = AF_INET;
        address.sin_addr.s_addr = htonl(INADDR_LOOPBACK);
        address.sin_port = htons(SocketFrame::portOf(client));
        return address;
    }

    // Returns a whole frame of 20,480 bytes, built without the code of the program.
    static QByteArray frame(qint64 receiver, qint64 object, qint64 method, bool callback, qint64 size,
                            bool remote, const QByteArray& payload)
    {
        QByteArray bytes;
        for (const qint64 value : {receiver, object, method, qint64(0)})
            bytes.append(littleEndian(value));
        bytes.append(callback ? '\1' : '\0').append(QByteArray(7, '\0'));
        bytes.append(littleEndian(size));
        bytes.append(remote ? '\1' : '\0').append(QByteArray(7, '\0'));
        bytes.append(payload);
        return bytes.leftJustified(20480, '\0', true);
    }

    static QByteArray littleEndian(qint64 value)
    {
        QByteArray bytes;
        for (int i = 0; i < 8; ++i)
            bytes.append(static_cast<char>(static_cast<quint64>(value) >> (8 * i)));
        return bytes;
    }

    static qint64 longAt(const QByteArray& bytes, qsizetype offset)
    {
        quint64 value = 0;
        for (int i = 7; i >= 0; --i)
            value = value << 8 | static_cast<unsigned char>(bytes.at(offset + i));
        return static_cast<qint64>(value);
    }

    bool isConnected() const
    {
        sockaddr_in peer{};
        socklen_t size = sizeof peer;
        return getpeername(m_socket, reinterpret_cast<sockaddr*>(&peer), &size) == 0;
    }

    // Returns false when the connection fails.
    bool write(const QByteArray& bytes)
    {
        qsizetype sent = 0;
        while (sent < bytes.size()) {
            const ssize_t n = send(m_socket, bytes.constData() + sent,
                                   static_cast<size_t>(bytes.size() - sent), MSG_NOSIGNAL);
            if (n > 0)
                sent += n;
            else if (n == -1 && errno == EAGAIN)
                waitFor(POLLOUT, PATIENCE_MS);
            else
                return false;
        }
        return true;
    }

    // Writes the block up to count times and reads what arrives, until writing has blocked for a while.
    // Returns the number of complete blocks written.
    int writeUntilBlocked(const QByteArray& block, int count)
    {
        for (int i = 0; i < count; ++i) {
            qsizetype sent = 0;
            while (sent < block.size()) {
                readAvailable();
                const ssize_t n = send(m_socket, block.constData() + sent,
                                       static_cast<size_t>(block.size() - sent), MSG_NOSIGNAL | MSG_DONTWAIT);
                if (n > 0)
                    sent += n;
                else if (!waitFor(POLLOUT, 700))
                    return i;
            }
        }
        return count;
    }

    // Reads up to count bytes; fewer when the peer closes or the time is over.
    QByteArray read(qsizetype count)
    {
        QByteArray bytes;
        QDeadlineTimer deadline(PATIENCE_MS);
        while (bytes.size() < count && !deadline.hasExpired()) {
            if (!waitFor(POLLIN, 100))
                continue;
            char buffer[20480];
            const auto want = static_cast<size_t>(qMin<qsizetype>(count - bytes.size(), sizeof buffer));
            const ssize_t n = recv(m_socket, buffer, want, MSG_DONTWAIT);
            if (n <= 0) {
                m_reset = n == -1 && errno == ECONNRESET;
                break;
            }
            bytes.append(buffer, n);
        }
        return bytes;
    }

    QByteArray readAll() { return read(std::numeric_limits<int>::max()); }

    void readAvailable()
    {
        char buffer[4096];
        while (recv(m_socket, buffer, sizeof buffer, MSG_DONTWAIT) > 0) {
        }
    }

    // Makes closing the socket reset the connection, so that it does not stay in TIME_WAIT.
    void resetAtEnd() const
    {
        const linger none{1, 0};
        setsockopt(m_socket, SOL_SOCKET, SO_LINGER, &none, sizeof none);
    }

    bool nothingToRead()
    {
        char byte = 0;
        return !waitFor(POLLIN, 100) || recv(m_socket, &byte, 1, MSG_PEEK | MSG_DONTWAIT) <= 0;
    }

    bool isClosedByPeer()
    {
        readAvailable();
        char byte = 0;
        const ssize_t n = recv(m_socket, &byte, 1, MSG_PEEK | MSG_DONTWAIT);
        return n == 0 || (n == -1 && errno != EAGAIN);
    }

    // Returns whether everything written has arrived in the peer's receive buffer.
    bool everythingDelivered() const
    {
        int pending = -1;
        return ioctl(m_socket, SIOCOUTQ, &pending) == 0 && pending == 0;
    }

    // Returns whether the last read ended because the peer closed with unread data.
    bool endedByReset() const { return m_reset; }

private:
    struct Adopt {
    };
    TestSocket(int descriptor, Adopt) : m_socket(descriptor) {}

    bool waitFor(short events, int milliseconds) const
    {
        pollfd state{m_socket, events, 0};
        return poll(&state, 1, milliseconds) > 0;
    }

    int m_socket;
    bool m_reset = false;
};

// Accepts connections at the port of a client number.
class TestListener
{
public:
    explicit TestListener(long client) : m_socket(socket(AF_INET, SOCK_STREAM, 0))
    {
        const int on = 1;
        setsockopt(m_socket, SOL_SOCKET, SO_REUSEADDR, &on, sizeof on);
        const sockaddr_in address = TestSocket::addressOf(client);
        if (::bind(m_socket, reinterpret_cast<const sockaddr*>(&address), sizeof address) != 0 ||
            listen(m_socket, 10) != 0)
            qFatal("cannot listen");
    }
    ~TestListener() { close(m_socket); }
    TestListener(const TestListener&) = delete;
    TestListener& operator=(const TestListener&) = delete;

    TestSocket accept() { return TestSocket::fromDescriptor(::accept(m_socket, nullptr, nullptr)); }

private:
    int m_socket;
};
