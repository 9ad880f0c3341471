#pragma once

#include "touchui/OneFinger.h"

#include <QPoint>
#include <QPushButton>
#include <QRect>

class QEventPoint;
class QMouseEvent;
class QTouchEvent;

// A push button that one finger works like a mouse: touch events become mouse events of the button, and
// further fingers are ignored until the first is lifted. Positions are in widget coordinates unless said
// otherwise.
class TouchEventButton : public QPushButton
{
    Q_OBJECT
public:
    explicit TouchEventButton(QWidget* parent = nullptr);
    explicit TouchEventButton(const QString& text, QWidget* parent = nullptr);

    virtual bool touchBeginEvent(QTouchEvent* event);
    virtual bool touchUpdateEvent(QTouchEvent* event);
    virtual bool touchEndEvent(QTouchEvent* event);

    // A finger inside this rectangle counts as on the button, even beside it. Null turns that off.
    void setTouchRect(const QRect& rect) { m_touchRect = rect; }
    QRect touchRect() const { return m_touchRect; }

    // Ends the touch that is on it, without a click, and frees the touch lock that goes with it: for a button
    // that is taken away from under the finger and will not see it lifted.
    void breakTouch();
    // True while the button comes up because its touch was cancelled, which is no release of the operator's.
    bool isTouchCancelled() const { return m_touchCancelled; }

Q_SIGNALS:
    // outside: the finger slid off the button; false: it was lifted on it.
    void signalReleased(bool outside);
    // Where a finger came down, in global coordinates; every finger, also a second one.
    void signalPressedPoint(QPoint point);

protected:
    bool event(QEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;

private Q_SLOTS:
    void slotEmitReleased();

private:
    void init();
    void followMotion(const QTouchEvent* event);
    void comeUp();
    void moveIntoWidget(QPoint& position, QPoint& screenPosition) const;
    void sendRelease(const QPoint& position, const QPoint& screenPosition);

    OneFinger m_finger{this};
    int m_pressCount = 0;
    QPoint m_lastPosition;
    QRect m_touchRect;
    bool m_touchCancelled = false;
    bool m_releasedOutside = false;
};
