#pragma once

#include "messaging/ptc/IAdapterBase.h"

namespace PTC
{

// Base class of the adapters that receive callbacks and notifications.
class CallbackAdapter : public IAdapterBase
{
public:
    explicit CallbackAdapter(long id);
    long getId() override;

private:
    long m_id;
};

} // namespace PTC
