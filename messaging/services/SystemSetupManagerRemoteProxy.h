// Packs the calls of ISystemSetupManager and sends them to the service.
#pragma once

#include "messaging/ptc/Proxy.h"
#include "messaging/services/ISystemSetupManager.h"

class SystemSetupManagerRemoteProxy : public ISystemSetupManager, public PTC::Proxy
{
public:
    // Method ids of the wire.
    enum Method : long {
        METHOD_getLanguageInfo = 1,
        METHOD_getInformation = 16,
        METHOD_unregisterCallBack = 62,
        METHOD_unregisterNotifyCallBack = 63,
        METHOD_registerCallBack = 64,
        METHOD_registerNotifyCallBack = 65,
    };
    static constexpr long INTERFACE_ID = 114;
    static constexpr long CALLBACK_ADAPTER_TYPE = 115;
    static constexpr long NOTIFY_ADAPTER_TYPE = 116;

    explicit SystemSetupManagerRemoteProxy(long id);

    void getLanguageInfo(int clientId) override;
    void getInformation(int clientId) override;
    void unregisterCallBack(int clientId) override;
    void unregisterNotifyCallBack(int clientId) override;
    void registerCallBack(ISystemSetupManagerCallBack* target) override;
    void registerNotifyCallBack(_tagSystemSetupManagerNotify notify) override;
};
