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
        mTimers.insert(++mLastId, {receiver, mNow + milliseconds, milliseconds});
        return mLastId;
    }
    void stop(QObject*, int id) override { mTimers.remove(id); }

    // Advances the clock and fires the timers that become due, in order.
    void advance(int milliseconds)
    {
        const qint64 end = mNow + milliseconds;
        for (int id = nextUntil(end); id != 0; id = nextUntil(end)) {
            Timer& timer = mTimers[id];
            mNow = timer.due;
            timer.due += qMax(timer.interval, 1);
            const QPointer<QObject> receiver = timer.receiver;
            if (!receiver) {
                mTimers.remove(id);
                continue;
            }
            QTimerEvent event(id);
            QCoreApplication::sendEvent(receiver, &event);
        }
        mNow = end;
    }
    // Returns the number of running timers.
    int running() const { return static_cast<int>(mTimers.size()); }

private:
    struct Timer {
        QPointer<QObject> receiver;
        qint64 due = 0;
        int interval = 0;
    };

    int nextUntil(qint64 end) const
    {
        int next = 0;
        for (auto it = mTimers.cbegin(); it != mTimers.cend(); ++it)
            if (it->due <= end && (next == 0 || it->due < mTimers[next].due))
                next = it.key();
        return next;
    }

    QMap<int, Timer> mTimers;
    qint64 mNow = 0;
    int mLastId = 1 << 24; // above the ids of Qt's own timers
};
