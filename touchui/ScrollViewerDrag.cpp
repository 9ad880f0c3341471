#include "touchui/ScrollViewerDrag.h"

#include "touchui/FlickMotion.h"
#include "touchui/ScrollViewerBoard.h"

#include <QWidget>

#include <vector>

namespace
{

// Moves the clone aside, so that the finger does not cover it.
QPoint getDragItemOffset(DragFlagAlignment alignment)
{
    return alignment == DRAGFLAG_LEFT ? QPoint(-20, 20) : QPoint(20, 20);
}

constexpr int BAR_AND_GAP = 43;

} // namespace

ScrollViewerDrag::ScrollViewerDrag(ScrollViewerBoard& board) : m_board(board)
{
}

// Deletes the clones here, because their parent is another window.
ScrollViewerDrag::~ScrollViewerDrag()
{
    abandon();
    delete m_lastClone.data();
}

void ScrollViewerDrag::keepLast(KSBaseItemWidget* clone)
{
    if (m_lastClone != clone)
        delete m_lastClone.data();
    m_lastClone = clone;
}

void ScrollViewerDrag::lift(KSBaseItemWidget* item, DragFlagAlignment listAlignment, QWidget* parent,
                            const QPoint& position)
{
    m_item = item;
    m_item->setPopup(true);
    m_origin = m_board.indexOf(item);
    m_dropIndex = m_origin;
    m_board.take(item);
    item->hide();
    keepLast(nullptr);

    KSBaseItemWidget* clone = item->clone();
    m_moving = clone ? clone : item;
    m_moving->setPopup(true);
    const DragFlagAlignment own = item->getDragFlagAlignment();
    m_moving->setDragFlagAlignment(own == DRAGFLAG_NONE ? listAlignment : own);
    m_moving->setDragFlag(true);
    m_moving->setParent(parent);
    m_moving->move(position + getDragItemOffset(m_moving->getDragFlagAlignment()));
    m_moving->show();
    m_moving->raise();

    m_board.showPlaceholder(m_size, m_dropIndex);
    m_active = true;
}

void ScrollViewerDrag::moveBy(int dy)
{
    if (m_moving)
        m_moving->move(m_moving->x(), m_moving->y() + dy);
}

int ScrollViewerDrag::topIn(const QWidget* viewer) const
{
    return m_moving ? viewer->mapFromGlobal(m_moving->mapToGlobal(QPoint(0, 0))).y() : 0;
}

int ScrollViewerDrag::height() const
{
    return m_moving ? m_moving->height() : 0;
}

int ScrollViewerDrag::getDropIndicatorID(const QRect& visible, bool tall) const
{
    ScrollViewerBoard::Range range{0, m_board.count()};
    if (tall)
        range = m_board.itemsMeeting(visible.adjusted(0, 0, -BAR_AND_GAP, 0));
    std::vector<int> tops;
    tops.reserve(static_cast<std::size_t>(range.count));
    for (int i = 0; i < range.count; ++i)
        tops.push_back(m_board.place(range.first + i).y());
    return FlickMotion::dropIndex(tops, range.first, m_board.count(), topIn(m_board.board()), m_dropIndex);
}

bool ScrollViewerDrag::updateIndicator(const QRect& visible, bool tall)
{
    if (!m_active)
        return false;
    const int index = getDropIndicatorID(visible, tall);
    if (index == m_dropIndex)
        return false;
    m_dropIndex = index;
    m_board.movePlaceholder(index);
    return true;
}

KSBaseItemWidget* ScrollViewerDrag::drop()
{
    m_active = false;
    edgeTimer.stop();
    KSBaseItemWidget* clone = m_moving != m_item ? m_moving.data() : nullptr;
    KSBaseItemWidget* item = m_item;
    m_moving.clear();
    m_item.clear();
    m_board.hidePlaceholder();
    if (item) {
        item->setParent(m_board.board());
        m_board.insert(item, m_dropIndex);
        item->setPopup(false);
    }
    keepLast(clone);
    return item;
}

void ScrollViewerDrag::abandon()
{
    if (!m_active)
        return;
    m_active = false;
    edgeTimer.stop();
    if (m_moving && m_moving != m_item)
        m_moving->deleteLater();
    if (m_item) {
        m_item->setParent(m_board.board());
        m_item->setPopup(false);
        m_item->hide();
    }
    m_moving.clear();
    m_item.clear();
    m_board.hidePlaceholder();
}

void ScrollViewerDrag::hideLastClone()
{
    if (m_lastClone)
        m_lastClone->hide();
}
