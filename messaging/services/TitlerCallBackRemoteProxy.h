// Sends the results of a create session to the process that registered for them.
#pragma once

#include "messaging/ptc/CallbackProxy.h"
#include "messaging/services/ITitlerCallBack.h"

class TitlerCallBackRemoteProxy : public ITitlerCallBack, public PTC::CallbackProxy
{
public:
    // Method ids of the wire.
    enum Method : long { METHOD_finishTitlerCreateCallback = 1 };

    // id is the peer's adapter id.
    explicit TitlerCallBackRemoteProxy(long id);

    void finishTitlerCreateCallback(_CALLBACK_TITLER_PARAMTER param) override;
};
