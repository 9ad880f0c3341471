#include "touchui/KSAppEventFilter.h"

#include "support/LogManager.h"
#include "touchui/KSEventClusterLockObject.h"
#include "touchui/KSEventDefaultMutexLockObject.h"
#include "touchui/KSEventMultiMutexLockObject.h"
#include "touchui/KSEventMutexLockObject.h"
#include "touchui/KSInputContext.h"
#include "touchui/OneFinger.h"

#include <QTouchEvent>
#include <QWidget>

namespace
{

KSAppEventFilter* gCurrent = nullptr;

constexpr int HIGHEST_PRIORITY = 6;
constexpr int NORMAL_PRIORITY = 3;
constexpr int LOWEST_PRIORITY = 0;

QString describe(const QObject* obj)
{
    return QStringLiteral(";obj = 0x%1 ; className = %2")
        .arg(reinterpret_cast<quintptr>(obj), 0, 16)
        .arg(QString::fromLatin1(obj->metaObject()->className()));
}

void logTouch(const QString& text)
{
    LOG_USER_OPERATE(L"Touch Event", 200, text.toStdWString());
}

void logLock(const wchar_t* tag, const QString& verb, const QObject* obj)
{
    const QString text =
        verb + QString::fromLatin1(obj->metaObject()->className()) + QLatin1Char(' ') + obj->objectName();
    LOG_USER_OPERATE(tag, 207, text.toStdWString());
}

qsizetype pointCount(const QEvent* event)
{
    return event->isPointerEvent() ? static_cast<const QTouchEvent*>(event)->points().size() : 0;
}

} // namespace

KSAppEventFilter* KSAppEventFilter::current()
{
    return gCurrent;
}

KSAppEventFilter::KSAppEventFilter(QObject* parent) : QObject(parent)
{
    gCurrent = this;
    KSAppEventFilter::clearActivateLockObject();
}

KSAppEventFilter::~KSAppEventFilter()
{
    if (gCurrent == this)
        gCurrent = nullptr;
    qDeleteAll(m_owned);
}

bool KSAppEventFilter::eventFilter(QObject* obj, QEvent* event)
{
    // This runs for every event of the application, so it must be fast for all events that are not handled
    // here.
    const bool swallowed =
        doEventFilter(obj, event) || (!m_eventFilters.isEmpty() && notifyRegEventFilter(obj, event));
    if (event->type() == QEvent::TouchEnd && isTouched(obj)) {
        forgetTouch(obj);
        if (swallowed)
            OneFinger::cancelTouchOf(obj);
    }
    return swallowed;
}

bool KSAppEventFilter::doEventFilter(QObject* obj, QEvent* event)
{
    switch (event->type()) {
    case QEvent::MouseButtonPress:
        if (!obj->isWindowType())
            Q_EMIT signalEventBegin();
        return false;
    case QEvent::KeyPress:
        return onKeyPress(obj, event);
    case QEvent::TouchBegin:
        if (obj->isWindowType())
            return false;
        Q_EMIT signalEventBegin();
        return !isEnable(obj) || doLock(obj, event) != 0;
    case QEvent::TouchUpdate:
    case QEvent::TouchEnd:
        if (obj->isWindowType()) {
            watchIgnoredTouch(event);
            return false;
        }
        noticeAcceptedTouch(obj);
        return !isEnable(obj) || doLock(obj, event) != 0;
    case QEvent::TouchCancel:
        if (obj->isWindowType()) {
            watchIgnoredTouch(event);
            return false;
        }
        // After a TouchCancel, no TouchEnd follows.
        noticeAcceptedTouch(obj);
        forgetTouch(obj);
        if (isLock(obj, LOCKMETHOD_TOUCH))
            tryUnlock(obj, LOCKMETHOD_TOUCH);
        return false;
    case QEvent::EnabledChange:
        cancelTouchWhenDisabled(obj);
        return false;
    case QEvent::Hide:
        cancelTouchWhenHidden(obj);
        return false;
    case QEvent::WindowBlocked:
        if (obj->isWidgetType())
            cancelTouches(static_cast<const QWidget*>(obj));
        return false;
    case QEvent::Gesture:
        return true; // gestures are not used
    default:
        return false;
    }
}

bool KSAppEventFilter::notifyRegEventFilter(QObject* obj, QEvent* event)
{
    if (obj->isWindowType())
        return false;
    // Iterates by index, because a filter may unregister or be deleted during the call.
    for (qsizetype i = 0; i < m_eventFilters.size();) {
        QObject* const asked = m_eventFilters.at(i);
        if (asked->eventFilter(obj, event))
            return true;
        const qsizetype place = m_eventFilters.indexOf(asked);
        i = place < 0 ? i : place + 1;
    }
    return false;
}

bool KSAppEventFilter::isEnable(QObject* obj)
{
    const QWidget* widget = qobject_cast<QWidget*>(obj);
    return widget == nullptr || widget->isEnabled();
}

bool KSAppEventFilter::onKeyPress(QObject*, QEvent* event)
{
    KSInputContext* context = KSInputContext::instance();
    if (context == nullptr || KSInputContext::isSoftKeyboardClosed() || context->isSendingKeyEvent())
        return false;
    return context->forwardKeyPress(event);
}

int KSAppEventFilter::doLock(QObject* obj, QEvent* event)
{
    switch (event->type()) {
    case QEvent::TouchBegin:
        return doLockTouchBegin(obj, event);
    case QEvent::TouchUpdate:
        return doLockTouchUpdate(obj, event);
    case QEvent::TouchEnd:
        return doLockTouchEnd(obj, event);
    default:
        return 1;
    }
}

int KSAppEventFilter::doLockTouchBegin(QObject* obj, QEvent* event)
{
    const LOCKMETHOD_TYPE method = getLockMethod(event);
    int result = 1;
    if (!isLock(obj, method)) {
        result = tryLock(obj, method);
    } else {
        const QList<KSLockObject*> locks = m_active.keys();
        for (KSLockObject* lock : locks) {
            if (lock->isRegisterObj(obj) && lock->tryLock(obj, method, nullptr) == 0) {
                addActivateLockObject(obj, lock, method);
                logTouch(QStringLiteral("Name = %1 %2 lock success").arg(objectName(), describe(obj)));
                result = 0;
            }
        }
    }
    if (result == 0)
        watchTouch(obj);
    if (result == 0 && pointCount(event) > 0) {
        m_begun = obj;
        m_begunId = static_cast<const QTouchEvent*>(event)->points().constFirst().id();
    }
    logTouch(QStringLiteral("Name = %1 :TouchBegin %2; rs = %3 ;PointCount = %4")
                 .arg(objectName(), describe(obj))
                 .arg(result)
                 .arg(pointCount(event)));
    return result;
}

// A widget that was allowed the touch but ignored its begin, for example a window beside its buttons,
// receives neither updates nor the end. Its lock is released when the finger is lifted from the window.
void KSAppEventFilter::watchIgnoredTouch(QEvent* event)
{
    if (m_begun == nullptr)
        return;
    bool lifted = event->type() == QEvent::TouchCancel;
    for (const QEventPoint& point : static_cast<QTouchEvent*>(event)->points())
        lifted = lifted || (point.id() == m_begunId && point.state() == QEventPoint::State::Released);
    if (!lifted)
        return;
    // Queued until the widgets have handled this event, which shows whether one of them has accepted the
    // begin.
    const auto release = [this, obj = m_begun, id = m_begunId] {
        if (obj != nullptr && obj == m_begun && id == m_begunId) {
            m_begun.clear();
            tryUnlock(obj, LOCKMETHOD_TOUCH);
        }
    };
    QMetaObject::invokeMethod(this, release, Qt::QueuedConnection);
}

void KSAppEventFilter::noticeAcceptedTouch(const QObject* obj)
{
    if (obj == m_begun)
        m_begun.clear();
}

bool KSAppEventFilter::isTouched(QObject* obj) const
{
    return m_touched.contains(obj);
}

void KSAppEventFilter::watchTouch(QObject* obj)
{
    if (!isTouched(obj)) {
        m_touched.append(obj);
        connect(obj, &QObject::destroyed, this, &KSAppEventFilter::touchedObjectDestroyed);
    }
}

void KSAppEventFilter::forgetTouch(QObject* obj)
{
    if (m_touched.removeAll(obj) > 0)
        disconnect(obj, &QObject::destroyed, this, &KSAppEventFilter::touchedObjectDestroyed);
}

void KSAppEventFilter::touchedObjectDestroyed(QObject* obj)
{
    m_touched.removeAll(obj);
    if (isLock(obj, LOCKMETHOD_TOUCH))
        tryUnlock(obj, LOCKMETHOD_TOUCH);
}

// Works on a copy, because each cancelled object may destroy others or start a new touch.
void KSAppEventFilter::cancelTouches(const QWidget* window)
{
    const QList<QPointer<QObject>> touched(m_touched.cbegin(), m_touched.cend());
    for (const QPointer<QObject>& obj : touched) {
        if (obj == nullptr || !isTouched(obj))
            continue;
        const auto* widget = qobject_cast<const QWidget*>(obj.data());
        if (window == nullptr || (widget != nullptr && widget->window() == window))
            OneFinger::cancelTouchOf(obj);
    }
}

void KSAppEventFilter::cancelTouchWhenDisabled(QObject* obj)
{
    if (isTouched(obj) && !isEnable(obj))
        OneFinger::cancelTouchOf(obj);
}

// A child that was hidden explicitly keeps its touch; a row that is being dragged relies on that.
void KSAppEventFilter::cancelTouchWhenHidden(QObject* obj)
{
    if (m_touched.isEmpty() || !obj->isWidgetType())
        return;
    const auto* widget = static_cast<const QWidget*>(obj);
    if (widget->isWindow())
        cancelTouches(widget);
    else if (isTouched(obj) && !widget->isHidden())
        OneFinger::cancelTouchOf(obj);
}

int KSAppEventFilter::doLockTouchUpdate(QObject* obj, QEvent* event)
{
    const LOCKMETHOD_TYPE method = getLockMethod(event);
    int result = 1;
    const QList<KSLockObject*> locks = m_active.keys();
    for (KSLockObject* lock : locks)
        if (lock->isLockedObj(obj, method))
            result = 0;
    logTouch(QStringLiteral("Name = %1 :TouchUpdate %2; rs = %3 ;PointCount = %4")
                 .arg(objectName(), describe(obj))
                 .arg(result)
                 .arg(pointCount(event)));
    return result;
}

int KSAppEventFilter::doLockTouchEnd(QObject* obj, QEvent* event)
{
    const LOCKMETHOD_TYPE method = getLockMethod(event);
    int result = 1;
    if (isLock(obj, method))
        result = tryUnlock(obj, method);
    logTouch(QStringLiteral("Name = %1 :TouchEnd%2; rs = %3 :PointCount = %4")
                 .arg(objectName(), describe(obj))
                 .arg(result)
                 .arg(pointCount(event)));
    return result;
}

int KSAppEventFilter::tryLock(QObject* obj, LOCKMETHOD_TYPE method)
{
    for (int priority = HIGHEST_PRIORITY; priority >= LOWEST_PRIORITY; --priority) {
        const QList<KSLockObject*> locks = m_registered.value(priority);
        for (KSLockObject* lock : locks) {
            if (lock->isRegisterObj(obj) && lock->tryLock(obj, method, nullptr) == 0) {
                addActivateLockObject(obj, lock, method);
                notifyRegLockObjects(obj, lock, LOCK_MSG_LOCKED, nullptr, LOCK_NOTIFY_ALL);
                logLock(L"KS tryLock", QStringLiteral("Accept "), obj);
                return 0;
            }
        }
    }
    logLock(L"KS tryLock", QStringLiteral("Ignore "), obj);
    return 1;
}

int KSAppEventFilter::tryUnlock(QObject* obj, LOCKMETHOD_TYPE method)
{
    const bool wasLocked = isLock(obj, method);
    int result = 1;
    const QList<KSLockObject*> locks = m_active.keys();
    for (KSLockObject* lock : locks) {
        if (!lock->isRegisterObj(obj) || lock->tryUnlock(obj, method) != 0)
            continue;
        removeActivateLockObject(obj, lock, method);
        logLock(L"KS tryUnLock", QStringLiteral("removed "), obj);
        if (wasLocked && !isLock(obj, method)) {
            notifyRegLockObjects(obj, lock, LOCK_MSG_UNLOCKED, nullptr, LOCK_NOTIFY_ALL);
            logLock(L"KS tryUnLock", QStringLiteral("notify "), obj);
        }
        result = 0;
    }
    return result;
}

bool KSAppEventFilter::isLock(QObject*, LOCKMETHOD_TYPE)
{
    return !m_active.isEmpty();
}

LOCKMETHOD_TYPE KSAppEventFilter::getLockMethod(QEvent* event)
{
    const int type = event->type();
    if (type == QEvent::TouchBegin || type == QEvent::TouchUpdate || type == QEvent::TouchEnd)
        return LOCKMETHOD_TOUCH;
    return type > 1 && type < 6 ? LOCKMETHOD_MOUSE : LOCKMETHOD_OTHER;
}

void KSAppEventFilter::lock(KSLockObject* lockObject)
{
    logTouch(QStringLiteral("Name = %1 :lock").arg(objectName()));
    breakLocks();
    addActivateLockObject(nullptr, lockObject, LOCKMETHOD_OTHER);
    notifyRegLockObjects(nullptr, lockObject, LOCK_MSG_LOCKED, nullptr, LOCK_NOTIFY_EXCEPT_SENDER);
    cancelTouches();
}

void KSAppEventFilter::unlock()
{
    breakLocks();
    cancelTouches();
}

void KSAppEventFilter::breakLocks()
{
    logTouch(QStringLiteral("Name = %1 :unlock").arg(objectName()));
    const QList<KSLockObject*> locks = m_active.keys();
    for (KSLockObject* lock : locks)
        lock->reset();
    clearActivateLockObject();
}

void KSAppEventFilter::resetLock()
{
    breakLocks();
    notifyRegLockObjects(nullptr, nullptr, LOCK_MSG_RESET, nullptr, LOCK_NOTIFY_ALL);
    cancelTouches();
}

void KSAppEventFilter::registerEventFilter(QObject* obj)
{
    if (obj == nullptr || m_eventFilters.contains(obj))
        return;
    m_eventFilters.append(obj);
    connect(obj, &QObject::destroyed, this, [this](QObject* gone) { m_eventFilters.removeAll(gone); });
}

void KSAppEventFilter::unegisterEventFilter(QObject* obj)
{
    if (m_eventFilters.removeAll(obj) > 0)
        disconnect(obj, &QObject::destroyed, this, nullptr);
}

int KSAppEventFilter::priorityOf(LOCKOBJECT_TYPE type)
{
    switch (type) {
    case LOCKOBJECT_PROCESS:
        return HIGHEST_PRIORITY;
    case LOCKOBJECT_DEFAULTMUTEX:
        return LOWEST_PRIORITY;
    default:
        return NORMAL_PRIORITY;
    }
}

KSLockObject* KSAppEventFilter::preCreateLockObject(QObject*, KSLockObject* lock, LOCKOBJECT_TYPE type, void*)
{
    KSLockObject* result = nullptr;
    switch (type) {
    case LOCKOBJECT_CLUSTER:
        result = lock != nullptr ? lock : KSEventClusterLockObject::createFactory(nullptr);
        break;
    case LOCKOBJECT_MUTEX:
        result = lock != nullptr ? lock : KSEventMutexLockObject::createFactory(nullptr);
        break;
    case LOCKOBJECT_MULTIMUTEX:
        result = lock != nullptr ? lock : KSEventMultiMutexLockObject::createFactory(nullptr);
        break;
    case LOCKOBJECT_DEFAULTMUTEX:
        result = KSEventDefaultMutexLockObject::createFactory(this, nullptr);
        break;
    case LOCKOBJECT_PROCESS:
        result = lock;
        break;
    }
    keepNewLockObject(result);
    return result;
}

KSLockObject* KSAppEventFilter::preCreateLockObject(QList<QObject*>, KSLockObject* lock, LOCKOBJECT_TYPE type,
                                                    void* param)
{
    return preCreateLockObject(static_cast<QObject*>(nullptr), lock, type, param);
}

int KSAppEventFilter::initLockObject(QObject* obj, KSLockObject* lock, LOCKOBJECT_TYPE, void*)
{
    return lock->registerObj(obj);
}

int KSAppEventFilter::initLockObject(QList<QObject*> objs, KSLockObject* lock, LOCKOBJECT_TYPE type,
                                     void* param)
{
    int result = 0;
    for (QObject* obj : objs)
        result = initLockObject(obj, lock, type, param);
    return result;
}

KSLockObject* KSAppEventFilter::createLockObject(QObject* obj, KSLockObject* lock, LOCKOBJECT_TYPE type,
                                                 void* param)
{
    KSLockObject* result = preCreateLockObject(obj, lock, type, param);
    if (result != nullptr && initLockObject(obj, result, type, param) != 0) {
        if (result != lock)
            deleteLockObject(result);
        return nullptr;
    }
    return result;
}

KSLockObject* KSAppEventFilter::createLockObject(QList<QObject*> objs, KSLockObject* lock,
                                                 LOCKOBJECT_TYPE type, void* param)
{
    KSLockObject* result = preCreateLockObject(static_cast<QObject*>(nullptr), lock, type, param);
    if (result != nullptr && initLockObject(objs, result, type, param) != 0) {
        if (result != lock)
            deleteLockObject(result);
        return nullptr;
    }
    return result;
}

KSLockObject* KSAppEventFilter::registerLockObject(QObject* obj, KSLockObject* lock, LOCKOBJECT_TYPE type,
                                                   void* param)
{
    KSLockObject* result = createLockObject(obj, lock, type, param);
    if (result != nullptr)
        addRegLockObject(obj, result, type, param);
    return result;
}

KSLockObject* KSAppEventFilter::registerLockObject(QList<QObject*> objs, KSLockObject* lock,
                                                   LOCKOBJECT_TYPE type, void* param)
{
    KSLockObject* result = createLockObject(objs, lock, type, param);
    if (result != nullptr)
        addRegLockObject(static_cast<QObject*>(nullptr), result, type, param);
    return result;
}

int KSAppEventFilter::unregisterLockObject(QObject* obj, KSLockObject* lock)
{
    if (lock != nullptr)
        lock->unregisterObj(obj);
    return 0;
}

void KSAppEventFilter::addRegLockObject(QObject*, KSLockObject* lock, LOCKOBJECT_TYPE type, void*)
{
    QList<KSLockObject*>& locks = m_registered[priorityOf(type)];
    if (!locks.contains(lock))
        locks.append(lock);
}

void KSAppEventFilter::addRegLockObject(QList<QObject*>, KSLockObject* lock, LOCKOBJECT_TYPE type,
                                        void* param)
{
    addRegLockObject(static_cast<QObject*>(nullptr), lock, type, param);
}

void KSAppEventFilter::removeRegLockObject(KSLockObject* lock)
{
    for (QList<KSLockObject*>& locks : m_registered)
        locks.removeAll(lock);
}

void KSAppEventFilter::notifyRegLockObjects(QObject* obj, KSLockObject* sender, LOCK_MESSAGE message,
                                            void* param, LOCK_NOTIFY_FLAGS flags)
{
    for (int priority = HIGHEST_PRIORITY; priority >= LOWEST_PRIORITY; --priority) {
        const QList<KSLockObject*> locks = m_registered.value(priority);
        for (KSLockObject* lock : locks)
            if (flags != LOCK_NOTIFY_EXCEPT_SENDER || lock != sender)
                lock->notify(obj, sender, message, param);
    }
}

// Does nothing: all lock objects are deleted by the destructor.
void KSAppEventFilter::deleteLockObject(KSLockObject*)
{
}

void KSAppEventFilter::addActivateLockObject(QObject* obj, KSLockObject* lock, LOCKMETHOD_TYPE)
{
    QList<QObject*>& holders = m_active[lock];
    if (obj != nullptr && !holders.contains(obj))
        holders.append(obj);
}

void KSAppEventFilter::removeActivateLockObject(QObject* obj, KSLockObject* lock, LOCKMETHOD_TYPE)
{
    const auto entry = m_active.find(lock);
    if (entry == m_active.end())
        return;
    entry->removeAll(obj);
    if (entry->isEmpty())
        m_active.erase(entry);
}

void KSAppEventFilter::clearActivateLockObject()
{
    m_active.clear();
    notifyRegLockObjects(nullptr, nullptr, LOCK_MSG_CLEARED, nullptr, LOCK_NOTIFY_ALL);
}

QMap<KSLockObject*, QList<QObject*>> KSAppEventFilter::activateLockObjects()
{
    return m_active;
}

void KSAppEventFilter::keepNewLockObject(KSLockObject* lock)
{
    if (lock != nullptr && !m_owned.contains(lock))
        m_owned.append(lock);
}
