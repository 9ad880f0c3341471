#include "messaging/ptc/CallbackProxy.h"

#include "messaging/ptc/Event.h"
#include "messaging/ptc/ISender.h"

namespace PTC
{

CallbackProxy::CallbackProxy(int id, bool remote) : m_id(id), m_remote(remote)
{
}

long CallbackProxy::getId()
{
    return m_id;
}

void CallbackProxy::setSender(ISender* sender)
{
    m_sender = sender;
}

void CallbackProxy::invokeMethod(long methodId, void* data, long size)
{
    m_sender->send(new Event(m_id, methodId, data, size, m_remote, true));
}

} // namespace PTC
