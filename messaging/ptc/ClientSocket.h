#pragma once

// The socket of an outgoing connection to 127.0.0.1. Only waitUntilConnected and waitForRoom block.
//
// Not synchronised. waitUntilConnected, waitForRoom and interrupt may run concurrently; all other calls need
// a lock of the owner.
class ClientSocket
{
public:
    enum class Outcome {
        Done,    // completed
        Pending, // not complete yet
        Failed,  // the connection is unusable
    };

    ClientSocket() = default;
    ~ClientSocket();
    ClientSocket(const ClientSocket&) = delete;
    ClientSocket& operator=(const ClientSocket&) = delete;

    // Closes the current connection and begins a new one. Failed if nobody listens, Pending while the
    // listener's queue is full. Errors of the local socket are printed to standard output.
    Outcome beginConnect(unsigned short port);
    // Waits at most this long until a pending connection is established or has failed.
    void waitUntilConnected(int milliseconds) const;
    // Returns the result so far. If it is Failed the socket is closed.
    Outcome finishConnect();

    bool isConnecting() const { return m_state == State::Connecting; }
    bool isOpen() const { return m_state == State::Open; }
    // Returns whether the peer has closed an open connection.
    bool peerHasClosed() const;

    // Writes the rest of a frame that consists of used bytes at bytes, padded with zeros. sent is the number
    // of bytes that have been written and is advanced.
    Outcome writeFrame(const char* bytes, long used, long& sent);
    // Reads and discards at most this many bytes of acknowledgements.
    void takeAcknowledgements(int most);
    // Waits without limit until the socket can be written, and discards acknowledgements meanwhile: a peer
    // that cannot send them would stop reading. Returns false when the connection has ended.
    bool waitForRoom();
    // Returns the number of bytes that have been written but have not arrived at the peer.
    long undelivered() const;

    // Ends a wait in another thread. The connection is unusable afterwards.
    void interrupt();
    void close();

private:
    enum class State { Closed, Connecting, Open };

    bool open();

    int m_socket = -1;
    State m_state = State::Closed;
};
