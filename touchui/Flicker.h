#pragma once

#include "touchui/FlickMotion.h"
#include "touchui/TouchTimer.h"

#include <QObject>
#include <QPointF>

#include <optional>

class QAbstractScrollArea;

// Lets a list follow a finger and run on after it, by the arithmetic of FlickMotion.
//
// While there is way between the start point and the end point, ticked() comes at each interval, and the list
// scrolls by advance(). The motion ends when there is no way left, or at an end of the list. Points are in
// one coordinate space of the list's choice, pixels. GUI thread only.
class Flicker : public QObject
{
    Q_OBJECT
public:
    // What a motion ends with. Rest: the list is where the finger is. Glide: it has run on after the finger.
    // Limit: it shows its first or its last row.
    enum class End { Rest, Glide, Limit };

    // The list is not owned and must outlive this object, of which it is usually the owner. Its vertical
    // scroll bar gives the limits.
    Flicker(const QAbstractScrollArea* list, const FlickMotion::Rules& rules);

    // A finger comes down: stops what moves, and allows the list to follow.
    void begin(const QPointF& position);
    // Moves and lifts are ignored without a finger.
    void follow(const QPointF& position);
    // Lets the list run on when there is way left, unless the bounds have cut the last tick short.
    void lift(const QPointF& position);
    // The finger counts no more, and nothing moves.
    void cancel();
    bool isFollowing() const { return m_following; }
    // Whether the finger has left the room of a tap, measured straight.
    bool isMove() const { return FlickMotion::isMove(m_press, m_current); }

    void setStart(const QPointF& point);
    // Starts the motion when there is way to the point and it does not run. Ignored when the list may not
    // follow.
    void setEnd(const QPointF& point);
    // Whether there is no way left.
    bool isEnd() const { return FlickMotion::isFlickEnd(m_rules, m_start, m_end); }
    // Forgets the way that is left.
    void rest() { setStart(m_end); }
    // Stops the motion at once; ended() does not come.
    void stop();
    bool isRunning() const { return m_timer.isActive(); }

    // One tick: moves the start point and returns by how much the content moves. drag() with the finger down,
    // glide() after it; advance() is the one that it is time for. The bounds matter to a drag.
    QPointF advance(const std::optional<FlickMotion::DragBounds>& bounds = std::nullopt);
    QPointF drag(const std::optional<FlickMotion::DragBounds>& bounds = std::nullopt);
    QPointF glide();

    // Whether the list runs on after the finger.
    bool isGliding() const { return m_gliding; }
    void setGliding(bool gliding) { m_gliding = gliding; }
    // Whether the list may follow. False stops it.
    bool isAble() const { return m_able; }
    void setAble(bool able);
    // Whether the list has moved since the start point was set.
    bool hasFlicked() const { return m_hasFlicked; }

Q_SIGNALS:
    void started();
    void ticked();
    void ended(Flicker::End end);

private:
    void tick();
    void end(End end);
    bool isAtLimit() const;
    QPointF take(const FlickMotion::Step& step);

    const QAbstractScrollArea* m_list;
    const FlickMotion::Rules m_rules;
    TouchTimer m_timer;
    QPointF m_start;
    QPointF m_end;
    QPointF m_press;
    QPointF m_current;
    bool m_following = false;
    bool m_pendingStart = false; // the first move sets the start point once more
    bool m_gliding = false;
    bool m_able = true;
    bool m_hasFlicked = false;
    bool m_bounded = false; // the last tick was cut short
};
