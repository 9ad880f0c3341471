// Unpacks the answers of the service ShowTitlerController and calls the target, in the receiver's thread.
#pragma once

#include "messaging/ptc/CallbackAdapter.h"

class IShowTitlerControllerCallBack;

class ShowTitlerControllerCallBackAdapter : public PTC::CallbackAdapter
{
public:
    // Method ids of the wire.
    enum Method : long {
        METHOD_showTitler = 1,
    };

    explicit ShowTitlerControllerCallBackAdapter(long id);

    void receive(PTC::Event* event) override;
    // target is an IShowTitlerControllerCallBack*; not owned.
    void setTarget(void* target) override;

private:
    IShowTitlerControllerCallBack* m_target = nullptr;
};
