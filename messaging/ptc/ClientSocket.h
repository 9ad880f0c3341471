// The socket of an outgoing connection to 127.0.0.1. Nothing here blocks, but for the two operations that say
// how long they wait.
//
// Not locked. waitUntilConnected, waitForRoom and interrupt may run beside each other; everything else needs
// a lock of the owner.
#pragma once

class ClientSocket
{
public:
    enum class Outcome {
        Done,    // all of it
        Pending, // the rest is still to come
        Failed,  // the connection is of no use any more
    };

    ClientSocket() = default;
    ~ClientSocket();
    ClientSocket(const ClientSocket&) = delete;
    ClientSocket& operator=(const ClientSocket&) = delete;

    // Begins a connection in place of the one there is. Failed when nobody listens, Pending while the
    // listener has no room. Errors of the local socket are printed to standard output.
    Outcome beginConnect(unsigned short port);
    // Waits until a pending connection has come to a result.
    void waitUntilConnected(int milliseconds) const;
    // The result so far; with Failed the socket is closed.
    Outcome finishConnect();

    bool isConnecting() const { return m_state == State::Connecting; }
    bool isOpen() const { return m_state == State::Open; }
    // Whether the peer has closed an open connection.
    bool peerHasClosed() const;

    // Writes what is left of a frame whose first used bytes are given and whose others are zero. sent counts
    // the bytes that have gone and is moved on.
    Outcome writeFrame(const char* bytes, long used, long& sent);
    // Takes at most this many bytes of acknowledgements.
    void takeAcknowledgements(int most);
    // Waits, without limit, until the peer takes more, and takes its acknowledgements meanwhile: a peer that
    // is held up in sending them would never read on. False when the connection has ended.
    bool waitForRoom();
    // Bytes that have been written and have not arrived at the peer.
    long undelivered() const;

    // Ends a wait in another thread; the connection is of no use afterwards.
    void interrupt();
    void close();

private:
    enum class State { Closed, Connecting, Open };

    bool open();

    int m_socket = -1;
    State m_state = State::Closed;
};
