#pragma once

#include <QEventPoint>
#include <QMap>
#include <QPoint>
#include <QPointF>
#include <QPointer>
#include <QWindow>

#include <memory>
#include <vector>

class QPointingDevice;
class QWidget;

// A touch screen without a screen: fingers that press, move, lift or are taken away, through the window
// system like real ones. Several may be down at once, also on several windows. GUI thread only.
class Fingers
{
public:
    Fingers();
    ~Fingers();
    Fingers(const Fingers&) = delete;
    Fingers& operator=(const Fingers&) = delete;

    // A finger that is down already is moved instead. Positions are global.
    void press(int finger, QWidget* window, const QPoint& position);
    // In the widget's coordinates.
    void pressWidget(int finger, QWidget* widget, const QPoint& position);
    void move(int finger, const QPoint& position);
    void lift(int finger);
    // Takes all fingers away without lifting them, as a window system does for a gesture of its own.
    void cancel();
    void liftAll();

    bool isDown(int finger) const { return m_down.contains(finger); }
    int count() const { return static_cast<int>(m_down.size()); }
    QPoint position(int finger) const { return m_down.value(finger).position; }

private:
    struct Finger {
        int id = 0; // a new one for each press, as touch screens give
        QPoint position;
        QPointer<QWindow> window;
    };

    void plugIn();
    void send(int finger, QEventPoint::State state);

    // The last one is in use. Earlier ones stay: events and widgets may know them.
    std::vector<std::unique_ptr<QPointingDevice>> m_devices;
    QMap<int, Finger> m_down;
    int m_nextId = 1;
    unsigned long m_time = 0;
};
