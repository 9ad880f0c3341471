// Base of the proxies with which a server calls what a client has registered. Its id is the client's adapter
// id.
#pragma once

#include "messaging/ptc/IProxyBase.h"

namespace PTC
{

class CallbackProxy : public IProxyBase
{
public:
    CallbackProxy(int id, bool remote);

    long getId() override;
    void setSender(ISender* sender) override;

    // Sends a call for the callback adapters of the peer; the data stays the caller's.
    virtual void invokeMethod(long methodId, void* data, long size);

private:
    int m_id;
    bool m_remote;
    ISender* m_sender = nullptr;
};

} // namespace PTC
