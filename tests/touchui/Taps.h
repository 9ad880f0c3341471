#pragma once

#include <QTest>

// Taps with one finger, once or twice, at a place in widget coordinates. All events but the last are sent
// without returning to the event loop: on a busy machine that can take as long as a long press, or longer
// than the time for a double tap.
inline void tapTimes(int times, QWidget* widget, QPointingDevice* device, const QPoint& place)
{
    auto finger = QTest::touchEvent(widget, device, false);
    for (int tap = 1; tap <= times; ++tap) {
        finger.press(0, place, widget).commit(false);
        finger.release(0, place, widget).commit(tap == times);
    }
}

inline void tapOnce(QWidget* widget, QPointingDevice* device, const QPoint& place)
{
    tapTimes(1, widget, device, place);
}

inline void tapTwice(QWidget* widget, QPointingDevice* device, const QPoint& place)
{
    tapTimes(2, widget, device, place);
}
