#pragma once

#include "MonkeyGround.h"

#include <QMap>
#include <QTimerEvent>
#include <private/qeventdispatcher_unix_p.h>
#include <private/qunixeventdispatcher_qpa_p.h>

// A clock for a program whose timers are stopped. When the test advances it, the timers that become due fire
// in order, each as often as its interval requires.
class HandClock
{
public:
    // Installs an event dispatcher whose timers can be listed. Call before the application is made.
    static void install() { QCoreApplication::setEventDispatcher(new QUnixEventDispatcherQPA); }

    void pass(int milliseconds)
    {
        const qint64 end = m_now + milliseconds;
        for (;;) {
            updateTimers();
            auto next = m_timers.end();
            for (auto timer = m_timers.begin(); timer != m_timers.end(); ++timer)
                if (next == m_timers.end() || timer->due < next->due)
                    next = timer;
            if (next == m_timers.end() || next->due > end)
                break;
            m_now = std::max(m_now, next->due);
            next->due = m_now + std::max<qint64>(next->interval, 1);
            fire(next.key(), next->object);
        }
        m_now = end;
    }

private:
    struct Timer {
        qint64 interval = 0;
        qint64 due = 0;
        QObject* object = nullptr;
    };

    static void fire(int id, QObject* object)
    {
        QTimerEvent event(id);
        MonkeyGround::Application::instance()->frozen = false;
        QCoreApplication::sendEvent(object, &event);
        MonkeyGround::Application::instance()->frozen = true;
    }

    // Updates the list of timers. One started since the last call counts as started now.
    void updateTimers()
    {
        const auto* dispatcher = static_cast<QEventDispatcherUNIXPrivate*>(
            QObjectPrivate::get(QAbstractEventDispatcher::instance()));
        QMap<int, Timer> running;
        for (const QTimerInfo* info : dispatcher->timerList) {
            const Timer started{info->interval, m_now + info->interval, info->obj};
            const Timer known = m_timers.value(info->id);
            running.insert(info->id, known.object == info->obj ? known : started); // ids are reused
        }
        m_timers.swap(running);
    }

    QMap<int, Timer> m_timers; // by id
    qint64 m_now = 0;          // milliseconds
};
