#include "app/TitlerAPPEventFilterController.h"

#include "app/EarlyRequests.h"
#include "app/TitlerToolFactory.h"

#include <mutex>

namespace
{
constexpr long SERVICE_ID = 1;
}

namespace
{
std::mutex instanceMutex;
}

TitlerAPPEventFilterController* TitlerAPPEventFilterController::mInstance = nullptr;

TitlerAPPEventFilterController* TitlerAPPEventFilterController::getInstance()
{
    const std::lock_guard lock(instanceMutex);
    if (!mInstance) {
        mInstance = new TitlerAPPEventFilterController;
        ITitlerAPPEventFilterController::setInstance(mInstance);
    }
    return mInstance;
}

void TitlerAPPEventFilterController::clearInstance()
{
    ITitlerAPPEventFilterController::setInstance(nullptr);
    delete mInstance;
    mInstance = nullptr;
}

TitlerAPPEventFilterController::~TitlerAPPEventFilterController()
{
    if (mProxy && mConnected) {
        mProxy->unregisterCallBack(mClientId);
        mProxy->unregisterNotify(mClientId);
    }
}

void TitlerAPPEventFilterController::initialize(TitlerToolFactory* factory)
{
    if (mConnected)
        return;
    mProxy = factory->createService<IAPPEventFilter>(SERVICE_ID);
    if (!mProxy)
        return;
    EarlyRequests::getInstance()->expectClientId(SERVICE_ID);
    mProxy->registerCallBack(this);
}

void TitlerAPPEventFilterController::setClientID(int id)
{
    mClientId = id;
    if (mProxy)
        mProxy->registerNotify({this, id});
    mConnected = true;
    EarlyRequests::getInstance()->clientIdCame(SERVICE_ID);
}

void TitlerAPPEventFilterController::sendAPPEvent(APPEventDefine::LOCKTYPE type, bool on)
{
    if (mProxy)
        mProxy->postAPPEventFilter({mClientId, type, on, APPEventDefine::EVENTREVICER_TITLER});
}

void TitlerAPPEventFilterController::informRestoreOriginal(APPEventDefine::EventRevicer receiver)
{
    if (mProxy)
        mProxy->postRestoreOriginal(
            {mClientId, APPEventDefine::LOCKTYPE_NONE, false, APPEventDefine::EVENTREVICER_TITLER});
    if (receiver == APPEventDefine::EVENTREVICER_RESTORE_ALL)
        Q_EMIT signalRestoreOriginal();
}

void TitlerAPPEventFilterController::postAPPEventFilterNotify(APPEventDefine::_tagAPPEvent event)
{
    if (event.eventReceiver != APPEventDefine::EVENTREVICER_TITLER)
        Q_EMIT signalSendAPPEvent(event);
}

void TitlerAPPEventFilterController::postRestoreOriginalNotify(APPEventDefine::_tagAPPEvent event)
{
    if (event.eventReceiver != APPEventDefine::EVENTREVICER_TITLER)
        Q_EMIT signalRestoreOriginal();
}

void TitlerAPPEventFilterController::postRestoreFocusNotify()
{
    Q_EMIT signalRestoreFocus();
}
