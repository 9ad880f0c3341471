#include "touchui/KSEventMutexLockObject.h"

KSEventMutexLockObject* KSEventMutexLockObject::createFactory(QObject* parent)
{
    return new KSEventMutexLockObject(parent);
}

int KSEventMutexLockObject::tryLock(QObject* obj, LOCKMETHOD_TYPE, void*)
{
    if (!isRegisterObj(obj))
        return -1;
    if (!m_locked) {
        m_locked = true;
        m_holder = obj;
        return 0;
    }
    return m_holder == obj ? 0 : -1;
}

int KSEventMutexLockObject::tryUnlock(QObject* obj, LOCKMETHOD_TYPE)
{
    if (!isRegisterObj(obj))
        return -1;
    if (m_locked && m_holder == obj) {
        reset();
        return 0;
    }
    return m_locked ? -1 : 0;
}

bool KSEventMutexLockObject::isLockedObj(QObject* obj, LOCKMETHOD_TYPE)
{
    return m_holder == obj;
}

int KSEventMutexLockObject::registerObj(QObject* obj)
{
    if (!m_objects.contains(obj))
        m_objects.append(obj);
    return 0;
}

int KSEventMutexLockObject::unregisterObj(QObject* obj)
{
    m_objects.removeAll(obj);
    return 0;
}

int KSEventMutexLockObject::notify(QObject*, KSLockObject*, LOCK_MESSAGE, void*)
{
    return 0;
}

void KSEventMutexLockObject::reset()
{
    m_locked = false;
    m_holder = nullptr;
}
