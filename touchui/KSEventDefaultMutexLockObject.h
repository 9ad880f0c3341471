#pragma once

#include "touchui/KSLockObject.h"
#include "touchui/TouchTimer.h"

class KSAppEventFilter;

// The lock of last resort, which any object may take: one at a time. A watchdog breaks every lock of the
// filter when its holder shows no sign of life for WATCHDOG_MSEC on the clock of the touch widgets.
class KSEventDefaultMutexLockObject : public KSLockObject
{
    Q_OBJECT
public:
    static constexpr int WATCHDOG_MSEC = 10000;

    // The one instance, made at the first call. Whoever asked first owns it; deleting it lets the next call
    // make another.
    static KSEventDefaultMutexLockObject* createFactory(KSAppEventFilter* filter, QObject* parent);
    ~KSEventDefaultMutexLockObject() override;

    int tryLock(QObject* obj, LOCKMETHOD_TYPE method, void* param) override;
    int tryUnlock(QObject* obj, LOCKMETHOD_TYPE method) override;
    bool isLocked() override { return m_locked; }
    // A yes is a sign of life of the holder.
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
