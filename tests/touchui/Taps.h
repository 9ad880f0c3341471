#pragma once

#include <QTest>

// Taps and double taps of one finger at a place in the coordinates of the widget. All events but the last are
// sent in one turn of the event loop: on a busy machine a turn can last as long as a hold, or longer than a
// double tap may.
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
