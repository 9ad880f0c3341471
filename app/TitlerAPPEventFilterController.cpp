#include "app/TitlerAPPEventFilterController.h"

#include <mutex>

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

TitlerAPPEventFilterController::~TitlerAPPEventFilterController() = default;

void TitlerAPPEventFilterController::initialize(TitlerToolFactory* factory)
{
    m_link.connectTo(factory, this);
}

void TitlerAPPEventFilterController::setClientID(int id)
{
    m_link.clientIdCame(id, this);
}

void TitlerAPPEventFilterController::sendAPPEvent(APPEventDefine::LOCKTYPE type, bool on)
{
    if (m_link)
        m_link->postAPPEventFilter({m_link.clientId(), type, on, APPEventDefine::EVENTREVICER_TITLER});
}

void TitlerAPPEventFilterController::informRestoreOriginal(APPEventDefine::EventRevicer receiver)
{
    if (m_link)
        m_link->postRestoreOriginal(
            {m_link.clientId(), APPEventDefine::LOCKTYPE_NONE, false, APPEventDefine::EVENTREVICER_TITLER});
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
