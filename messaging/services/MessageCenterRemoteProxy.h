// Packs the calls of IMessageCenter and sends them to the service.
#pragma once

#include "messaging/ptc/Proxy.h"
#include "messaging/services/IMessageCenter.h"

class MessageCenterRemoteProxy : public IMessageCenter, public PTC::Proxy
{
public:
    // Method ids of the wire.
    enum Method : long {
        METHOD_setTopWindow = 1,
        METHOD_getTopWindow = 2,
        METHOD_postMessage = 3,
        METHOD_closeMessage = 4,
        METHOD_showBar = 5,
        METHOD_unregisterCallBack = 6,
        METHOD_unregisterNotify = 7,
        METHOD_registerCallBack = 8,
        METHOD_registerNotify = 9,
    };
    static constexpr long INTERFACE_ID = 65;
    static constexpr long CALLBACK_ADAPTER_TYPE = 66;
    static constexpr long NOTIFY_ADAPTER_TYPE = 67;

    explicit MessageCenterRemoteProxy(long id);

    void setTopWindow(MessageDefine::_tagTopWindowParam param) override;
    void getTopWindow(int clientId) override;
    void postMessage(MessageDefine::_tagMessageParam param) override;
    void closeMessage(MessageDefine::_tagCloseParam param) override;
    void showBar(int bar) override;
    void unregisterCallBack(int clientId) override;
    void unregisterNotify(int clientId) override;
    void registerCallBack(IMessageCenterCallBack* target) override;
    void registerNotify(_tagMessageCenterNotify notify) override;
};
