// Takes events to another process.
#pragma once

#include "messaging/ptc/IObject.h"

#include <chrono>

namespace PTC
{

class Event;

class ISender : public IObject
{
public:
    // Sends and deletes the event; its data stays the caller's. Failures are not reported.
    virtual void send(Event* event) = 0;
    // False when the peer is known to be gone, so that nothing that is sent can arrive.
    virtual bool isConnected() const { return true; }
    // As isConnected; a connection that was lost is begun anew, without waiting for it.
    virtual bool reconnect() { return isConnected(); }
    // Begins a connection to the process with that client number without waiting for it, unless there is one.
    // False when nobody listens there.
    virtual bool beginConnect(long) { return isConnected(); }
    // Ends the sending: what still waits has until the deadline, and later calls are dropped.
    virtual void finish(std::chrono::steady_clock::time_point) {}
};

class IRemoteSender : public ISender
{
public:
    // Connects to the process with that client number.
    virtual bool initialize(long identity) = 0;
    virtual void setId(long id) = 0;
};

} // namespace PTC
