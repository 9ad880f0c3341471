#pragma once

#include "touchui/TouchTimer.h"

#include <QCoreApplication>
#include <QMap>
#include <QObject>
#include <QPointer>
#include <QTimerEvent>

// A clock for the timers of touch widgets that the test advances.
class ManualClock : public TouchTimer::Clock
{
public:
    ManualClock() { TouchTimer::setClock(this); }
    ~ManualClock() override { TouchTimer::setClock(nullptr); }

    int start(QObject* receiver, int milliseconds) override
    {
        m_timers.insert(++m_lastId, {receiver, m_now + milliseconds, milliseconds});
        return m_lastId;
    }
    void stop(QObject*, int id) override { m_timers.remove(id); }

    // Advances the clock and fires the timers that become due, in order.
    void advance(int milliseconds)
    {
        const qint64 end = m_now + milliseconds;
        for (int id = nextUntil(end); id != 0; id = nextUntil(end)) {
            Timer& timer = m_timers[id];
            m_now = timer.due;
            timer.due += qMax(timer.interval, 1);
            const QPointer<QObject> receiver = timer.receiver;
            if (!receiver) {
                m_timers.remove(id);
                continue;
            }
            QTimerEvent event(id);
            QCoreApplication::sendEvent(receiver, &event);
        }
        m_now = end;
    }
    // Returns the number of running timers.
    int running() const { return static_cast<int>(m_timers.size()); }

private:
    struct Timer {
        QPointer<QObject> receiver;
        qint64 due = 0;
        int interval = 0;
    };

    int nextUntil(qint64 end) const
    {
        int next = 0;
        for (auto it = m_timers.cbegin(); it != m_timers.cend(); ++it)
            if (it->due <= end && (next == 0 || it->due < m_timers[next].due))
                next = it.key();
        return next;
    }

    QMap<int, Timer> m_timers;
    qint64 m_now = 0;
    int m_lastId = 1 << 24; // above the ids of Qt's own timers
};
