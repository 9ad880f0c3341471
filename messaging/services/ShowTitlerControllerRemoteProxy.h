// Packs the calls of IShowTitlerController and sends them to the service.
#pragma once

#include "messaging/ptc/Proxy.h"
#include "messaging/services/IShowTitlerController.h"

class ShowTitlerControllerRemoteProxy : public IShowTitlerController, public PTC::Proxy
{
public:
    // Method ids of the wire.
    enum Method : long {
        METHOD_setFolderStatus = 1,
        METHOD_registerCallBack = 2,
    };
    static constexpr long INTERFACE_ID = 92;
    static constexpr long CALLBACK_ADAPTER_TYPE = 93;

    explicit ShowTitlerControllerRemoteProxy(long id);

    void setFolderStatus(SubCommonDefine::tagFOLDER_TYPE folder) override;
    void registerCallBack(IShowTitlerControllerCallBack* target) override;
};
