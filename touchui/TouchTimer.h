#pragma once

#include <QObject>

// The timer of the touch widgets, otherwise like QTimer. It takes its time from Qt's timers, unless another
// clock is installed, such as one that is moved by hand. GUI thread only.
class TouchTimer : public QObject
{
    Q_OBJECT
public:
    // Where timers get their time. A timer of a clock reports by a QTimerEvent at its receiver until it is
    // stopped.
    class Clock
    {
    public:
        Clock() = default;
        virtual ~Clock() = default;
        Clock(const Clock&) = delete;
        Clock& operator=(const Clock&) = delete;

        // The id of the new timer, above 0.
        virtual int start(QObject* receiver, int milliseconds) = 0;
        // Ids that are not running are ignored.
        virtual void stop(QObject* receiver, int id) = 0;
    };

    // Not owned. Null goes back to Qt's timers. Timers that run stay with the clock that started them, so
    // install it before the widgets are made.
    static void setClock(Clock* clock);

    explicit TouchTimer(QObject* parent = nullptr);
    ~TouchTimer() override;

    void setSingleShot(bool singleShot) { m_singleShot = singleShot; }
    bool isSingleShot() const { return m_singleShot; }
    // Starts it anew when it runs already.
    void start(int milliseconds);
    void stop();
    // Starts it anew with the time that it had, if it runs.
    void restartIfActive();
    bool isActive() const { return m_id != 0; }

Q_SIGNALS:
    void timeout();

protected:
    void timerEvent(QTimerEvent* event) override;

private:
    int m_id = 0;
    int m_interval = 0;
    bool m_singleShot = false;
};
