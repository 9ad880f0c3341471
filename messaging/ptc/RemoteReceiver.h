// The receivers of this process by id. The map is read only once packets arrive.
#pragma once

#include "messaging/ptc/IRemoteReceiver.h"

#include <map>
#include <memory>
#include <mutex>

namespace PTC
{

struct EventPacket;

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
    // Hands the packet's event to its receiver, in the calling thread. An unknown receiver id drops the
    // packet. The packet's data is taken over either way.
    virtual void handleEventPacket(EventPacket* packet);

protected:
    // Lets go every thread that a receiver holds up.
    void stopReceivers();

private:
    IReceiver* findReceiver(long id);

    std::map<long, std::unique_ptr<IReceiver>> m_receivers;
    std::mutex m_mutex; // the listener runs before the first addReceiver
    long m_id;
    long m_identity = -1;
};

} // namespace PTC
