#include "touchui/KSEventProcessLockObject.h"

#include "touchui/ITitlerAPPEventFilterController.h"
#include "touchui/KSAppEventFilter.h"

#include <QCoreApplication>
#include <QEvent>

KSEventProcessLockObject* KSEventProcessLockObject::s_instance = nullptr;

KSEventProcessLockObject::KSEventProcessLockObject(KSAppEventFilter* filter, QObject* parent)
    : KSLockObject(parent), m_filter(filter)
{
}

KSEventProcessLockObject::~KSEventProcessLockObject()
{
    if (s_instance == this)
        s_instance = nullptr;
}

int KSEventProcessLockObject::tryLock(QObject* obj, LOCKMETHOD_TYPE, void*)
{
    if (obj != nullptr)
        m_object = obj;
    send(APPEventDefine::LOCKTYPE_OBJECT, true);
    return -1;
}

int KSEventProcessLockObject::tryUnlock(QObject* obj, LOCKMETHOD_TYPE)
{
    if (m_object == obj)
        m_object.clear();
    send(APPEventDefine::LOCKTYPE_OBJECT, false);
    return -1;
}

bool KSEventProcessLockObject::isLockedObj(QObject*, LOCKMETHOD_TYPE)
{
    return false;
}

int KSEventProcessLockObject::registerObj(QObject* obj)
{
    if (!m_objects.contains(obj))
        m_objects.append(obj);
    return 0;
}

int KSEventProcessLockObject::unregisterObj(QObject* obj)
{
    m_objects.removeAll(obj);
    return 0;
}

// Always false: no touch can acquire this lock, so it blocks every touch while it is active.
bool KSEventProcessLockObject::isRegisterObj(QObject*)
{
    return false;
}

int KSEventProcessLockObject::notify(QObject*, KSLockObject*, LOCK_MESSAGE message, void*)
{
    switch (message) {
    case LOCK_MSG_LOCKED:
        send(APPEventDefine::LOCKTYPE_TOUCH, true);
        break;
    case LOCK_MSG_UNLOCKED:
    case LOCK_MSG_RESET:
        send(APPEventDefine::LOCKTYPE_TOUCH, false);
        break;
    case LOCK_MSG_CLEARED:
        break;
    }
    return 0;
}

void KSEventProcessLockObject::slotGetAppEvent(APPEventDefine::_tagAPPEvent event)
{
    if (event.lockType == APPEventDefine::LOCKTYPE_OBJECT)
        m_remoteObjectLocked = event.flag;
    else
        m_remoteLocked = event.flag;
    if (event.flag)
        m_filter->lock(this);
    else if (!m_remoteObjectLocked && !m_remoteLocked)
        m_filter->unlock();
}

void KSEventProcessLockObject::slotRestoreOriginal()
{
    ITitlerAPPEventFilterController* controller = ITitlerAPPEventFilterController::getInstance();
    if (m_remoteObjectLocked && !m_remoteLocked && controller != nullptr)
        controller->informRestoreOriginal(APPEventDefine::EVENTREVICER_NONE);
}

void KSEventProcessLockObject::slotRestoreAll()
{
    if (m_object != nullptr) {
        QEvent event(static_cast<QEvent::Type>(RESTORE_ORIGINAL_TYPE));
        QCoreApplication::sendEvent(m_object, &event);
    }
}

void KSEventProcessLockObject::send(APPEventDefine::LOCKTYPE type, bool on)
{
    if (ITitlerAPPEventFilterController* controller = ITitlerAPPEventFilterController::getInstance())
        controller->sendAPPEvent(type, on);
}
