#pragma once

#include "touchui/KSLockObject.h"

#include <QList>
#include <QMap>
#include <QObject>
#include <QPointer>

class QWidget;

// Decides for the whole application which object may receive a touch. It is installed on the application
// object and filters every event first. Only one object at a time holds the default lock; a touch on any
// other object is swallowed, including its updates and its end. Events of windows (QWindow), which precede
// those of widgets, are passed on unchanged, except key presses. GUI thread only.
//
// An object whose touch was accepted always receives an end of it: if a lock breaks the touch, the object is
// disabled, its window is hidden or blocked by a dialog, or the end itself is swallowed, it is sent a
// QEvent::TouchCancel. The lock of a destroyed object is released.
class KSAppEventFilter : public QObject
{
    Q_OBJECT
public:
    // Returns the filter that was created last; null if there is none.
    static KSAppEventFilter* current();

    explicit KSAppEventFilter(QObject* parent = nullptr);
    // Deletes every lock object that was created here or passed to keepNewLockObject.
    ~KSAppEventFilter() override;

    bool eventFilter(QObject* obj, QEvent* event) override;

    // Creates a lock of the type, or uses the given one, and makes the object or objects eligible for it. The
    // result is owned by this filter. Null on failure.
    virtual KSLockObject* createLockObject(QObject* obj, KSLockObject* lock, LOCKOBJECT_TYPE type,
                                           void* param);
    virtual KSLockObject* createLockObject(QList<QObject*> objs, KSLockObject* lock, LOCKOBJECT_TYPE type,
                                           void* param);
    // As createLockObject; in addition, touches can acquire the lock from now on.
    virtual KSLockObject* registerLockObject(QObject* obj, KSLockObject* lock, LOCKOBJECT_TYPE type,
                                             void* param);
    virtual KSLockObject* registerLockObject(QList<QObject*> objs, KSLockObject* lock, LOCKOBJECT_TYPE type,
                                             void* param);
    virtual int unregisterLockObject(QObject* obj, KSLockObject* lock);

    // Calls the object's eventFilter() for every widget event that this filter passes on, in the order of
    // registration. A deleted object is unregistered automatically.
    virtual void registerEventFilter(QObject* obj);
    virtual void unegisterEventFilter(QObject* obj);

    virtual bool doEventFilter(QObject* obj, QEvent* event);
    // These four return 0 to pass the event on, 1 to swallow it.
    virtual int doLock(QObject* obj, QEvent* event);
    virtual int doLockTouchBegin(QObject* obj, QEvent* event);
    virtual int doLockTouchUpdate(QObject* obj, QEvent* event);
    virtual int doLockTouchEnd(QObject* obj, QEvent* event);

    // Return 0 for success, 1 for failure.
    virtual int tryLock(QObject* obj, LOCKMETHOD_TYPE method);
    virtual int tryUnlock(QObject* obj, LOCKMETHOD_TYPE method);
    // Returns whether any lock is active; the arguments are ignored.
    virtual bool isLock(QObject* obj, LOCKMETHOD_TYPE method);
    virtual LOCKMETHOD_TYPE getLockMethod(QEvent* event);

    virtual KSLockObject* preCreateLockObject(QObject* obj, KSLockObject* lock, LOCKOBJECT_TYPE type,
                                              void* param);
    virtual KSLockObject* preCreateLockObject(QList<QObject*> objs, KSLockObject* lock, LOCKOBJECT_TYPE type,
                                              void* param);
    virtual int initLockObject(QObject* obj, KSLockObject* lock, LOCKOBJECT_TYPE type, void* param);
    virtual int initLockObject(QList<QObject*> objs, KSLockObject* lock, LOCKOBJECT_TYPE type, void* param);
    virtual void addRegLockObject(QObject* obj, KSLockObject* lock, LOCKOBJECT_TYPE type, void* param);
    virtual void addRegLockObject(QList<QObject*> objs, KSLockObject* lock, LOCKOBJECT_TYPE type,
                                  void* param);
    virtual void removeRegLockObject(KSLockObject* lock);
    virtual void notifyRegLockObjects(QObject* obj, KSLockObject* sender, LOCK_MESSAGE message, void* param,
                                      LOCK_NOTIFY_FLAGS flags);
    virtual void deleteLockObject(KSLockObject* lock);

    virtual void addActivateLockObject(QObject* obj, KSLockObject* lock, LOCKMETHOD_TYPE method);
    virtual void removeActivateLockObject(QObject* obj, KSLockObject* lock, LOCKMETHOD_TYPE method);
    virtual void clearActivateLockObject();
    // Returns the active locks with the objects that hold them; a forced lock has none.
    virtual QMap<KSLockObject*, QList<QObject*>> activateLockObjects();
    // Takes ownership. Ignores null and locks that are owned already.
    virtual void keepNewLockObject(KSLockObject* lock);

    virtual bool notifyRegEventFilter(QObject* obj, QEvent* event);
    // Returns false for a disabled widget.
    virtual bool isEnable(QObject* obj);
    // Returns whether the object has an accepted touch that has not ended.
    bool isTouched(QObject* obj) const;

    // Breaks every lock, activates this one instead, and cancels the current touches.
    void lock(KSLockObject* lockObject);
    // Breaks every lock and cancels the current touches.
    void unlock();
    // Calls unlock() and notifies every lock object.
    void resetLock();
    // Sends a key press to the soft keyboard if that is open. Returns whether it was sent.
    bool onKeyPress(QObject* obj, QEvent* event);

Q_SIGNALS:
    // Emitted when a press or touch begins anywhere in this process.
    void signalEventBegin();

private:
    static int priorityOf(LOCKOBJECT_TYPE type);
    void watchIgnoredTouch(QEvent* event);
    void noticeAcceptedTouch(const QObject* obj);
    void watchTouch(QObject* obj);
    void forgetTouch(QObject* obj);
    void touchedObjectDestroyed(QObject* obj);
    void breakLocks();
    // Cancels all touches, or only those in a window.
    void cancelTouches(const QWidget* window = nullptr);
    void cancelTouchWhenDisabled(QObject* obj);
    void cancelTouchWhenHidden(QObject* obj);

    QMap<int, QList<KSLockObject*>> m_registered; // by priority; 6 is asked first
    QMap<KSLockObject*, QList<QObject*>> m_active;
    QList<KSLockObject*> m_owned;
    QList<QObject*> m_eventFilters;
    QList<QObject*> m_touched; // objects with an accepted touch that has not ended; none of them is destroyed
    // the last object whose touch was accepted, until it receives another event of the touch
    QPointer<QObject> m_begun;
    int m_begunId = -1;
};
