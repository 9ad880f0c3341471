#pragma once

#include "touchui/Flicker.h"
#include "touchui/OneFinger.h"

#include <QPoint>
#include <QPointer>
#include <QScrollArea>

class QPushButton;
class QTouchEvent;
class TouchEventButton;

// A grid that one finger scrolls and taps. After a flick it keeps moving until it slows down or reaches an
// end; a finger that comes down meanwhile stops it and does not tap. Further fingers are ignored.
//
// It filters the touch events of itself, its viewport and its buttons; the owner installs it as event filter
// of the buttons. GUI thread.
class TemplateScrollArea : public QScrollArea
{
    Q_OBJECT

public:
    static const int TOUCH_TIMER_TIME = FlickMotion::templateGrid().interval; // ms
    static const int DOUBLE_TOUCH_TIME = 500;                                 // ms
    static const QSize TOUCH_RECT_SIZE;

    explicit TemplateScrollArea(QWidget* parent = nullptr);

    // Enables touch events. Call when viewport and scroll bar exist.
    void initTouch();
    void stopFlick() { m_flicker.stop(); }
    // Returns whether the content has caught up with the finger.
    bool isFlickEnd() const { return m_flicker.isEnd(); }
    // Call before a button is removed from the grid: cancels a touch on it.
    void letGoOf(TouchEventButton* button);

Q_SIGNALS:
    // Emitted when a button was tapped, without a drag.
    void itemPressed(QPushButton* button);

protected:
    bool eventFilter(QObject* watched, QEvent* event) override;
    bool event(QEvent* event) override;
    void wheelEvent(QWheelEvent* event) override;
    void hideEvent(QHideEvent* event) override;

private:
    bool handleTouch(QObject* watched, QTouchEvent* event);
    void onTouchEvent();
    void onTranslateTouchEventToMouse(QObject* watched);
    void getDistance();
    void changeScrollBarValue(int distance);
    void rest();
    void sendPressToViewport(const QPoint& global);

    OneFinger m_finger{this};
    Flicker m_flicker{this, FlickMotion::templateGrid()}; // in coordinates of this widget
    QPoint m_pressPoint;                                  // global coordinates
    bool m_moved = false;
    QPointer<QPushButton> m_pressedButton;
};
