#pragma once

#include "messaging/ptc/IRemoteReceiver.h"

#include <map>
#include <memory>
#include <mutex>

namespace PTC
{

struct EventPacket;

// Keeps the receivers of this process by id. Add them before initialize: packets that arrive earlier are
// dropped.
class RemoteReceiver : public IRemoteReceiver
{
public:
    explicit RemoteReceiver(long id);
    ~RemoteReceiver() override;
    RemoteReceiver(const RemoteReceiver&) = delete;
    RemoteReceiver& operator=(const RemoteReceiver&) = delete;

    long getId() override;
    bool initialize(long identity) override;
    long getIdentity() override;
    void addReceiver(IReceiver* receiver) override;

    virtual void run() = 0;
    // Passes the packet's event to its receiver, in the calling thread. Drops the packet if the receiver id
    // is unknown. Takes ownership of the packet's data in both cases.
    virtual void handleEventPacket(EventPacket* packet);

protected:
    // Releases every thread that is blocked in a receiver.
    void stopReceivers();

private:
    IReceiver* findReceiver(long id);

    std::map<long, std::unique_ptr<IReceiver>> m_receivers;
    std::mutex m_mutex; // guards the map, since packets arrive in threads of their own
    long m_id;
    long m_identity = -1;
};

} // namespace PTC
