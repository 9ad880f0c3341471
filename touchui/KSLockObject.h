#pragma once

#include <QList>
#include <QObject>

enum LOCKOBJECT_TYPE {
    LOCKOBJECT_CLUSTER = 0,
    LOCKOBJECT_MUTEX = 1,
    LOCKOBJECT_MULTIMUTEX = 2,
    LOCKOBJECT_DEFAULTMUTEX = 3,
    LOCKOBJECT_PROCESS = 4,
};

enum LOCKMETHOD_TYPE {
    LOCKMETHOD_TOUCH = 0,
    LOCKMETHOD_MOUSE = 1,
    LOCKMETHOD_OTHER = 2, // also forced locks
};

enum LOCK_MESSAGE {
    LOCK_MSG_LOCKED = 0,   // a lock has been taken
    LOCK_MSG_UNLOCKED = 1, // the last holder has let go
    LOCK_MSG_CLEARED = 2,  // the active set was emptied
    LOCK_MSG_RESET = 3,    // the lock was broken
};

enum LOCK_NOTIFY_FLAGS {
    LOCK_NOTIFY_ALL = 0,
    LOCK_NOTIFY_EXCEPT_SENDER = 1,
};

// A policy for who may hold the touch. The locks are logical: no thread ever waits for one, and all calls are
// made in the GUI thread. Objects are compared, never looked into, so a pointer to a deleted object does no
// harm.
//
// Kinds that may be part of a multi mutex have no meta-object of their own (no Q_OBJECT).
class KSLockObject : public QObject
{
public:
    using QObject::QObject;

    // 0: the object now holds the lock; -1: refused.
    virtual int tryLock(QObject* obj, LOCKMETHOD_TYPE method, void* param) = 0;
    // 0: released; -1: not released.
    virtual int tryUnlock(QObject* obj, LOCKMETHOD_TYPE method) = 0;
    virtual bool isLocked() = 0;
    virtual bool isLockedObj(QObject* obj, LOCKMETHOD_TYPE method) = 0;
    // Makes an object eligible; 0 when it is, -1 when it cannot be.
    virtual int registerObj(QObject* obj) = 0;
    virtual int unregisterObj(QObject* obj) = 0;
    virtual bool isRegisterObj(QObject* obj) = 0;
    // A lock event elsewhere in the filter.
    virtual int notify(QObject* obj, KSLockObject* sender, LOCK_MESSAGE message, void* param) = 0;
    // Forgets every holder.
    virtual void reset() = 0;
    virtual QList<QObject*> registeredObj() = 0;
};
