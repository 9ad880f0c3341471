#include "messaging/ptc/CallbackAdapter.h"

namespace PTC
{

CallbackAdapter::CallbackAdapter(long id) : m_id(id)
{
}

long CallbackAdapter::getId()
{
    return m_id;
}

} // namespace PTC
