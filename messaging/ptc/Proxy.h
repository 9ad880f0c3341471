#pragma once

#include "messaging/ptc/IProxyBase.h"

namespace PTC
{

// Base class of the proxies of services.
class Proxy : public IProxy
{
public:
    Proxy(int id, bool remote);

    long getId() override;
    void setSender(ISender* sender) override;
    void setAdapterFactory(IAdapterFactory* factory) override;
    void setReceiver(IReceiver* receiver) override;

    // Sends a call; the caller keeps the data, which is not used after the return.
    virtual void invokeMethod(long methodId, void* data, long size);
    // Creates an adapter for target in this process's receiver and returns its id, or -1 on failure.
    virtual long createAdapter(long type, void* target);
    virtual void destoryAdapter(long id);
    // Returns the client number of this process.
    virtual long getRRIdentity();
    // Returns false if the process of the service is known not to be running. Each call begins a new
    // connection if there is none.
    bool isConnected() const;

private:
    int m_id;
    bool m_remote;
    IAdapterFactory* m_adapterFactory = nullptr;
    ISender* m_sender = nullptr;
    IReceiver* m_receiver = nullptr;
};

} // namespace PTC
