#include "touchui/TreeTouch.h"

#include "touchui/CustomTreeDelegete.h"
#include "touchui/KSTreeView.h"

#include <QApplication>
#include <QMouseEvent>
#include <QScrollBar>

TreeTouch::TreeTouch(KSTreeView& tree)
    : m_tree(tree), m_finger(&tree), m_flicker(&tree, FlickMotion::treeView())
{
    connect(&m_finger, &OneFinger::held, this, &TreeTouch::hold);
    connect(&m_finger, &OneFinger::cancelled, this, &TreeTouch::rest);
    connect(&m_flicker, &Flicker::started, this, &TreeTouch::startMotion);
    connect(&m_flicker, &Flicker::ticked, this,
            [this] { m_tree.changeScrollBarValue(m_tree.getDistance().y()); });
    connect(&m_flicker, &Flicker::ended, this, &TreeTouch::showLastRowWhole);
}

// --- Finger -------------------------------------------------------------------------------------------

QPoint TreeTouch::fingerPosition() const
{
    return m_finger.positionIn(m_tree.viewport()).toPoint();
}

void TreeTouch::fingerPressed()
{
    press(fingerPosition());
}

void TreeTouch::fingerMoved()
{
    const QPoint point = fingerPosition();
    m_flicker.follow(point);
    followPress(point);
}

void TreeTouch::fingerLifted()
{
    m_flicker.lift(fingerPosition());
}

void TreeTouch::endFingerPress()
{
    endPress(fingerPosition());
}

void TreeTouch::rest()
{
    m_flicker.cancel();
    cancelPress();
    m_elidedText.hide();
}

void TreeTouch::restartTimers()
{
    m_finger.restartHold();
    m_elidedText.restartIfActive();
}

// --- Mouse --------------------------------------------------------------------------------------------

bool TreeTouch::takesMouse(QEvent* event)
{
    if (!m_tree.isEnabled())
        return false;
    switch (event->type()) {
    case QEvent::MouseButtonPress:
    case QEvent::MouseButtonDblClick:
        mousePressed(*static_cast<QMouseEvent*>(event));
        break;
    case QEvent::MouseMove:
        mouseMoved(*static_cast<QMouseEvent*>(event));
        break;
    case QEvent::MouseButtonRelease:
        mouseReleased(*static_cast<QMouseEvent*>(event));
        break;
    default:
        return false;
    }
    event->accept();
    return true;
}

void TreeTouch::mousePressed(const QMouseEvent& event)
{
    if (event.button() == Qt::LeftButton && !m_finger.isDown())
        press(event.position().toPoint());
}

void TreeTouch::mouseMoved(const QMouseEvent& event)
{
    const QPoint point = event.position().toPoint();
    if ((event.buttons() & Qt::LeftButton) && !m_finger.isDown())
        m_flicker.follow(point);
    followPress(point);
}

void TreeTouch::mouseReleased(const QMouseEvent& event)
{
    if (event.button() != Qt::LeftButton || m_finger.isDown())
        return;
    const QPoint point = event.position().toPoint();
    m_flicker.lift(point);
    endPress(point);
}

// --- Press --------------------------------------------------------------------------------------------

bool TreeTouch::isUsable(const QModelIndex& index) const
{
    return m_tree.isEnabled() && index.isValid() && (m_tree.model()->flags(index) & Qt::ItemIsEnabled);
}

bool TreeTouch::isCheckBoxPressed(const QModelIndex& index) const
{
    return m_pressedCheckBox.isValid() && m_pressedCheckBox == index.siblingAtColumn(0);
}

bool TreeTouch::isIndicatorPressed(const QModelIndex& index) const
{
    return m_pressedIndicator.isValid() && m_pressedIndicator == index.siblingAtColumn(0);
}

void TreeTouch::releaseCheckBox()
{
    m_pressedCheckBox = QModelIndex();
}

// Returns the touch area of the row's indicator: the full height, and as wide as the indentation.
QRect TreeTouch::indicatorArea(const QModelIndex& index) const
{
    const QRect indicator = m_tree.getIndicatorRect(index);
    if (indicator.isNull())
        return QRect();
    const QRect row = m_tree.getIndexVisualRect(index);
    const int width = m_tree.getDesignAttribute(KSVIEW::DesignIndentation).toInt();
    return QRect(indicator.center().x() - width / 2, row.top(), width, row.height());
}

void TreeTouch::press(const QPoint& point)
{
    const bool brake = m_flicker.isGliding();
    m_flicker.begin(point);
    if (!brake)
        beginPress(point);
}

void TreeTouch::beginPress(const QPoint& point)
{
    cancelPress();
    m_press = Press::Down;
    m_pressPoint = point;
    const QModelIndex index = m_tree.indexAt(point);
    m_pressedRow = index;
    if (!isUsable(index))
        return;
    const QModelIndex first = index.siblingAtColumn(0);
    if (m_tree.getCheckBoxRectForTouch(first).contains(point))
        m_pressedCheckBox = first;
    else if (indicatorArea(first).contains(point))
        m_pressedIndicator = first;
    else
        m_finger.startHold(m_holdInterval);
    m_tree.viewport()->update();
}

bool TreeTouch::isBeyondSlop(const QPoint& point) const
{
    return (point - m_pressPoint).manhattanLength() > QApplication::startDragDistance();
}

void TreeTouch::followPress(const QPoint& point)
{
    if (m_press == Press::None)
        return;
    if (isBeyondSlop(point)) {
        m_finger.stopHold();
        if (m_press == Press::Down)
            m_press = Press::Moved;
    }
    if (m_pressedCheckBox.isValid() && !m_tree.getCheckBoxRectForTouch(m_pressedCheckBox).contains(point)) {
        m_pressedCheckBox = QModelIndex();
        m_tree.viewport()->update();
    }
    if (m_pressedIndicator.isValid() && !indicatorArea(m_pressedIndicator).contains(point)) {
        m_pressedIndicator = QModelIndex();
        m_tree.viewport()->update();
    }
}

void TreeTouch::endPress(const QPoint& point)
{
    if (m_press == Press::Down && !isBeyondSlop(point))
        tap(point);
    cancelPress();
}

void TreeTouch::cancelPress()
{
    m_finger.stopHold();
    m_press = Press::None;
    m_pressedRow = QModelIndex();
    m_pressedCheckBox = QModelIndex();
    m_pressedIndicator = QModelIndex();
    m_tree.viewport()->update();
}

// Uses what was pressed, even if the list has moved by a few pixels since. Receivers may change the model.
void TreeTouch::tap(const QPoint& point)
{
    const QPersistentModelIndex index = m_pressedRow;
    if (m_pressedCheckBox.isValid()) {
        if (m_tree.getCheckBoxRectForTouch(m_pressedCheckBox).contains(point))
            m_tree.changeCheckState(m_pressedCheckBox);
    } else if (m_pressedIndicator.isValid()) {
        if (indicatorArea(m_pressedIndicator).contains(point))
            m_tree.setExpanded(m_pressedIndicator, !m_tree.isExpanded(m_pressedIndicator));
    } else if (isUsable(index)) {
        makeCurrent(index);
        if (index.isValid())
            Q_EMIT currentChangedByTouch(index);
        if (index.isValid())
            Q_EMIT clicked(index);
    }
}

void TreeTouch::makeCurrent(const QModelIndex& index)
{
    const QPersistentModelIndex kept = index;
    m_tree.setCurrentIndex(index);
    if (kept.isValid())
        Q_EMIT pressed(kept);
}

void TreeTouch::hold()
{
    if (m_press != Press::Down || !isUsable(m_pressedRow))
        return;
    m_press = Press::Held;
    const QPersistentModelIndex index = m_pressedRow;
    makeCurrent(index);
    if (index.isValid() && m_tree.isTextElide(index))
        showElidedText(index);
    if (index.isValid())
        Q_EMIT pressedAndHeld(index);
}

void TreeTouch::showElidedText(const QModelIndex& index)
{
    const QRect row = m_tree.getIndexVisualRect(index);
    const QRect text = m_tree.treeDelegate()->textRect(m_tree.visualRect(index), index);
    m_elidedText.show(QRect(m_tree.viewport()->mapToGlobal(row.topLeft()), row.size()),
                      index.data(Qt::DisplayRole).toString(), text.width());
}

// --- Motion -------------------------------------------------------------------------------------------

void TreeTouch::startMotion()
{
    m_tree.setVerticalScrollMode(QAbstractItemView::ScrollPerPixel);
    m_finger.stopHold();
    m_elidedText.hide();
}

void TreeTouch::showLastRowWhole()
{
    const QScrollBar* bar = m_tree.verticalScrollBar();
    if (bar->value() == bar->maximum())
        m_tree.scrollToBottom();
}
