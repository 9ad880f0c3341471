#pragma once

#include <QObject>

// A timer on the clock of the touch widgets, otherwise like QTimer.
class TouchTimer : public QObject
{
    Q_OBJECT
public:
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
