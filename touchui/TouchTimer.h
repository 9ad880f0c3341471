#pragma once

#include <QObject>

// The timer of the touch widgets, which works like QTimer. It uses Qt's timers unless another clock is
// installed, for example one that tests advance. GUI thread only.
class TouchTimer : public QObject
{
    Q_OBJECT
public:
    // A source of time for timers. A timer sends QTimerEvents to its receiver until it is stopped.
    class Clock
    {
    public:
        Clock() = default;
        virtual ~Clock() = default;
        Clock(const Clock&) = delete;
        Clock& operator=(const Clock&) = delete;

        // Returns the id of the new timer, which is positive.
        virtual int start(QObject* receiver, int milliseconds) = 0;
        // Ignores ids that are not running.
        virtual void stop(QObject* receiver, int id) = 0;
    };

    // Sets the clock, which is not owned; null restores Qt's timers. Running timers remain with the clock
    // that started them, so install a clock before the widgets are created.
    static void setClock(Clock* clock);

    explicit TouchTimer(QObject* parent = nullptr);
    ~TouchTimer() override;

    void setSingleShot(bool singleShot) { m_singleShot = singleShot; }
    // Restarts the timer if it is running.
    void start(int milliseconds);
    void stop();
    // Restarts the timer with its last time if it is running.
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
