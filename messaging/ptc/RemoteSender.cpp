#include "messaging/ptc/RemoteSender.h"

namespace PTC
{

RemoteSender::RemoteSender(long id) : m_id(id)
{
}

long RemoteSender::getId()
{
    return m_id;
}

void RemoteSender::setId(long id)
{
    m_id = id;
}

bool RemoteSender::initialize(long identity)
{
    m_identity = identity;
    return true;
}

long RemoteSender::getIdentity()
{
    return m_identity;
}

} // namespace PTC
