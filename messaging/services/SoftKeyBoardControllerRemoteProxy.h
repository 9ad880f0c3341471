// Packs the calls of ISoftKeyBoardController and sends them to the service.
#pragma once

#include "messaging/ptc/Proxy.h"
#include "messaging/services/ISoftKeyBoardController.h"

class SoftKeyBoardControllerRemoteProxy : public ISoftKeyBoardController, public PTC::Proxy
{
public:
    // Method ids of the wire.
    enum Method : long {
        METHOD_show = 1,
        METHOD_close = 2,
        METHOD_dummyClose = 3,
        METHOD_simpleClose = 4,
        METHOD_sendKey = 5,
        METHOD_sendLimitInfo = 6,
        METHOD_closeLimitBalloon = 7,
        METHOD_registerCallBack = 10,
        METHOD_showMask = 8,
        METHOD_hideMask = 9,
    };
    static constexpr long INTERFACE_ID = 95;
    static constexpr long CALLBACK_ADAPTER_TYPE = 96;

    explicit SoftKeyBoardControllerRemoteProxy(long id);

    void show(SubCommonDefine::tagSoftKeyBoardInitData data) override;
    void close() override;
    void dummyClose() override;
    void simpleClose() override;
    void sendKey(SubCommonDefine::tagSoftKeyBoardKeyData key) override;
    void sendLimitInfo(SubCommonDefine::taLimitInfo info) override;
    void closeLimitBalloon() override;
    void registerCallBack(ISoftKeyBoardControllerCallBack* target) override;
    void showMask() override;
    void hideMask() override;
    bool isReachable() const override;
};
