#pragma once

#include "touchui/KSLockObject.h"

// A lock that up to MAX_HOLDERS of the registered objects hold at the same time.
class KSEventClusterLockObject : public KSLockObject
{
public:
    static constexpr int MAX_HOLDERS = 5;

    // The parent owns the result; without a parent the caller does.
    static KSEventClusterLockObject* createFactory(QObject* parent);

    int tryLock(QObject* obj, LOCKMETHOD_TYPE method, void* param) override;
    int tryUnlock(QObject* obj, LOCKMETHOD_TYPE method) override;
    bool isLocked() override { return m_locked; }
    bool isLockedObj(QObject* obj, LOCKMETHOD_TYPE method) override;
    int registerObj(QObject* obj) override;
    int unregisterObj(QObject* obj) override;
    bool isRegisterObj(QObject* obj) override { return m_objects.contains(obj); }
    int notify(QObject* obj, KSLockObject* sender, LOCK_MESSAGE message, void* param) override;
    void reset() override;
    QList<QObject*> registeredObj() override { return m_objects; }

private:
    using KSLockObject::KSLockObject;

    QList<QObject*> m_objects;
    QList<QObject*> m_holders;
    bool m_locked = false;
};
