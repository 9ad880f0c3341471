#pragma once

#include "messaging/services/APPEventDefine.h"
#include "touchui/KSLockObject.h"

#include <QPointer>

class KSAppEventFilter;

// The touch lock between the processes of the appliance. It announces every lock and unlock of this process.
// While another process has announced a lock, it is active in the filter as a lock that no object can
// acquire.
class KSEventProcessLockObject : public KSLockObject
{
    Q_OBJECT
public:
    // Created by the application's filter, which sets s_instance.
    explicit KSEventProcessLockObject(KSAppEventFilter* filter, QObject* parent = nullptr);
    ~KSEventProcessLockObject() override;

    // Remembers the object and announces that it is in use; always returns -1.
    int tryLock(QObject* obj, LOCKMETHOD_TYPE method, void* param) override;
    // Forgets the object and announces that its use has ended; always returns -1.
    int tryUnlock(QObject* obj, LOCKMETHOD_TYPE method) override;
    bool isLocked() override { return false; }
    bool isLockedObj(QObject* obj, LOCKMETHOD_TYPE method) override;
    int registerObj(QObject* obj) override;
    int unregisterObj(QObject* obj) override;
    bool isRegisterObj(QObject* obj) override;
    int notify(QObject* obj, KSLockObject* sender, LOCK_MESSAGE message, void* param) override;
    void reset() override {}
    QList<QObject*> registeredObj() override { return {}; }

    // Type of the event that is sent to the remembered object when another process asks this one to close its
    // transient controls.
    static constexpr int RESTORE_ORIGINAL_TYPE = 1001;
    static KSEventProcessLockObject* s_instance;

public Q_SLOTS:
    // Called when another process has locked or unlocked. Runs in the thread of the emitter, which must be
    // the GUI thread.
    void slotGetAppEvent(APPEventDefine::_tagAPPEvent event);
    // Called when a touch begins in this process. If the other process only has a transient control open,
    // asks it to close that.
    void slotRestoreOriginal();
    // Called when another process asks this one to close its transient controls.
    void slotRestoreAll();

private:
    void send(APPEventDefine::LOCKTYPE type, bool on);

    KSAppEventFilter* m_filter;
    bool m_remoteObjectLocked = false;
    bool m_remoteLocked = false;
    QPointer<QObject> m_object;
    QList<QObject*> m_objects;
};
