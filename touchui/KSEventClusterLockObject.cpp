#include "touchui/KSEventClusterLockObject.h"

KSEventClusterLockObject* KSEventClusterLockObject::createFactory(QObject* parent)
{
    return new KSEventClusterLockObject(parent);
}

int KSEventClusterLockObject::tryLock(QObject* obj, LOCKMETHOD_TYPE, void*)
{
    if (m_holders.size() >= MAX_HOLDERS || !isRegisterObj(obj))
        return -1;
    m_locked = true;
    if (!m_holders.contains(obj))
        m_holders.append(obj);
    return 0;
}

int KSEventClusterLockObject::tryUnlock(QObject* obj, LOCKMETHOD_TYPE)
{
    const bool held = m_holders.removeOne(obj);
    if (m_holders.isEmpty()) {
        m_locked = false;
        return 0;
    }
    return held ? 0 : -1;
}

bool KSEventClusterLockObject::isLockedObj(QObject* obj, LOCKMETHOD_TYPE)
{
    return m_holders.contains(obj);
}

int KSEventClusterLockObject::registerObj(QObject* obj)
{
    if (!m_objects.contains(obj))
        m_objects.append(obj);
    return 0;
}

int KSEventClusterLockObject::unregisterObj(QObject* obj)
{
    m_objects.removeAll(obj);
    return 0;
}

int KSEventClusterLockObject::notify(QObject*, KSLockObject*, LOCK_MESSAGE, void*)
{
    return 0;
}

void KSEventClusterLockObject::reset()
{
    m_holders.clear();
    m_locked = false;
}
