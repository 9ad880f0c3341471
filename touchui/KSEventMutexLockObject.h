#pragma once

#include "touchui/KSLockObject.h"

// A lock that one of the registered objects holds at a time.
class KSEventMutexLockObject : public KSLockObject
{
public:
    // The parent owns the result; without a parent the caller does.
    static KSEventMutexLockObject* createFactory(QObject* parent);

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
    QObject* m_holder = nullptr;
    bool m_locked = false;
};
