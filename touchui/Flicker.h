#pragma once

#include "touchui/FlickMotion.h"
#include "touchui/TouchTimer.h"

#include <QObject>
#include <QPointF>

#include <optional>

class QAbstractScrollArea;

// Lets a list follow a finger and glide on after it, with the arithmetic of FlickMotion.
//
// While the start point and the end point differ, ticked() is emitted at each interval, and the list scrolls
// by advance(). The motion stops when they meet, or at an end of the list. Points are in pixels, in a
// coordinate space that the list chooses. GUI thread only.
class Flicker : public QObject
{
    Q_OBJECT
public:
    // How a motion has ended. Rest: the list has reached the finger. Glide: it has stopped after a flick.
    // Limit: it has reached its first or last row.
    enum class End { Rest, Glide, Limit };

    // The list, which is usually the owner of this object, must outlive it. Its vertical scroll bar provides
    // the limits.
    Flicker(const QAbstractScrollArea* list, const FlickMotion::Rules& rules);

    // Call when a finger comes down: stops any motion and enables following.
    void begin(const QPointF& position);
    // Ignored, like lift(), if no finger is down.
    void follow(const QPointF& position);
    // Call when the finger is lifted: the list glides if there is a distance left, unless the bounds have
    // reduced the last step.
    void lift(const QPointF& position);
    // Stops following and any motion.
    void cancel();
    bool isFollowing() const { return m_following; }
    // Returns whether the finger has moved further than a tap allows (Euclidean distance).
    bool isMove() const { return FlickMotion::isMove(m_press, m_current); }

    void setStart(const QPointF& point);
    // Moves the end point and starts the motion if necessary. Ignored while following is disabled.
    void setEnd(const QPointF& point);
    // Returns whether no distance is left.
    bool isEnd() const { return FlickMotion::isFlickEnd(m_rules, m_start, m_end); }
    // Discards the distance that is left.
    void rest() { setStart(m_end); }
    // Stops the motion at once, without ended().
    void stop();
    bool isRunning() const { return m_timer.isActive(); }

    // Calculate one tick: move the start point and return the distance by which the content moves. drag() is
    // for a finger that is down, glide() for the time after the lift; advance() selects between them. The
    // bounds apply only to a drag.
    QPointF advance(const std::optional<FlickMotion::DragBounds>& bounds = std::nullopt);
    QPointF drag(const std::optional<FlickMotion::DragBounds>& bounds = std::nullopt);
    QPointF glide();

    // Returns whether the list glides after the lift.
    bool isGliding() const { return m_gliding; }
    void setGliding(bool gliding) { m_gliding = gliding; }
    // Whether following is enabled. Disabling it stops the motion.
    bool isAble() const { return m_able; }
    void setAble(bool able);
    // Returns whether the list has moved since the start point was set.
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
    bool m_pendingStart = false; // the first move sets the start point again
    bool m_gliding = false;
    bool m_able = true;
    bool m_hasFlicked = false;
    bool m_bounded = false; // the bounds have reduced the last step
};
