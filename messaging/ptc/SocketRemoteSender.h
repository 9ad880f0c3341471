// Sends events to the process that listens on the port of a client number. One thread at a time.
#pragma once

#include "messaging/ptc/RemoteSender.h"
#include "messaging/ptc/SocketFrame.h"

#include <array>

namespace PTC
{
class Event;
}

class SocketRemoteSender : public PTC::RemoteSender
{
public:
    // id is the receiver id that every frame of this sender carries.
    explicit SocketRemoteSender(long id);
    ~SocketRemoteSender() override;
    SocketRemoteSender(const SocketRemoteSender&) = delete;
    SocketRemoteSender& operator=(const SocketRemoteSender&) = delete;

    // True when the connection stands. May be called again after a failure.
    bool initialize(long identity) override;
    // 0 on success, -1 otherwise.
    int connectServer();
    // Writes one whole frame and deletes the event. A payload above 20,424 bytes, and every call after the
    // connection was lost, is dropped. A peer that takes nothing for SEND_TIMEOUT_MS loses the connection.
    void send(PTC::Event* event) override;
    // Whether the connection stands and the peer has not closed it.
    bool isConnected() const override;

    static constexpr int SEND_TIMEOUT_MS = 10000;
    void setSendTimeout(int milliseconds) { m_sendTimeoutMs = milliseconds; }

private:
    void fillFrame(const PTC::Event& event);
    void drainAcknowledgements();
    bool sendFrame();
    bool waitForRoom();
    void closeSocket();

    int m_socket = -1;
    int m_sendTimeoutMs = SEND_TIMEOUT_MS;
    std::array<char, SocketFrame::FRAME_SIZE> m_frame{};
    long m_usedBytes = 0; // of m_frame; the rest is zero
};
