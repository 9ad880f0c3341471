#pragma once

#include "touchui/FlickMotion.h"

#include <QObject>
#include <QPointF>

#include <optional>

// How a scroll viewer follows a finger and runs on after it: the two points of the motion and the timer,
// which reports at the owner. Points are in the viewer's coordinates.
class ScrollViewerFlick
{
public:
    explicit ScrollViewerFlick(QObject* timerOwner);
    ~ScrollViewerFlick();
    ScrollViewerFlick(const ScrollViewerFlick&) = delete;
    ScrollViewerFlick& operator=(const ScrollViewerFlick&) = delete;

    bool isFollowing() const { return m_following; }
    void begin(const QPointF& position);
    // The first update of a finger sets the start point once more.
    void follow(const QPointF& position);
    void letGo() { m_following = false; }
    bool isMove() const { return FlickMotion::isMove(m_first, m_current); }

    void setStart(const QPointF& point);
    void setEnd(const QPointF& point) { m_end = point; }
    bool isEnd() const;
    // Forgets the way that is left.
    void rest() { setStart(m_end); }

    void startTimer();
    void stopTimer();
    bool isRunning() const { return m_timerId != 0; }
    bool isTimer(int timerId) const { return m_timerId != 0 && m_timerId == timerId; }

    // One tick. The bounds matter while a finger is down.
    QPointF advance(const std::optional<FlickMotion::DragBounds>& bounds);

    bool isAuto() const { return m_auto; }
    void setAuto(bool automatic) { m_auto = automatic; }
    bool isAble() const { return m_able; }
    void setAble(bool able) { m_able = able; }
    bool hasFlicked() const { return m_hasFlicked; }
    // The last tick was cut short by its bounds.
    bool isBounded() const { return m_bounded; }

private:
    QObject* m_owner;
    int m_timerId = 0;
    QPointF m_start;
    QPointF m_end;
    QPointF m_first;
    QPointF m_current;
    bool m_following = false; // a finger
    bool m_pendingStart = false;
    bool m_auto = false;
    bool m_able = true;
    bool m_hasFlicked = false;
    bool m_bounded = false;
};
