#pragma once

#include "touchui/KSLockObject.h"

// A group of locks that works as one: each request is passed to the first lock for which the object is
// registered.
class KSEventMultiMutexLockObject : public KSLockObject
{
public:
    // The parent owns the result; without a parent the caller does.
    static KSEventMultiMutexLockObject* createFactory(QObject* parent);

    int tryLock(QObject* obj, LOCKMETHOD_TYPE method, void* param) override;
    int tryUnlock(QObject* obj, LOCKMETHOD_TYPE method) override;
    // Returns whether every lock of the group is locked; true for an empty group.
    bool isLocked() override;
    bool isLockedObj(QObject* obj, LOCKMETHOD_TYPE method) override;
    // Add and remove locks of the group, which the caller keeps owning. obj must be a lock object without a
    // meta-object of its own; for anything else they return -1 and change nothing.
    int registerObj(QObject* obj) override;
    int unregisterObj(QObject* obj) override;
    bool isRegisterObj(QObject* obj) override;
    int notify(QObject* obj, KSLockObject* sender, LOCK_MESSAGE message, void* param) override;
    void reset() override;
    QList<QObject*> registeredObj() override;

private:
    using KSLockObject::KSLockObject;
    static KSLockObject* partOf(QObject* obj);
    KSLockObject* partFor(QObject* obj) const;

    QList<KSLockObject*> m_parts;
};
