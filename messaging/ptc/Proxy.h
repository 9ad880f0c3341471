// Base of the proxies of services.
#pragma once

#include "messaging/ptc/IProxyBase.h"

namespace PTC
{

class Proxy : public IProxy
{
public:
    Proxy(int id, bool remote);

    long getId() override;
    void setSender(ISender* sender) override;
    void setAdapterFactory(IAdapterFactory* factory) override;
    void setReceiver(IReceiver* receiver) override;

    // Sends a call; the data stays the caller's and is not needed after the return.
    virtual void invokeMethod(long methodId, void* data, long size);
    // Makes an adapter for target in this process's receiver and returns its id, -1 when the factory makes
    // none.
    virtual long createAdapter(long type, void* target);
    virtual void destoryAdapter(long id);
    // The client number of this process.
    virtual long getRRIdentity();
    // False when the process of the service is known to be gone. It is looked for again with each question.
    bool isConnected() const;

private:
    int m_id;
    bool m_remote;
    IAdapterFactory* m_adapterFactory = nullptr;
    ISender* m_sender = nullptr;
    IReceiver* m_receiver = nullptr;
};

} // namespace PTC
