// An event with the receiver it is for, in the order of the wire.
#pragma once

namespace PTC
{

struct EventPacket {
    long receiverId = 0;
    long objectId = 0;
    long methodId = 0;
    void* data = nullptr; // size bytes, allocated with array new; handed on with the event
    bool callback = false;
    long size = 0;
    bool remote = false;
};

} // namespace PTC
