#pragma once

#include "touchui/KSLockObject.h"

// A group of locks that works as one: each request goes to the first of them that knows the object.
class KSEventMultiMutexLockObject : public KSLockObject
{
public:
    // The caller owns the result, unless the parent does.
    static KSEventMultiMutexLockObject* createFactory(QObject* parent);

    int tryLock(QObject* obj, LOCKMETHOD_TYPE method, void* param) override;
    int tryUnlock(QObject* obj, LOCKMETHOD_TYPE method) override;
    // Only when every part is; an empty group counts as locked.
    bool isLocked() override;
    bool isLockedObj(QObject* obj, LOCKMETHOD_TYPE method) override;
    // Take the parts of the group, which stay the caller's: lock objects without a meta-object of their own.
    // Anything else gives -1 and changes nothing.
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
