// Packs the calls of IProjectDataManager and sends them to the service.
#pragma once

#include "messaging/ptc/Proxy.h"
#include "messaging/services/IProjectDataManager.h"

class ProjectDataManagerRemoteProxy : public IProjectDataManager, public PTC::Proxy
{
public:
    // Method ids of the wire.
    enum Method : long {
        METHOD_unregisterCallBack = 7,
        METHOD_unregisterNotifyCallBack = 8,
        METHOD_registerCallBack = 9,
        METHOD_registerNotifyCallBack = 10,
    };
    static constexpr long INTERFACE_ID = 76;
    static constexpr long CALLBACK_ADAPTER_TYPE = 77;
    static constexpr long NOTIFY_ADAPTER_TYPE = 78;

    explicit ProjectDataManagerRemoteProxy(long id);

    void unregisterCallBack(int clientId) override;
    void unregisterNotifyCallBack(int clientId) override;
    void registerCallBack(IProjectDataManagerCallBack* target) override;
    void registerNotifyCallBack(_tagProjectDataManagerNotify notify) override;
};
