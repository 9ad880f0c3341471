// The link to the lock service: announces touches and open controls of this process to the siblings, and
// takes their announcements. GUI thread.
#pragma once

#include "app/ServiceLink.h"
#include "messaging/services/APPEventDefine.h"
#include "messaging/services/IAPPEventFilter.h"
#include "touchui/ITitlerAPPEventFilterController.h"

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
    // Events that this process sent come back from the service; they are dropped.
    void postAPPEventFilterNotify(APPEventDefine::_tagAPPEvent event) override;
    void postRestoreOriginalNotify(APPEventDefine::_tagAPPEvent event) override;
    void postRestoreFocusNotify() override;

private:
    TitlerAPPEventFilterController() = default;
    ~TitlerAPPEventFilterController() override;

    static TitlerAPPEventFilterController* mInstance;

    ServiceLink<IAPPEventFilter> mLink;
};
