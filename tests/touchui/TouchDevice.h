#pragma once

#include <QPoint>
#include <QPointingDevice>
#include <QTest>
#include <QWidget>
#include <memory>

// A touch screen of a test, which exists as long as this object. It converts to the device that
// QTest::touchEvent takes. The application must exist.
class TouchDevice
{
public:
    TouchDevice() : m_device(QTest::createTouchDevice()) {}

    operator QPointingDevice*() const { return m_device.get(); }

    // Taps with one finger, once or several times, at a place in widget coordinates. All events but the last
    // are sent without returning to the event loop: on a busy machine that can take as long as a long press,
    // or longer than the time for a double tap.
    void tap(QWidget* widget, const QPoint& place, int times = 1) const
    {
        auto finger = QTest::touchEvent(widget, m_device.get(), false);
        for (int tap = 1; tap <= times; ++tap) {
            finger.press(0, place, widget).commit(false);
            finger.release(0, place, widget).commit(tap == times);
        }
    }

private:
    std::unique_ptr<QPointingDevice> m_device;
};
