// Packs the calls of IPowerManager and sends them to the service.
#pragma once

#include "messaging/ptc/Proxy.h"
#include "messaging/services/IPowerManager.h"

class PowerManagerRemoteProxy : public IPowerManager, public PTC::Proxy
{
public:
    // Method ids of the wire.
    enum Method : long {
        METHOD_closeClient = 1,
        METHOD_unregisterCallBack = 2,
        METHOD_unregisterNotify = 3,
        METHOD_inProcessing = 4,
        METHOD_powerOff = 5,
        METHOD_willPowerOff = 6,
        METHOD_registerCallBack = 7,
        METHOD_registerNotify = 8,
    };
    static constexpr long INTERFACE_ID = 71;
    static constexpr long CALLBACK_ADAPTER_TYPE = 72;
    static constexpr long NOTIFY_ADAPTER_TYPE = 73;

    explicit PowerManagerRemoteProxy(long id);

    void closeClient(int clientId) override;
    void unregisterCallBack(int clientId) override;
    void unregisterNotify(int clientId) override;
    void inProcessing() override;
    void powerOff() override;
    void willPowerOff() override;
    void registerCallBack(IPowerManagerCallBack* target) override;
    void registerNotify(_tagPowerManagerNotify notify) override;
};
