#include "touchui/KSEventMultiMutexLockObject.h"

#include <algorithm>

KSEventMultiMutexLockObject* KSEventMultiMutexLockObject::createFactory(QObject* parent)
{
    return new KSEventMultiMutexLockObject(parent);
}

KSLockObject* KSEventMultiMutexLockObject::partOf(QObject* obj)
{
    if (obj == nullptr || obj->metaObject() != &QObject::staticMetaObject)
        return nullptr;
    return dynamic_cast<KSLockObject*>(obj);
}

KSLockObject* KSEventMultiMutexLockObject::partFor(QObject* obj) const
{
    const auto found = std::find_if(m_parts.begin(), m_parts.end(),
                                    [obj](KSLockObject* part) { return part->isRegisterObj(obj); });
    return found == m_parts.end() ? nullptr : *found;
}

int KSEventMultiMutexLockObject::tryLock(QObject* obj, LOCKMETHOD_TYPE method, void* param)
{
    KSLockObject* part = partFor(obj);
    return part == nullptr ? -1 : part->tryLock(obj, method, param);
}

int KSEventMultiMutexLockObject::tryUnlock(QObject* obj, LOCKMETHOD_TYPE method)
{
    KSLockObject* part = partFor(obj);
    return part == nullptr ? -1 : part->tryUnlock(obj, method);
}

bool KSEventMultiMutexLockObject::isLocked()
{
    return std::all_of(m_parts.begin(), m_parts.end(), [](KSLockObject* part) { return part->isLocked(); });
}

bool KSEventMultiMutexLockObject::isLockedObj(QObject* obj, LOCKMETHOD_TYPE method)
{
    KSLockObject* part = partFor(obj);
    return part != nullptr && part->isLockedObj(obj, method);
}

int KSEventMultiMutexLockObject::registerObj(QObject* obj)
{
    KSLockObject* part = partOf(obj);
    // A group that contained itself would recurse without end.
    if (part == nullptr || part == this)
        return -1;
    if (!m_parts.contains(part))
        m_parts.append(part);
    return 0;
}

int KSEventMultiMutexLockObject::unregisterObj(QObject* obj)
{
    KSLockObject* part = partOf(obj);
    if (part == nullptr)
        return -1;
    m_parts.removeAll(part);
    return 0;
}

bool KSEventMultiMutexLockObject::isRegisterObj(QObject* obj)
{
    return partFor(obj) != nullptr;
}

int KSEventMultiMutexLockObject::notify(QObject*, KSLockObject*, LOCK_MESSAGE, void*)
{
    return 0;
}

void KSEventMultiMutexLockObject::reset()
{
    for (KSLockObject* part : m_parts)
        part->reset();
}

QList<QObject*> KSEventMultiMutexLockObject::registeredObj()
{
    return QList<QObject*>(m_parts.begin(), m_parts.end());
}
