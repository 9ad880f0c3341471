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

// Simulates a touch screen: fingers that press, move, lift or are cancelled. Events are sent through the
// window system like those of a real screen. Several fingers may be down at once, also on different windows.
// GUI thread only.
class Fingers
{
public:
    Fingers();
    ~Fingers();
    Fingers(const Fingers&) = delete;
    Fingers& operator=(const Fingers&) = delete;

    // Presses with a finger; one that is down already is moved instead. Global coordinates.
    void press(int finger, QWidget* window, const QPoint& position);
    // Presses at a position in coordinates of the widget.
    void pressWidget(int finger, QWidget* widget, const QPoint& position);
    void move(int finger, const QPoint& position);
    void lift(int finger);
    // Cancels all fingers without a release, as a window system does when it recognises a gesture.
    void cancel();
    void liftAll();

    bool isDown(int finger) const { return m_down.contains(finger); }
    int count() const { return static_cast<int>(m_down.size()); }
    QPoint position(int finger) const { return m_down.value(finger).position; }

private:
    struct Finger {
        int id = 0; // new for each press, as on real touch screens
        QPoint position;
        QPointer<QWindow> window;
    };

    void plugIn();
    void send(int finger, QEventPoint::State state);

    // The last device is in use. Earlier ones are kept, since events and widgets may still refer to them.
    std::vector<std::unique_ptr<QPointingDevice>> m_devices;
    QMap<int, Finger> m_down;
    int m_nextId = 1;
    unsigned long m_time = 0;
};
