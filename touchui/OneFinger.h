#pragma once

#include "touchui/TouchTimer.h"

#include <QEvent>
#include <QMouseEvent>
#include <QObject>
#include <QPointF>
#include <QPointer>

class QEventPoint;
class QTouchEvent;
class QWidget;

// Tracks the one finger that operates a widget: its touch point, its position, and whether it is held still
// long enough. Further fingers are ignored until it is lifted.
//
// A touch that does not end with a lift is cancelled here in the same way for every widget: when a
// QEvent::TouchCancel arrives, when the widget is hidden or disabled, when the object that received the touch
// is destroyed, and when a new touch begins although the last one has not ended. The receiver of cancelled()
// then resets the widget: it stops timers and returns a dragged item to its position.
//
// Positions are global unless stated otherwise. GUI thread only.
class OneFinger : public QObject
{
    Q_OBJECT
public:
    // The meaning of an event for the finger. None: the event is for another finger, or the touch was
    // cancelled.
    enum class Step { None, Begin, Move, End };

    // The widget, which is usually the owner of this object, must outlive it.
    explicit OneFinger(QWidget* widget);

    // Handles a touch event. receiver is the object to which the event was sent, if the event does not
    // contain it: the widget, or a child whose touches the widget handles.
    Step follow(const QTouchEvent* event, QObject* receiver = nullptr);
    // Handles the event with follow() if it is a touch event; returns whether it is.
    bool takes(QEvent* event, QObject* receiver = nullptr);
    static bool isTouch(const QEvent* event);
    // Returns the meaning of the last event.
    Step step() const { return m_step; }
    // Cancels the touch at its receiver, which releases its touch lock, and stops the hold. Does nothing if
    // there is neither.
    void cancel();

    bool isDown() const { return m_id != NONE; }
    // The id of the touch point; -1 if no finger is down.
    int id() const { return m_id; }
    // The object that received the touch; null if no finger is down.
    QObject* receiver() const { return m_receiver; }
    // The position of the finger, or of the lift.
    QPointF position() const { return m_position; }
    QPointF pressPosition() const { return m_pressPosition; }
    // Returns position() in coordinates of the widget.
    QPointF positionIn(const QWidget* widget) const;

    // Emits held() after this time in milliseconds, unless the finger is lifted or cancelled or stopHold() is
    // called before. Restarts the time if it is running.
    void startHold(int milliseconds);
    void stopHold() { m_hold.stop(); }
    // Restarts the time if it is running.
    void restartHold() { m_hold.restartIfActive(); }

    // Cancels the touch of an object by sending it a QEvent::TouchCancel. For callers that keep the further
    // events of the touch from the object. Has no effect if the object has no touch.
    static void cancelTouchOf(QObject* object);

    bool eventFilter(QObject* object, QEvent* event) override;

    // Returns the mouse event for a touch, with the finger as the left button. position is in widget
    // coordinates.
    static QMouseEvent mouseEvent(QEvent::Type type, const QPointF& position, const QPointF& globalPosition);

Q_SIGNALS:
    // Emitted when the finger comes down, moves and is lifted. isDown() is false at the lift.
    void began();
    void moved();
    void lifted();
    // Emitted for the same steps with the type of the corresponding mouse event.
    void acted(QEvent::Type mouse);
    // Emitted when the touch ends without a lift; isDown() is already false. If the object that received the
    // touch is destroyed, this is emitted after its destruction.
    void cancelled();
    void held();

private:
    static constexpr int NONE = -1;

    void report(Step step);
    Step stepOf(const QTouchEvent* event, QObject* receiver);
    Step begin(const QTouchEvent* event, QObject* receiver);
    bool isLost(const QObject* receiver) const;
    void letGo();
    void drop();
    void receiverDestroyed(QObject* receiver);
    void reportEnd();

    QWidget* m_widget;
    QPointer<QObject> m_receiver;
    int m_id = NONE;
    Step m_step = Step::None;
    bool m_isEndUnreported = false;
    QPointF m_position;
    QPointF m_pressPosition;
    TouchTimer m_hold;
};
