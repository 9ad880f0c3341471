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
    LOCKMETHOD_OTHER = 2, // also for forced locks
};

enum LOCK_MESSAGE {
    LOCK_MSG_LOCKED = 0,   // a lock was acquired
    LOCK_MSG_UNLOCKED = 1, // the last holder has released it
    LOCK_MSG_CLEARED = 2,  // the set of active locks was cleared
    LOCK_MSG_RESET = 3,    // the lock was broken
};

enum LOCK_NOTIFY_FLAGS {
    LOCK_NOTIFY_ALL = 0,
    LOCK_NOTIFY_EXCEPT_SENDER = 1,
};

// Decides which objects may receive touches. The locks are logical: no thread waits for one, and all calls
// are made in the GUI thread. Objects are compared but never dereferenced, so pointers to deleted objects are
// harmless.
//
// Classes that may be part of a multi mutex have no meta-object of their own (no Q_OBJECT).
class KSLockObject : public QObject
{
public:
    using QObject::QObject;

    // Returns 0 if the object holds the lock afterwards, -1 if it was refused.
    virtual int tryLock(QObject* obj, LOCKMETHOD_TYPE method, void* param) = 0;
    // Returns 0 if the lock was released, -1 otherwise.
    virtual int tryUnlock(QObject* obj, LOCKMETHOD_TYPE method) = 0;
    virtual bool isLocked() = 0;
    virtual bool isLockedObj(QObject* obj, LOCKMETHOD_TYPE method) = 0;
    // Makes an object eligible for the lock. Returns 0 on success, -1 otherwise.
    virtual int registerObj(QObject* obj) = 0;
    virtual int unregisterObj(QObject* obj) = 0;
    virtual bool isRegisterObj(QObject* obj) = 0;
    // Called when another lock of the filter has changed.
    virtual int notify(QObject* obj, KSLockObject* sender, LOCK_MESSAGE message, void* param) = 0;
    // Removes every holder.
    virtual void reset() = 0;
    virtual QList<QObject*> registeredObj() = 0;
};
