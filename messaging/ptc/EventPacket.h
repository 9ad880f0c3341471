#pragma once

namespace PTC
{

// An event and the id of the receiver it is addressed to, in the order of the wire.
struct EventPacket {
    long receiverId = 0;
    long objectId = 0;
    long methodId = 0;
    void* data = nullptr; // size bytes, allocated with new[]; passed on with the event
    bool callback = false;
    long size = 0;
    bool remote = false;
};

} // namespace PTC
