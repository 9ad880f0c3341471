#pragma once

#include "messaging/services/ISoftKeyBoardController.h"
#include "messaging/services/SubCommonDefine.h"

#include <QList>
#include <QString>
#include <QStringList>
#include <functional>

// Replaces the process that shows the soft keyboard: records the calls, and answers only what a test lets it
// answer.
class FakeSoftKeyBoardController : public ISoftKeyBoardController
{
public:
    void show(SubCommonDefine::tagSoftKeyBoardInitData data) override
    {
        calls.append(QStringLiteral("show"));
        shown.append(data);
    }
    void close() override { calls.append(QStringLiteral("close")); }
    void dummyClose() override { calls.append(QStringLiteral("dummyClose")); }
    void simpleClose() override { calls.append(QStringLiteral("simpleClose")); }
    void sendKey(SubCommonDefine::tagSoftKeyBoardKeyData key) override
    {
        keys.append(key);
        if (onKey)
            onKey(key);
    }
    void sendLimitInfo(SubCommonDefine::taLimitInfo info) override
    {
        calls.append(QStringLiteral("sendLimitInfo"));
        limits.append(info);
    }
    void closeLimitBalloon() override { calls.append(QStringLiteral("closeLimitBalloon")); }
    void showMask() override { calls.append(QStringLiteral("showMask")); }
    void hideMask() override { calls.append(QStringLiteral("hideMask")); }
    void registerCallBack(ISoftKeyBoardControllerCallBack*) override
    {
        calls.append(QStringLiteral("registerCallBack"));
    }
    bool isReachable() const override { return alive; }

    QStringList calls;
    QList<SubCommonDefine::tagSoftKeyBoardInitData> shown;
    QList<SubCommonDefine::tagSoftKeyBoardKeyData> keys;
    QList<SubCommonDefine::taLimitInfo> limits;
    std::function<void(const SubCommonDefine::tagSoftKeyBoardKeyData&)> onKey; // may answer a key
    bool alive = true;
};
