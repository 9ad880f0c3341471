#include "touchui/ScrollViewerTouch.h"

#include "support/LogManager.h"
#include "touchui/KSScrollViewerWidget.h"
#include "touchui/ScrollViewerBoard.h"

#include <QMouseEvent>
#include <QScrollBar>
#include <QTouchEvent>

ScrollViewerTouch::ScrollViewerTouch(KSScrollViewerWidget& list, ScrollViewerBoard& board)
    : m_list(list)
    , m_board(board)
    , m_finger(&list)
    , m_flicker(&list, FlickMotion::scrollViewer())
    , m_drag(board)
{
    m_press.hold.setSingleShot(true);
    m_press.popup.setSingleShot(true);
    connect(&m_finger, &OneFinger::cancelled, this, &ScrollViewerTouch::rest);
    connect(&m_flicker, &Flicker::ended, this, &ScrollViewerTouch::motionEnded);
    connect(&m_press.hold, &TouchTimer::timeout, this, &ScrollViewerTouch::reportHold);
    connect(&m_press.popup, &TouchTimer::timeout, this, [this] { startDrag(); });
    connect(&m_drag.edgeTimer, &TouchTimer::timeout, this, &ScrollViewerTouch::scrollAtEdge);
}

// --- Touch --------------------------------------------------------------------------------------------

bool ScrollViewerTouch::take(QObject* object, QTouchEvent* event)
{
    if (event->type() != QEvent::TouchCancel && isOtherItemTouchWhenGraping(object))
        return true;
    if (m_finger.follow(event, object) == OneFinger::Step::None)
        return !m_isTake;
    auto* item = qobject_cast<KSBaseItemWidget*>(object);
    const bool isItem = item && (m_board.indexOf(item) >= 0 || m_drag.item() == item);
    if (!isItem && object != &m_list && object != m_list.viewport()) {
        m_list.onTranslateTouchEventToMouse(object, event);
        return true;
    }
    const bool brakes = m_flicker.isGliding();
    const bool result = m_list.onTouchEvent(object, event);
    if (brakes)
        brake(m_finger.positionIn(&m_list).toPoint());
    else
        m_list.onTranslateTouchEventToMouse(object, event);
    return result;
}

// A touch on a gliding list only stops it.
void ScrollViewerTouch::brake(const QPoint& pos)
{
    m_press.drop();
    m_press.press = pos;
    m_press.last = pos;
    m_press.stopTimers();
    m_press.clearItem();
}

bool ScrollViewerTouch::isOtherItemTouchWhenGraping(const QObject* object) const
{
    if (!m_drag.isActive() || object == m_finger.receiver())
        return false;
    if (object == &m_list || object == m_list.viewport())
        return true;
    return m_board.indexOf(qobject_cast<const KSBaseItemWidget*>(object)) >= 0;
}

void ScrollViewerTouch::rest()
{
    m_flicker.cancel();
    m_press.stopTimers();
    m_press.drop();
    m_press.moved = false;
    m_press.willFlick = false;
    if (m_drag.isActive()) {
        m_drag.returnToOrigin();
        dropItem();
    }
}

bool ScrollViewerTouch::isUsing(const KSBaseItemWidget* item) const
{
    return m_press.item == item || m_finger.receiver() == item;
}

void ScrollViewerTouch::forget(const KSBaseItemWidget* item)
{
    if (m_press.item == item) {
        m_press.clearItem();
        m_press.stopTimers();
        m_press.drop();
    }
    breakTouchOf(item);
}

void ScrollViewerTouch::breakTouchOf(const KSBaseItemWidget* item)
{
    if (m_finger.receiver() == item)
        m_finger.cancel();
}

bool ScrollViewerTouch::followMotion()
{
    const QPointF position = m_finger.positionIn(&m_list);
    if (m_finger.step() == OneFinger::Step::Begin) {
        if (!m_isTake)
            m_flicker.begin(position);
        return !m_isTake;
    }
    if (!m_flicker.isFollowing())
        return !m_isTake;
    if (m_finger.step() == OneFinger::Step::Move) {
        m_flicker.follow(position);
        return true;
    }
    m_flicker.lift(position);
    if (m_flicker.isAble() && !m_flicker.isEnd())
        m_savedMinitrim = std::exchange(m_minitrim, false);
    return true;
}

void ScrollViewerTouch::motionEnded(Flicker::End end)
{
    if (end == Flicker::End::Rest)
        m_minitrim = m_savedMinitrim;
}

std::optional<FlickMotion::DragBounds> ScrollViewerTouch::dragBounds() const
{
    const KSBaseItemWidget* item = m_press.item;
    if (!item || m_board.indexOf(item) < 0)
        return std::nullopt;
    const int top = m_board.board()->mapTo(&m_list, item->pos()).y();
    return FlickMotion::DragBounds{top, top + item->height() - 1, m_list.height()};
}

int ScrollViewerTouch::value() const
{
    return m_list.verticalScrollBar()->value();
}

void ScrollViewerTouch::scrollBy(int offset)
{
    const QScrollBar* bar = m_list.verticalScrollBar();
    m_list.slotSetScrollBarValue(
        FlickMotion::scrolledValue(bar->value(), offset, bar->minimum(), bar->maximum()));
}

void ScrollViewerTouch::passOnAsMouse()
{
    const QPoint pos = m_finger.positionIn(&m_list).toPoint();
    switch (m_finger.step()) {
    case OneFinger::Step::Begin:
        fingerPressed(pos);
        break;
    case OneFinger::Step::Move:
        fingerMoved(pos);
        break;
    case OneFinger::Step::End:
        fingerLifted(pos);
        break;
    case OneFinger::Step::None:
        break;
    }
}

// --- Press --------------------------------------------------------------------------------------------

void ScrollViewerTouch::setEffectiveArea(int left, int width)
{
    m_effectiveLeft = left;
    m_effectiveWidth = width;
}

void ScrollViewerTouch::fingerPressed(const QPoint& pos)
{
    beginPress(ScrollViewerPress::Pointer::Finger, pos, Qt::LeftButton);
}

void ScrollViewerTouch::beginPress(ScrollViewerPress::Pointer pointer, const QPoint& pos,
                                   Qt::MouseButton button)
{
    m_press.begin(pointer, pos, value());
    m_press.item =
        m_board.itemAroundThePos(m_board.board()->mapFrom(&m_list, pos), m_list.calculateVisibleRect());
    m_press.index = m_board.indexOf(m_press.item);
    if (pos.x() < m_effectiveLeft || pos.x() > m_effectiveLeft + m_effectiveWidth) {
        m_press.clearItem();
        m_press.drop();
        return;
    }
    if (m_press.index < 0) {
        m_press.calculateBounds(0, m_list.height());
        startPress(button, L"handleAreaPressedEvent");
        return;
    }
    m_press.positionInItem = m_press.item->mapFrom(&m_list, pos);
    m_press.calculateBounds(m_press.item->height(), m_list.height());
    m_press.item->setHasFocus(true);
    if (m_itemsCanDrag && isItemDragAreaPressed()) {
        m_drag.setSize(m_press.item->size());
        m_press.popup.start(ScrollViewerPress::POPUP_TIME);
        m_press.dragAreaPressed = true;
    } else {
        startPress(button, L"handleItemPressedEvent");
    }
}

bool ScrollViewerTouch::isItemDragAreaPressed() const
{
    const QRect area = m_press.item->getDragArea();
    return !area.isNull() && area.contains(m_press.positionInItem);
}

void ScrollViewerTouch::startPress(Qt::MouseButton button, const wchar_t* tag)
{
    if (button == Qt::RightButton) {
        m_press.drop();
        Q_EMIT rightPressed(m_press.item, reportedPosition());
        return;
    }
    m_press.hold.start(ScrollViewerPress::HOLD_TIME);
    LOG_USER_OPERATE(tag, 200, L"Timer started");
    Q_EMIT pressed(m_press.item, reportedPosition());
}

QPoint ScrollViewerTouch::reportedPosition() const
{
    return m_press.item ? m_press.positionInItem : m_press.press;
}

void ScrollViewerTouch::reportHold()
{
    const bool isItemGone = m_press.index >= 0 && !m_press.item;
    if (!m_press.willFlick && !isItemGone)
        Q_EMIT held(m_press.item, reportedPosition());
}

void ScrollViewerTouch::restartTimers()
{
    m_press.hold.restartIfActive();
    m_drag.edgeTimer.restartIfActive();
}

void ScrollViewerTouch::fingerMoved(const QPoint& pos)
{
    reportMove(pos);
    if (!m_press.isActive())
        return;
    if (m_drag.isActive())
        moveDragItem(pos);
    else
        leavesTap(pos);
}

void ScrollViewerTouch::reportMove(const QPoint& pos)
{
    m_press.current = pos;
    if (m_press.item)
        Q_EMIT movedOver(m_press.item, inPressedItem(pos));
}

// Returns whether the press has moved further than a tap allows. If so, stops the hold and reports the press
// as a possible flick.
bool ScrollViewerTouch::leavesTap(const QPoint& pos)
{
    if (!m_press.isBeyondSlop(pos))
        return false;
    m_press.hold.stop();
    if (m_press.item) {
        Q_EMIT flicked(m_press.item, m_press.positionInItem, m_press.willFlick);
        if (m_press.willFlick)
            judgeMove(pos);
    }
    return true;
}

void ScrollViewerTouch::judgeMove(const QPoint& pos)
{
    if (!m_press.dragAreaPressed && !isInsidePressedItem(pos)) {
        m_press.drop();
        m_press.willFlick = false;
    }
    m_press.moved = value() != m_press.valueAtPress;
}

bool ScrollViewerTouch::isInsidePressedItem(const QPoint& pos) const
{
    return m_press.item && m_press.item->rect().contains(inPressedItem(pos));
}

// Converts by global coordinates, because the item may float in another window.
QPoint ScrollViewerTouch::inPressedItem(const QPoint& pos) const
{
    return m_press.item->mapFromGlobal(m_list.mapToGlobal(pos));
}

void ScrollViewerTouch::fingerLifted(const QPoint& pos)
{
    m_press.popup.stop();
    // A gliding list counts as moved, even before its first tick; a finger that only slid a little is still a
    // tap.
    const QScrollBar* bar = m_list.verticalScrollBar();
    if ((m_press.willFlick || m_flicker.isMove()) && m_flicker.isGliding() && bar->maximum() > bar->minimum())
        m_press.moved = true;
    endPress(pos);
}

void ScrollViewerTouch::endPress(const QPoint& pos)
{
    if (!m_press.isActive())
        return;
    m_press.drop();
    m_press.stopTimers();
    m_drag.edgeTimer.stop();
    m_list.viewport()->releaseMouse();
    const bool moved = m_press.moved;
    reportEnd(pos, moved);
    if (!moved)
        m_press.willFlick = false;
    if (m_drag.isActive() || moved) {
        dropAtRelease();
        m_press.moved = false;
        m_press.willFlick = false;
    } else if (m_press.item && isInsidePressedItem(pos)) {
        Q_EMIT clicked(m_press.item, m_press.positionInItem);
    }
}

// Does not report a release outside the pressed item.
void ScrollViewerTouch::reportEnd(const QPoint& pos, bool moved)
{
    if (m_press.item && !isInsidePressedItem(pos))
        return;
    const QPoint place = m_press.item ? inPressedItem(pos) : pos;
    if (moved)
        Q_EMIT releasedAfterMotion(m_press.item, place);
    else
        Q_EMIT released(m_press.item, place);
}

// --- Mouse --------------------------------------------------------------------------------------------

void ScrollViewerTouch::mousePressed(const QMouseEvent* event)
{
    m_flicker.stop();
    m_finger.cancel();
    beginPress(ScrollViewerPress::Pointer::Mouse, event->position().toPoint(), event->button());
}

void ScrollViewerTouch::mouseMoved(const QMouseEvent* event)
{
    if (m_finger.isDown())
        return;
    const QPoint pos = event->position().toPoint();
    reportMove(pos);
    if (!m_press.isActive())
        return;
    if (m_drag.isActive()) {
        moveDragItem(pos);
        return;
    }
    if (!leavesTap(pos))
        return;
    Q_EMIT mouseDrags();
    if (pos.y() != m_press.last.y()) {
        moveAll(pos);
        m_press.moved = m_press.moved || value() != m_press.valueAtPress;
    }
}

void ScrollViewerTouch::mouseReleased(const QMouseEvent* event)
{
    m_press.popup.stop();
    if (!m_finger.isDown())
        endPress(event->position().toPoint());
}

void ScrollViewerTouch::moveAll(const QPoint& pos)
{
    const bool stays = m_press.outOfBounds && m_press.isOutside(pos.y());
    if (!stays) {
        int distance = pos.y() - m_press.last.y();
        if (const auto bounds = dragBounds())
            distance = FlickMotion::boundedDistance(distance, *bounds);
        scrollBy(distance);
        m_press.outOfBounds = m_press.isOutside(pos.y());
    }
    m_press.last = pos;
}

// --- Drag ---------------------------------------------------------------------------------------------

void ScrollViewerTouch::startDrag(KSBaseItemWidget* item)
{
    if (!item || m_drag.isActive() || m_board.indexOf(item) < 0)
        return;
    m_press.item = item;
    m_press.index = m_board.indexOf(item);
    m_press.willFlick = false;
    m_drag.setSize(item->size());
    item->setPopup(true);
    startDrag();
}

void ScrollViewerTouch::startDrag()
{
    KSBaseItemWidget* item = m_press.item;
    if (m_drag.isActive() || !item || m_board.indexOf(item) < 0)
        return;
    m_press.stopTimers();
    // From now on the finger moves the item instead of the list.
    m_flicker.setAble(false);
    m_flicker.rest();
    Q_EMIT dragStarts(item, m_press.index);
    QWidget* parent =
        KSScrollViewerWidget::s_mainWnd ? KSScrollViewerWidget::s_mainWnd.data() : m_list.window();
    const QPoint position = parent->mapFromGlobal(m_list.mapToGlobal(m_press.press)) - m_press.positionInItem;
    m_drag.lift(item, m_dragAlignment, parent, position);
    m_list.viewport()->grabMouse();
    Q_EMIT dragStarted();
    // The item was lifted where the pointer was put down. A pointer that moved since may not move again.
    m_press.last = m_press.press;
    if (m_press.current != m_press.press)
        moveDragItem(m_press.current);
}

int ScrollViewerTouch::overhang() const
{
    return m_drag.topIn(&m_list) + m_drag.height() - m_list.height();
}

void ScrollViewerTouch::moveDragItem(const QPoint& pos)
{
    m_drag.moveBy(pos.y() - m_press.last.y());
    m_press.last = pos;
    if (!FlickMotion::needsEdgeScroll(m_drag.topIn(&m_list), overhang()))
        m_drag.edgeTimer.stop();
    else if (!m_drag.edgeTimer.isActive())
        m_drag.edgeTimer.start(ScrollViewerDrag::SCROLL_TIME);
    updateIndicator();
}

void ScrollViewerTouch::scrollAtEdge()
{
    scrollBy(FlickMotion::edgeScrollOffset(m_drag.topIn(&m_list), overhang()));
    updateIndicator();
}

void ScrollViewerTouch::updateIndicator()
{
    m_drag.updateIndicator(m_list.calculateVisibleRect(), m_board.board()->height() > m_list.height());
}

void ScrollViewerTouch::dropItem()
{
    m_list.viewport()->releaseMouse();
    m_press.dragAreaPressed = false;
    KSBaseItemWidget* item = m_drag.drop();
    if (item) {
        m_press.item = item;
        m_press.index = m_board.indexOf(item);
        if (!m_itemsCanDrag)
            item->setDragFlag(false);
        item->show();
    }
    Q_EMIT dropped();
    m_drag.hideLastClone();
}

void ScrollViewerTouch::dropAtRelease()
{
    if (!m_drag.isActive())
        return;
    const QPointer<KSBaseItemWidget> item = m_drag.item();
    dropItem();
    if (item && m_board.indexOf(item) >= 0 &&
        item->geometry().bottom() > m_list.calculateVisibleRect().bottom())
        m_list.setLastVisibleItem(item);
}

void ScrollViewerTouch::abandonDrag()
{
    if (!m_drag.isActive())
        return;
    m_list.viewport()->releaseMouse();
    m_press.clearItem();
    m_press.drop();
    m_press.dragAreaPressed = false;
    m_drag.abandon();
}

void ScrollViewerTouch::setItemsCanDrag(bool canDrag)
{
    if (m_itemsCanDrag == canDrag)
        return;
    m_itemsCanDrag = canDrag;
    for (KSBaseItemWidget* item : m_board.widgets())
        item->setDragFlag(canDrag);
    if (!canDrag && m_drag.isActive()) {
        dropItem();
        m_press.drop();
    }
}
