#include "touchui/KSEventDefaultMutexLockObject.h"

#include "support/LogManager.h"
#include "touchui/KSAppEventFilter.h"

#include <QString>

namespace
{

void logTouch(const QString& text)
{
    LOG_USER_OPERATE(L"Touch Event", 200, text.toStdWString());
}

QString pointerText(const QObject* obj)
{
    return QStringLiteral("0x%1").arg(reinterpret_cast<quintptr>(obj), 0, 16);
}

} // namespace

KSEventDefaultMutexLockObject* KSEventDefaultMutexLockObject::s_instance = nullptr;

KSEventDefaultMutexLockObject* KSEventDefaultMutexLockObject::createFactory(KSAppEventFilter* filter,
                                                                            QObject* parent)
{
    if (s_instance == nullptr)
        s_instance = new KSEventDefaultMutexLockObject(filter, parent);
    return s_instance;
}

KSEventDefaultMutexLockObject::KSEventDefaultMutexLockObject(KSAppEventFilter* filter, QObject* parent)
    : KSLockObject(parent), m_filter(filter)
{
    m_timer.setSingleShot(true);
    connect(&m_timer, &TouchTimer::timeout, this, &KSEventDefaultMutexLockObject::lockedTimeout);
}

KSEventDefaultMutexLockObject::~KSEventDefaultMutexLockObject()
{
    if (s_instance == this)
        s_instance = nullptr;
}

int KSEventDefaultMutexLockObject::tryLock(QObject* obj, LOCKMETHOD_TYPE, void*)
{
    if (!m_locked) {
        m_locked = true;
        m_lockObj = obj;
        m_timer.start(WATCHDOG_MSEC);
        logTouch(QStringLiteral(" ; tryLock : LockedTimer is start."));
        return 0;
    }
    if (m_lockObj == obj)
        return 0;
    logTouch(QStringLiteral("lock failed m_lockObj = ") + pointerText(m_lockObj));
    return -1;
}

int KSEventDefaultMutexLockObject::tryUnlock(QObject* obj, LOCKMETHOD_TYPE)
{
    if (m_locked && m_lockObj == obj) {
        m_locked = false;
        m_lockObj = nullptr;
        m_timer.stop();
        logTouch(QStringLiteral(" ; tryUnlock : LockedTimer is stop."));
        return 0;
    }
    return m_locked ? -1 : 0;
}

bool KSEventDefaultMutexLockObject::isLockedObj(QObject* obj, LOCKMETHOD_TYPE)
{
    if (m_lockObj == nullptr || m_lockObj != obj)
        return false;
    m_timer.start(WATCHDOG_MSEC);
    logTouch(QStringLiteral(" ; isLockedObj : LockedTimer is start."));
    return true;
}

int KSEventDefaultMutexLockObject::registerObj(QObject*)
{
    return 0;
}

int KSEventDefaultMutexLockObject::unregisterObj(QObject*)
{
    return 0;
}

bool KSEventDefaultMutexLockObject::isRegisterObj(QObject*)
{
    return true;
}

int KSEventDefaultMutexLockObject::notify(QObject*, KSLockObject*, LOCK_MESSAGE, void*)
{
    return 0;
}

void KSEventDefaultMutexLockObject::reset()
{
    logTouch(QStringLiteral("reset m_lockObj = ") + pointerText(m_lockObj));
    m_locked = false;
    m_lockObj = nullptr;
    m_timer.stop();
}

void KSEventDefaultMutexLockObject::lockedTimeout()
{
    logTouch(QStringLiteral("LockedTimer is timeout. resetLock()"));
    m_filter->resetLock();
}
