#pragma once

#include "messaging/ptc/IProxyBase.h"

namespace PTC
{

// Base class of the proxies with which a server calls the callbacks of a client. Its id is the id of the
// client's adapter.
class CallbackProxy : public IProxyBase
{
public:
    CallbackProxy(int id, bool remote);

    long getId() override;
    void setSender(ISender* sender) override;

    // Sends a call to the callback adapter of the peer; the caller keeps the data.
    virtual void invokeMethod(long methodId, void* data, long size);

private:
    int m_id;
    bool m_remote;
    ISender* m_sender = nullptr;
};

} // namespace PTC
