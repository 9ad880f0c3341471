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

// Tracks the one finger that works a widget: which touch point it is, where it is, and whether it is held
// still long enough. Further fingers are ignored until it is lifted.
//
// A touch that does not end by a lift is cancelled here, for every widget in the same way: when a
// QEvent::TouchCancel arrives, when the widget is hidden or disabled, when the object that received the touch
// is destroyed, and when a touch begins although the last one had no end. cancelled() is then emitted, and
// its receiver brings the widget back to rest: it stops its timers and puts what it carried where it was.
//
// Positions are global unless said otherwise. GUI thread only.
class OneFinger : public QObject
{
    Q_OBJECT
public:
    // What an event means for the finger. None: it concerns another finger, or the touch was cancelled.
    enum class Step { None, Begin, Move, End };

    // The widget is not owned and must outlive this object, of which it is usually the owner.
    explicit OneFinger(QWidget* widget);

    // Takes a touch event. receiver is the object that the event was sent to, where the event does not say it
    // itself: the widget, or a child whose touches the widget takes.
    Step follow(const QTouchEvent* event, QObject* receiver = nullptr);
    // Takes an event that is of touch, see follow(). Returns whether it is.
    bool takes(QEvent* event, QObject* receiver = nullptr);
    static bool isTouch(const QEvent* event);
    // What the last event meant.
    Step step() const { return m_step; }
    // Cancels the touch at its receiver, whose part of the touch lock becomes free, and the hold. Does
    // nothing when there is neither.
    void cancel();

    bool isDown() const { return m_id != NONE; }
    // Of the touch point; -1 when no finger is down.
    int id() const { return m_id; }
    // The object that received the touch; null when no finger is down.
    QObject* receiver() const { return m_receiver; }
    // Where the finger is, or was lifted.
    QPointF position() const { return m_position; }
    QPointF pressPosition() const { return m_pressPosition; }
    // The same in coordinates of the widget.
    QPointF positionIn(const QWidget* widget) const;

    // Emits held() after so many milliseconds, unless the finger is lifted or cancelled, or stopHold() is
    // called. Starts anew when it runs already.
    void startHold(int milliseconds);
    void stopHold() { m_hold.stop(); }
    // Starts the time once more, if it runs.
    void restartHold() { m_hold.restartIfActive(); }

    // Cancels the touch of an object, for those who keep the rest of a touch from it: sends it a
    // QEvent::TouchCancel by way of the application. Harmless when the object has no touch.
    static void cancelTouchOf(QObject* object);

    bool eventFilter(QObject* object, QEvent* event) override;

    // The mouse event that a touch is passed on as: the finger is the left button. position is in the
    // widget.
    static QMouseEvent mouseEvent(QEvent::Type type, const QPointF& position, const QPointF& globalPosition);

Q_SIGNALS:
    // The finger came down, moved, was lifted; by then isDown() is false.
    void began();
    void moved();
    void lifted();
    // The same, as the type of the mouse event that says so.
    void acted(QEvent::Type mouse);
    // The touch ended without a lift; isDown() is false already. When the object that received the touch is
    // destroyed, this comes once it is gone.
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
