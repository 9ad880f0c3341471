// Base of the adapters of callbacks and notifications.
#pragma once

#include "messaging/ptc/IAdapterBase.h"

namespace PTC
{

class CallbackAdapter : public IAdapterBase
{
public:
    explicit CallbackAdapter(long id);
    long getId() override;

private:
    long m_id;
};

} // namespace PTC
