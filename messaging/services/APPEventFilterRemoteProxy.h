// Packs the calls of IAPPEventFilter and sends them to the service.
#pragma once

#include "messaging/ptc/Proxy.h"
#include "messaging/services/IAPPEventFilter.h"

class APPEventFilterRemoteProxy : public IAPPEventFilter, public PTC::Proxy
{
public:
    // Method ids of the wire.
    enum Method : long {
        METHOD_postAPPEventFilter = 1,
        METHOD_postRestoreOriginal = 2,
        METHOD_postRestoreFocus = 3,
        METHOD_unregisterCallBack = 4,
        METHOD_unregisterNotify = 5,
        METHOD_registerCallBack = 6,
        METHOD_registerNotify = 7,
    };
    static constexpr long INTERFACE_ID = 1;
    static constexpr long CALLBACK_ADAPTER_TYPE = 2;
    static constexpr long NOTIFY_ADAPTER_TYPE = 3;

    explicit APPEventFilterRemoteProxy(long id);

    void postAPPEventFilter(APPEventDefine::_tagAPPEvent event) override;
    void postRestoreOriginal(APPEventDefine::_tagAPPEvent event) override;
    void postRestoreFocus() override;
    void unregisterCallBack(int clientId) override;
    void unregisterNotify(int clientId) override;
    void registerCallBack(IAPPEventFilterCallBack* target) override;
    void registerNotify(_tagAPPEventFilterNotify notify) override;
};
