// Takes the titler's results off the wire.
#pragma once

#include "messaging/ptc/CallbackAdapter.h"

class ITitlerCallBack;

class TitlerCallBackAdapter : public PTC::CallbackAdapter
{
public:
    explicit TitlerCallBackAdapter(long id);

    void receive(PTC::Event* event) override;
    // target is an ITitlerCallBack*; not owned.
    void setTarget(void* target) override;

private:
    ITitlerCallBack* m_target = nullptr;
};
