#pragma once

#include <QApplication>
#include <QPointer>
#include <QPointingDevice>
#include <QRandomGenerator>
#include <QStringList>
#include <QTest>
#include <QWidget>
#include <QWindow>
#include <algorithm>
#include <array>
#include <cstdio>
#include <qpa/qwindowsysteminterface.h>
#include <tuple>

// Two fingers that send random touch events one at a time, from a seed, so that a run can be repeated. The
// subclass decides where they go down and jump to, and what happens between touches.
class MonkeyFingers
{
public:
    MonkeyFingers(QPointingDevice* device, quint32 seed) : m_random(seed), m_device(device) {}
    virtual ~MonkeyFingers() = default;

    int touches() const { return m_touches; }
    bool isTouching() const { return m_fingers[0].down || m_fingers[1].down; }
    // Returns the last touches for the report of a failure.
    QStringList lastTouches() const { return m_last; }
    // Returns a checksum of all touches, which is the same for the same sequence.
    quint32 checksum() const { return m_checksum; }

    // Sends one touch event or calls betweenTouches().
    void act()
    {
        if (!m_fingers[0].down) {
            betweenTouches();
            if (!isTouching())
                pressFirst();
            return;
        }
        const int kind = below(100);
        if (kind < 50)
            moveOne();
        else if (kind < 85)
            releaseOne();
        else if (kind < 98)
            useSecond();
        else
            cancel();
    }

    void liftAll()
    {
        while (isTouching())
            releaseOne();
    }

private:
    struct Finger {
        bool down = false;
        int id = 0;
        QPoint point; // in coordinates of the touched window
    };

protected:
    struct Aim {
        QWidget* window = nullptr;
        QPoint point; // in coordinates of the window
    };

    virtual void betweenTouches() = 0;
    // Returns where the first finger goes down; without a window it does not.
    virtual Aim aim() = 0;
    // Returns where the second finger goes down, or where a finger jumps to.
    virtual QPoint pointOf(QWidget* window) = 0;

    int below(int limit) { return m_random.bounded(limit); }
    QPoint within(const QRect& area)
    {
        return area.topLeft() + QPoint(below(qMax(area.width(), 1)), below(qMax(area.height(), 1)));
    }
    template <class List>
    auto anyOf(const List& list)
    {
        return list.at(below(int(list.size())));
    }

    // Returns the other open windows (popups, dialogs, balloons), always in the same order.
    static QWidgetList windowsBeside(const QWidget* main)
    {
        QWidgetList windows = QApplication::topLevelWidgets();
        erase_if(windows, [main](const QWidget* widget) {
            return widget == main || !widget->isVisible() || !widget->windowHandle() ||
                   widget->windowFlags().testFlag(Qt::WindowTransparentForInput);
        });
        const auto key = [](const QWidget* widget) {
            return std::make_tuple(QLatin1String(widget->metaObject()->className()), widget->x(), widget->y(),
                                   widget->width());
        };
        std::sort(windows.begin(), windows.end(),
                  [key](const QWidget* a, const QWidget* b) { return key(a) < key(b); });
        return windows;
    }

    void pressFirst()
    {
        const Aim aimed = aim();
        if (!aimed.window)
            return;
        m_touched = aimed.window;
        m_fingers[0] = {true, ++m_lastId, aimed.point};
        send(0, QEventPoint::Pressed);
    }
    // Releases one finger. When the first one is released, the second is released, too. The state is changed
    // before the events are sent, since a release may run an event loop with further touches, which must find
    // no finger down.
    void releaseOne()
    {
        const int index = m_fingers[1].down && (!m_fingers[0].down || below(2) == 0) ? 1 : 0;
        const std::array<Finger, 2> fingers = m_fingers;
        const QPointer<QWidget> window = m_touched;
        m_fingers[size_t(index)].down = false;
        if (index == 0)
            m_fingers[1].down = false;
        send(window, fingers[size_t(index)], fingers[size_t(1 - index)], QEventPoint::Released);
        if (index == 0 && fingers[1].down)
            send(window, fingers[1], Finger(), QEventPoint::Released);
    }
    void note(const QString& touch)
    {
        constexpr int Noted = 20;
        m_last.append(touch);
        for (const QChar character : touch)
            m_checksum = (m_checksum ^ character.unicode()) * 16777619U;
        if (m_trace)
            fprintf(stderr, "%s\n", qPrintable(touch));
        if (m_last.size() > Noted)
            m_last.removeFirst();
    }
    QWidget* touched() const { return m_touched; }

private:
    void useSecond()
    {
        Finger& finger = m_fingers[1];
        if (finger.down) {
            finger.point = near(finger.point);
            send(1, QEventPoint::Updated);
            return;
        }
        if (!touchedIsOpen())
            return releaseOne();
        finger = {true, ++m_lastId, pointOf(m_touched)};
        send(1, QEventPoint::Pressed);
    }
    QPoint near(QPoint point) { return point + QPoint(below(121) - 60, below(81) - 40); }
    void moveOne()
    {
        const int index = m_fingers[1].down && below(2) == 0 ? 1 : 0;
        Finger& finger = m_fingers[size_t(index)];
        // Mostly small steps, like a real finger, and some jumps.
        finger.point = below(5) == 0 && touchedIsOpen() ? pointOf(m_touched) : near(finger.point);
        send(index, QEventPoint::Updated);
    }
    void cancel()
    {
        m_fingers = {};
        ++m_touches;
        note(QStringLiteral("cancel"));
        if (touchedIsOpen())
            QWindowSystemInterface::handleTouchCancelEvent<QWindowSystemInterface::SynchronousDelivery>(
                m_touched->windowHandle(), m_device);
    }
    bool touchedIsOpen() const { return isOpen(m_touched); }
    static bool isOpen(const QWidget* window)
    {
        return window && window->isVisible() && window->windowHandle();
    }

    void send(int index, QEventPoint::State state)
    {
        send(m_touched, m_fingers[size_t(index)], m_fingers[size_t(1 - index)], state);
    }
    void send(QWidget* touched, const Finger& finger, const Finger& other, QEventPoint::State state)
    {
        ++m_touches;
        // A window may close while fingers are on it: then they are only released.
        if (!isOpen(touched)) {
            note(QStringLiteral("the window has closed under the finger"));
            m_fingers = {};
            if (!touched || !touched->windowHandle())
                return;
            state = QEventPoint::Released;
            if (other.down)
                send(touched, other, Finger(), state);
        }
        QWindow* window = touched->windowHandle();
        auto sequence = QTest::touchEvent(window, m_device, false);
        if (other.down)
            sequence.stationary(other.id);
        if (state == QEventPoint::Pressed)
            sequence.press(finger.id, finger.point, window);
        else if (state == QEventPoint::Released)
            sequence.release(finger.id, finger.point, window);
        else
            sequence.move(finger.id, finger.point, window);
        note(QString("finger %1 %2 at %3,%4 of %5")
                 .arg(finger.id)
                 .arg(state == QEventPoint::Pressed    ? "down"
                      : state == QEventPoint::Released ? "up"
                                                       : "moves")
                 .arg(finger.point.x())
                 .arg(finger.point.y())
                 .arg(touched->metaObject()->className()));
        sequence.commit(false);
    }

    QRandomGenerator m_random;
    QPointingDevice* m_device;
    std::array<Finger, 2> m_fingers;
    QPointer<QWidget> m_touched;
    QStringList m_last;
    int m_touches = 0;
    int m_lastId = 0;
    quint32 m_checksum = 2166136261U;
    bool m_trace = qEnvironmentVariableIsSet("TITLER_TRACE"); // whether to print each touch when it is sent
};
