#pragma once

#include "touchui/KSLockObject.h"

#include <QList>
#include <QMap>
#include <QObject>
#include <QPointer>

class QWidget;

// The application-wide gate that decides which object may receive a touch: it is installed on the application
// object and sees every event first. One object at a time holds the default lock; a touch on any other is
// swallowed, and so are its updates and its end. Window-level events, which come before those of the widget,
// pass untouched, except key presses. GUI thread only.
//
// An object whose touch was let through never waits for an end that does not come: when a lock breaks its
// touch, when it is disabled, when its window is hidden or blocked by a dialog, and when the end itself is
// swallowed, it is sent a QEvent::TouchCancel. A destroyed object gives its lock back.
class KSAppEventFilter : public QObject
{
    Q_OBJECT
public:
    // The filter that was made last and stands before the application's events; null when there is none.
    static KSAppEventFilter* current();

    explicit KSAppEventFilter(QObject* parent = nullptr);
    // Deletes every lock object that was created here or given to keepNewLockObject.
    ~KSAppEventFilter() override;

    bool eventFilter(QObject* obj, QEvent* event) override;

    // Makes a lock of the type (or uses the given one) and makes the objects eligible for it. Null on
    // refusal. The result is owned here, also a given one.
    virtual KSLockObject* createLockObject(QObject* obj, KSLockObject* lock, LOCKOBJECT_TYPE type,
                                           void* param);
    virtual KSLockObject* createLockObject(QList<QObject*> objs, KSLockObject* lock, LOCKOBJECT_TYPE type,
                                           void* param);
    // The same, and lets touches ask for it from now on.
    virtual KSLockObject* registerLockObject(QObject* obj, KSLockObject* lock, LOCKOBJECT_TYPE type,
                                             void* param);
    virtual KSLockObject* registerLockObject(QList<QObject*> objs, KSLockObject* lock, LOCKOBJECT_TYPE type,
                                             void* param);
    virtual int unregisterLockObject(QObject* obj, KSLockObject* lock);

    // The object's eventFilter() is asked for every widget event that passes the gate, in the order of
    // registration. A deleted object leaves by itself.
    virtual void registerEventFilter(QObject* obj);
    virtual void unegisterEventFilter(QObject* obj);

    virtual bool doEventFilter(QObject* obj, QEvent* event);
    // 0 lets the event pass, 1 swallows it; likewise the next three.
    virtual int doLock(QObject* obj, QEvent* event);
    virtual int doLockTouchBegin(QObject* obj, QEvent* event);
    virtual int doLockTouchUpdate(QObject* obj, QEvent* event);
    virtual int doLockTouchEnd(QObject* obj, QEvent* event);

    // 0: accepted; 1: refused.
    virtual int tryLock(QObject* obj, LOCKMETHOD_TYPE method);
    virtual int tryUnlock(QObject* obj, LOCKMETHOD_TYPE method);
    // Whether any lock is active; the arguments are not looked at.
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
    // The locks that are held now, each with its holders; a forced lock has none.
    virtual QMap<KSLockObject*, QList<QObject*>> activateLockObjects();
    // Takes ownership; null is ignored, and so is a lock that is owned already.
    virtual void keepNewLockObject(KSLockObject* lock);

    virtual bool notifyRegEventFilter(QObject* obj, QEvent* event);
    // False for a disabled widget.
    virtual bool isEnable(QObject* obj);
    // Whether the object has a touch that was let through and has not ended.
    bool isTouched(QObject* obj) const;

    // Breaks every lock, puts this one in their place, and cancels the touches that go on.
    void lock(KSLockObject* lockObject);
    // Breaks every lock and cancels the touches that go on.
    void unlock();
    // unlock(), and every lock object hears of it.
    void resetLock();
    // Sends a key press to the soft keyboard while that is open. True when it was sent.
    bool onKeyPress(QObject* obj, QEvent* event);

Q_SIGNALS:
    // A press or touch has begun somewhere in this process.
    void signalEventBegin();

private:
    static int priorityOf(LOCKOBJECT_TYPE type);
    void watchIgnoredTouch(QEvent* event);
    void noticeAcceptedTouch(const QObject* obj);
    void watchTouch(QObject* obj);
    void forgetTouch(QObject* obj);
    void touchedObjectDestroyed(QObject* obj);
    void breakLocks();
    // All of them, or only those in a window.
    void cancelTouches(const QWidget* window = nullptr);
    void cancelTouchWhenDisabled(QObject* obj);
    void cancelTouchWhenHidden(QObject* obj);

    QMap<int, QList<KSLockObject*>> m_registered; // by priority; 6 is asked first
    QMap<KSLockObject*, QList<QObject*>> m_active;
    QList<KSLockObject*> m_owned;
    QList<QObject*> m_eventFilters;
    QList<QObject*> m_touched; // their touches were let through and go on; none of them is destroyed
    QPointer<QObject> m_begun; // was let through last, and has not seen more of its touch
    int m_begunId = -1;
};
