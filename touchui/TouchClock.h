#pragma once

class QObject;

// Where the timers of touch widgets get their time: Qt's timers, unless another clock is installed, such as
// one that is moved by hand. A timer reports by a QTimerEvent at its receiver until it is stopped. GUI thread
// only.
class TouchClock
{
public:
    TouchClock() = default;
    virtual ~TouchClock() = default;
    TouchClock(const TouchClock&) = delete;
    TouchClock& operator=(const TouchClock&) = delete;

    // The id of the new timer, above 0.
    virtual int start(QObject* receiver, int milliseconds) = 0;
    // Ids that are not running are ignored.
    virtual void stop(QObject* receiver, int id) = 0;

    static TouchClock& instance();
    // Not owned. Null goes back to Qt's timers. Timers that run stay with the clock that started them, so
    // install it before the widgets are made.
    static void setInstance(TouchClock* clock);
};
