#include "canvas/TouchTextItem.h"

#include "canvas/ITextInput.h"
#include "support/LogManager.h"

#include <QAbstractEventDispatcher>
#include <QGraphicsSceneContextMenuEvent>
#include <QGraphicsSceneMouseEvent>
#include <QGuiApplication>
#include <QKeyEvent>
#include <QStyleHints>
#include <QTextCursor>
#include <QTextDocument>
#include <algorithm>

using namespace TextObjectConstants;

namespace
{

// Returns whether the event is a blink of the document's own caret, which is not painted: it would only cause
// repaints.
bool isBlinkOfCaret(QObject* watched, const QEvent* event)
{
    if (event->type() != QEvent::Timer)
        return false;
    const int blink = QGuiApplication::styleHints()->cursorFlashTime() / 2;
    const int id = static_cast<const QTimerEvent*>(event)->timerId();
    const QList<QAbstractEventDispatcher::TimerInfo> timers =
        QAbstractEventDispatcher::instance()->registeredTimers(watched);
    return std::any_of(timers.begin(), timers.end(), [blink, id](const auto& timer) {
        return timer.timerId == id && timer.interval == blink;
    });
}

} // namespace

TouchTextItem::TouchTextItem(QGraphicsItem* parent) : QGraphicsTextItem(parent)
{
    setAcceptTouchEvents(true);
    setAcceptDrops(false);
    document(); // makes the parts of Qt's item that receive its timers
    installEventFilter(this);
    const QObjectList parts = children();
    for (QObject* part : parts)
        part->installEventFilter(this);
}

void TouchTextItem::update(const QRectF& rect)
{
    QGraphicsTextItem::update(rect);
    if (QGraphicsItem* parent = parentItem())
        parent->update();
}

// State

int TouchTextItem::getBoundingLineStatus() const
{
    if (m_focusFlag == FocusObject)
        return textInteractionFlags() == Qt::NoTextInteraction ? FocusObject : FocusEdit;
    return m_focusFlag;
}

int TouchTextItem::getStatusId() const
{
    const QTextCursor cursor = textCursor();
    if (cursor.hasSelection())
        return 1;
    if (getBoundingLineStatus() == FocusObject)
        return 0;
    if (getBoundingLineStatus() == FocusEdit && textInteractionFlags() == Qt::TextEditorInteraction)
        return 2;
    return -1;
}

void TouchTextItem::setFocusFlag(int flag)
{
    m_focusFlag = flag;
    update();
}

// Events

void TouchTextItem::handleByTextItem(QEvent::Type type, QEvent& event)
{
    switch (type) {
    case QEvent::GraphicsSceneMousePress:
        QGraphicsTextItem::mousePressEvent(static_cast<QGraphicsSceneMouseEvent*>(&event));
        break;
    case QEvent::GraphicsSceneMouseMove:
        QGraphicsTextItem::mouseMoveEvent(static_cast<QGraphicsSceneMouseEvent*>(&event));
        break;
    case QEvent::GraphicsSceneMouseRelease:
        QGraphicsTextItem::mouseReleaseEvent(static_cast<QGraphicsSceneMouseEvent*>(&event));
        break;
    case QEvent::GraphicsSceneMouseDoubleClick:
        QGraphicsTextItem::mouseDoubleClickEvent(static_cast<QGraphicsSceneMouseEvent*>(&event));
        break;
    case QEvent::KeyPress:
        QGraphicsTextItem::keyPressEvent(static_cast<QKeyEvent*>(&event));
        break;
    default:
        break;
    }
}

void TouchTextItem::mousePressEvent(QGraphicsSceneMouseEvent* event)
{
    if (m_input)
        m_input->mousePress(event);
    else
        QGraphicsTextItem::mousePressEvent(event);
}

void TouchTextItem::mouseMoveEvent(QGraphicsSceneMouseEvent* event)
{
    if (m_input)
        m_input->mouseMove(event);
    else
        QGraphicsTextItem::mouseMoveEvent(event);
}

void TouchTextItem::mouseReleaseEvent(QGraphicsSceneMouseEvent* event)
{
    if (m_input)
        m_input->mouseRelease(event);
    else
        QGraphicsTextItem::mouseReleaseEvent(event);
}

void TouchTextItem::mouseDoubleClickEvent(QGraphicsSceneMouseEvent* event)
{
    if (m_input)
        m_input->mouseDoubleClick(event);
    else
        QGraphicsTextItem::mouseDoubleClickEvent(event);
}

void TouchTextItem::contextMenuEvent(QGraphicsSceneContextMenuEvent* event)
{
    if (!event) {
        LOG_DEBUG_OPERATE(L"Edit Area", 200, L"ContextMenu has no Event ");
        return;
    }
    event->accept();
}

void TouchTextItem::keyPressEvent(QKeyEvent* event)
{
    if (m_input)
        m_input->keyPress(event);
    else
        QGraphicsTextItem::keyPressEvent(event);
}

void TouchTextItem::focusOutEvent(QFocusEvent* event)
{
    if (m_input)
        m_input->focusLost();
    QGraphicsTextItem::focusOutEvent(event);
}

void TouchTextItem::dragEnterEvent(QGraphicsSceneDragDropEvent*)
{
}

void TouchTextItem::dragLeaveEvent(QGraphicsSceneDragDropEvent*)
{
}

void TouchTextItem::dragMoveEvent(QGraphicsSceneDragDropEvent*)
{
}

void TouchTextItem::dropEvent(QGraphicsSceneDragDropEvent*)
{
}

bool TouchTextItem::eventFilter(QObject* watched, QEvent* event)
{
    if (watched != this && watched->parent() == this && isBlinkOfCaret(watched, event))
        return true;
    if (watched == this && m_input && m_input->filter(event))
        return true;
    return QGraphicsTextItem::eventFilter(watched, event);
}
