#pragma once

#include "touchui/OneFinger.h"

#include <QPoint>
#include <QPushButton>
#include <QRect>

class QEventPoint;
class QMouseEvent;
class QTouchEvent;

// A push button that one finger operates like a mouse: touch events are converted to mouse events, and
// further fingers are ignored until the first is lifted. Positions are in widget coordinates unless stated
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

    // A finger inside this rectangle counts as being on the button, even beside it. Null for none.
    void setTouchRect(const QRect& rect) { m_touchRect = rect; }

    // Returns true while the button is released because its touch was cancelled, not by the operator.
    bool isTouchCancelled() const { return m_touchCancelled; }

Q_SIGNALS:
    // outside is true if the finger slid off the button, false if it was lifted on it.
    void signalReleased(bool outside);
    // Emitted for every finger that comes down, including further ones; point is in global coordinates.
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
    QPoint m_lastPosition;
    QRect m_touchRect;
    bool m_touchCancelled = false;
    bool m_releasedOutside = false;
};
