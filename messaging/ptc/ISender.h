#pragma once

#include "messaging/ptc/IObject.h"

#include <chrono>

namespace PTC
{

class Event;

// Sends events to another process.
class ISender : public IObject
{
public:
    // Sends and deletes the event; the caller keeps its data. Failures are not reported.
    virtual void send(Event* event) = 0;
    // Returns false if the peer is known not to be running, so that nothing sent to it can arrive.
    virtual bool isConnected() const { return true; }
    // As isConnected, but also begins a new connection, without waiting for it, if the old one was lost.
    virtual bool reconnect() { return isConnected(); }
    // Begins a connection to the process with that client number, unless there is one, without waiting for
    // it. Returns false if nobody listens there.
    virtual bool beginConnect(long) { return isConnected(); }
    // Stops sending: waiting events are sent until the deadline, and later ones are dropped.
    virtual void finish(std::chrono::steady_clock::time_point) {}
};

// A sender that has a connection to another process.
class IRemoteSender : public ISender
{
public:
    // Connects to the process with that client number.
    virtual bool initialize(long identity) = 0;
    virtual void setId(long id) = 0;
};

} // namespace PTC
