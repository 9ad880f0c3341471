// The service side of ShowTitlerController: calls to what its clients have registered.
#pragma once

#include "messaging/ptc/CallbackProxy.h"
#include "messaging/services/IShowTitlerControllerCallBack.h"

class ShowTitlerControllerCallBackRemoteProxy : public IShowTitlerControllerCallBack,
                                                public PTC::CallbackProxy
{
public:
    // id is the client's adapter id.
    explicit ShowTitlerControllerCallBackRemoteProxy(long id);

    void showTitler() override;
};
