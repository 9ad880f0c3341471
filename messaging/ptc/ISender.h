// Takes events to another process.
#pragma once

#include "messaging/ptc/IObject.h"

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
};

class IRemoteSender : public ISender
{
public:
    // Connects to the process with that client number.
    virtual bool initialize(long identity) = 0;
    virtual void setId(long id) = 0;
};

} // namespace PTC
