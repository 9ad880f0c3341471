#pragma once

#include "messaging/services/APPEventDefine.h"
#include "touchui/KSLockObject.h"

#include <QPointer>

class KSAppEventFilter;

// The touch lock between the processes of the appliance. It announces every lock and unlock of this process,
// and while another process has announced one it stands in the filter as a lock that no object can pass. It
// accepts no object itself.
class KSEventProcessLockObject : public KSLockObject
{
    Q_OBJECT
public:
    // Made by the application's filter, which fills s_instance.
    explicit KSEventProcessLockObject(KSAppEventFilter* filter, QObject* parent = nullptr);
    ~KSEventProcessLockObject() override;

    // Remembers the object and announces that a touch is going on in it; always -1.
    int tryLock(QObject* obj, LOCKMETHOD_TYPE method, void* param) override;
    // Forgets the object and announces the end; always -1.
    int tryUnlock(QObject* obj, LOCKMETHOD_TYPE method) override;
    bool isLocked() override { return false; }
    bool isLockedObj(QObject* obj, LOCKMETHOD_TYPE method) override;
    int registerObj(QObject* obj) override;
    int unregisterObj(QObject* obj) override;
    bool isRegisterObj(QObject* obj) override;
    int notify(QObject* obj, KSLockObject* sender, LOCK_MESSAGE message, void* param) override;
    void reset() override {}
    QList<QObject*> registeredObj() override { return {}; }

    // Whether an object of this process holds a touch that was announced.
    bool isLocallyLocked() const { return m_locallyLocked; }

    // What a remembered object is sent when another process asks this one to give way.
    static constexpr int RestoreOriginalType = 1001;
    static KSEventProcessLockObject* s_instance;

public Q_SLOTS:
    // Another process has locked or unlocked. Runs in the emitter's thread, which must be the GUI thread.
    void slotGetAppEvent(APPEventDefine::_tagAPPEvent event);
    // A touch has begun here: asks the other process to give way if it only holds a transient control open.
    void slotRestoreOriginal();
    // Another process asks this one to give way.
    void slotRestoreAll();

private:
    void send(APPEventDefine::LOCKTYPE type, bool on);

    KSAppEventFilter* m_filter;
    bool m_locallyLocked = false;
    bool m_remoteObjectLocked = false;
    bool m_remoteLocked = false;
    QPointer<QObject> m_object;
    QList<QObject*> m_objects;
};
