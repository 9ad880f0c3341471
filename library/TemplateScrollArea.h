// A grid that one finger scrolls and taps. The motion runs on after the finger has left and dies at either
// end; a finger that comes down while it runs stops it and taps nothing. Further fingers change nothing.
//
// It filters the touches of itself, its viewport and the buttons in it, on which the owner installs it as
// event filter. GUI thread.
#pragma once

#include "touchui/Flicker.h"
#include "touchui/OneFinger.h"

#include <QPoint>
#include <QPointer>
#include <QScrollArea>

class QPushButton;
class QTouchEvent;
class TouchEventButton;

class TemplateScrollArea : public QScrollArea
{
    Q_OBJECT

public:
    static const int TOUCH_TIMER_TIME = FlickMotion::templateGrid().interval; // ms
    static const int DOUBLE_TOUCH_TIME = 500;                                 // ms
    static const QSize TOUCH_RECT_SIZE;

    explicit TemplateScrollArea(QWidget* parent = nullptr);

    // Lets touches in. Called once the area has its viewport and scroll bar.
    void initTouch();
    void stopFlick() { mFlicker.stop(); }
    // Whether the finger and the point that follows it are as near as they get.
    bool isFlickEnd() const { return mFlicker.isEnd(); }
    // For a button that is taken out of the grid: a finger on it gets no further.
    void letGoOf(TouchEventButton* button);

Q_SIGNALS:
    // A tap on a button; not after a drag.
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

    OneFinger mFinger{this};
    Flicker mFlicker{this, FlickMotion::templateGrid()}; // in coordinates of this widget
    QPoint mPressPoint;                                  // global
    bool mMoved = false;
    QPointer<QPushButton> mPressedButton;
};
