#pragma once

#include "touchui/KSLockObject.h"
#include "touchui/TouchTimer.h"

class KSAppEventFilter;

// The default lock, which any object may hold, one at a time. A watchdog breaks every lock of the filter if
// the holder receives no touch event for WATCHDOG_MSEC, measured with TouchTimer.
class KSEventDefaultMutexLockObject : public KSLockObject
{
    Q_OBJECT
public:
    static constexpr int WATCHDOG_MSEC = 10000;

    // Returns the only instance, which the first call creates with the given parent. After it was deleted,
    // the next call creates another one.
    static KSEventDefaultMutexLockObject* createFactory(KSAppEventFilter* filter, QObject* parent);
    ~KSEventDefaultMutexLockObject() override;

    int tryLock(QObject* obj, LOCKMETHOD_TYPE method, void* param) override;
    int tryUnlock(QObject* obj, LOCKMETHOD_TYPE method) override;
    bool isLocked() override { return m_locked; }
    // Restarts the watchdog if obj is the holder.
    bool isLockedObj(QObject* obj, LOCKMETHOD_TYPE method) override;
    int registerObj(QObject* obj) override;
    int unregisterObj(QObject* obj) override;
    bool isRegisterObj(QObject* obj) override;
    int notify(QObject* obj, KSLockObject* sender, LOCK_MESSAGE message, void* param) override;
    void reset() override;
    QList<QObject*> registeredObj() override { return {}; }

private Q_SLOTS:
    void lockedTimeout();

private:
    KSEventDefaultMutexLockObject(KSAppEventFilter* filter, QObject* parent);

    static KSEventDefaultMutexLockObject* s_instance;
    QObject* m_lockObj = nullptr;
    bool m_locked = false;
    TouchTimer m_timer;
    KSAppEventFilter* m_filter;
};
