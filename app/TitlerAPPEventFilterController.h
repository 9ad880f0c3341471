#pragma once

#include "app/ServiceLink.h"
#include "messaging/services/APPEventDefine.h"
#include "messaging/services/IAPPEventFilter.h"
#include "touchui/ITitlerAPPEventFilterController.h"

// The link to the lock service: reports touches and open controls of this process to the sibling processes,
// and receives their reports. GUI thread.
class TitlerAPPEventFilterController : public ITitlerAPPEventFilterController,
                                       public IAPPEventFilterCallBack,
                                       public IAPPEventFilterNotify
{
    Q_OBJECT

public:
    static TitlerAPPEventFilterController* getInstance();
    static void clearInstance();

    void initialize(TitlerToolFactory* factory) override;
    void sendAPPEvent(APPEventDefine::LOCKTYPE type, bool on) override;
    void informRestoreOriginal(APPEventDefine::EventRevicer receiver) override;

    void setClientID(int id) override;
    // Called for each event. The service also returns the events of this process, which are ignored.
    void postAPPEventFilterNotify(APPEventDefine::_tagAPPEvent event) override;
    void postRestoreOriginalNotify(APPEventDefine::_tagAPPEvent event) override;
    void postRestoreFocusNotify() override;

private:
    TitlerAPPEventFilterController() = default;
    ~TitlerAPPEventFilterController() override;

    static TitlerAPPEventFilterController* mInstance;

    ServiceLink<IAPPEventFilter> m_link;
};
