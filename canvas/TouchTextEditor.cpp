#include "canvas/TouchTextEditor.h"

#include "canvas/GraphicsText.h"
#include "canvas/StyleDocument.h"
#include "canvas/TextPainter.h"
#include "canvas/TextStyleEditor.h"
#include "support/LogManager.h"

#include <QGraphicsSceneMouseEvent>
#include <QKeyEvent>
#include <QTextBlock>
#include <QTextCursor>
#include <QTextDocument>
#include <QTextLayout>
#include <algorithm>

namespace
{

// Around the picture of a handle that still counts as the handle.
constexpr double HandleTolerance = 8.0;
constexpr double CaretShift = 1.0;
// How far the finger moves on after the limits of an object's left and upper side before it takes the object
// along.
constexpr double LeftReturnFactor = 2.0;
constexpr double TopReturnFactor = 3.0;

bool isMouseEvent(QEvent::Type type)
{
    return type == QEvent::GraphicsSceneMousePress || type == QEvent::GraphicsSceneMouseMove ||
           type == QEvent::GraphicsSceneMouseRelease || type == QEvent::GraphicsSceneMouseDoubleClick;
}

bool isRightMouseEvent(const QEvent* event)
{
    if (event->type() == QEvent::GraphicsSceneMove)
        return true;
    if (!isMouseEvent(event->type()))
        return false;
    const auto* mouse = static_cast<const QGraphicsSceneMouseEvent*>(event);
    return mouse->button() == Qt::RightButton ||
           (event->type() == QEvent::GraphicsSceneMouseMove && mouse->buttons() == Qt::RightButton);
}

} // namespace

TouchTextEditor::TouchTextEditor(GraphicsText& item) : m_item(item), m_caretPainter(item, m_state)
{
    m_longPressTimer.setSingleShot(true);
    m_longPressTimer.setInterval(LONG_PRESS_TIME);
    QObject::connect(&m_longPressTimer, &QTimer::timeout, &item, &GraphicsText::slotLongPressed);
}

// Press

void TouchTextEditor::mousePress(QGraphicsSceneMouseEvent* event)
{
    m_state.doubleClickedSelection = false;
    m_state.pressed = true;
    m_state.pressPoint = event->pos();
    m_state.placeAtPress = m_item.placedItem()->pos();
    const QTextCursor cursor = m_item.textCursor();
    if (!cursor.hasSelection() && m_item.getFocusFlag() == FocusEdit)
        m_longPressTimer.start();
    m_item.update();
    if (cursor.hasSelection())
        m_state.pressCursor = cursor.position();
    m_state.released = false;
    m_state.moved = false;
    m_state.selectionMoved = false;
    m_state.handleMoving = false;
    m_state.keyboardAsked = false;
    adjustMousePressedPos(event, changePaintStateWhenHandleIsPressed(event->pos()));
    m_item.QGraphicsTextItem::mousePressEvent(event);
    m_state.lastScenePos = event->scenePos();
    m_item.styleEditor().clearSelection();
    Q_EMIT m_item.signalNotifySceneCurrentMousePressedObjectId(m_item.getItemTText()->getTextObjectID());
    m_item.setFlag(QGraphicsItem::ItemIsMovable, m_item.getFocusFlag() == FocusObject);
    m_item.update();
}

bool TouchTextEditor::handleIsHit(const TouchState::End& end, QPointF point)
{
    const QRectF picture(end.point, QSizeF(HANDLEPIXMAPWIDTH, HANDLEPIXMAPHEIGHT));
    return picture.adjusted(-HandleTolerance, -HandleTolerance, HandleTolerance, HandleTolerance)
        .contains(point);
}

TouchTextEditor::HandleHit TouchTextEditor::changePaintStateWhenHandleIsPressed(QPointF point)
{
    m_caretPainter.refreshHandles();
    const bool selecting = m_item.textCursor().hasSelection();
    m_state.handleCaret = false;
    if (!selecting || m_state.previous.position < 0 || m_state.current.position < 0)
        return NoHandle;
    if (handleIsHit(m_state.previous, point)) {
        const int wanted = m_state.current.position;
        putCursor(wanted);
        m_state.handleMoving = true;
        // The pressed handle is always the current one.
        if (m_item.textCursor().position() == wanted)
            exchangeValueofCurrentAndPreviousCursor();
        return PreviousHandle;
    }
    if (handleIsHit(m_state.current, point)) {
        putCursor(m_state.previous.position);
        m_state.handleMoving = true;
        return CurrentHandle;
    }
    return NoHandle;
}

void TouchTextEditor::exchangeValueofCurrentAndPreviousCursor()
{
    std::swap(m_state.previous, m_state.current);
}

void TouchTextEditor::moveUpEventPosWhenHasHandleCaret(QGraphicsSceneMouseEvent* event) const
{
    // The caret runs above the finger, where it can be seen.
    if (m_state.handleCaret || m_state.handleMoving)
        event->setPos(event->pos() - QPointF(0.0, HANDLEPIXMAPHEIGHT));
}

void TouchTextEditor::adjustMousePressedPos(QGraphicsSceneMouseEvent* event, HandleHit hit)
{
    moveUpEventPosWhenHasHandleCaret(event);
    if (hit == NoHandle)
        return;
    const QTextBlock block = m_item.document()->findBlock(m_state.current.position);
    if (m_state.current.position == block.position())
        event->setPos(event->pos() + QPointF(HANDLEPIXMAPWIDTH, 0.0));
    else if (m_state.current.position == block.position() + block.length() - 1)
        event->setPos(event->pos() - QPointF(HANDLEPIXMAPWIDTH, 0.0));
}

void TouchTextEditor::putCursor(int position)
{
    QTextCursor cursor = m_item.textCursor();
    cursor.setPosition(clampedPosition(position));
    m_item.setTextCursor(cursor);
}

int TouchTextEditor::clampedPosition(int position) const
{
    const QTextDocument& document = *m_item.document();
    position = std::clamp(position, 0, document.characterCount() - 1);
    // Nothing can be typed into the middle of a character; services count characters in their own ways.
    const bool insidePair = position > 0 && document.characterAt(position).isLowSurrogate() &&
                            document.characterAt(position - 1).isHighSurrogate();
    return insidePair ? position - 1 : position;
}

// Move

void TouchTextEditor::mouseMove(QGraphicsSceneMouseEvent* event)
{
    m_item.update();
    m_state.released = false;
    m_state.moved = true;
    if (m_item.getFocusFlag() == FocusObject)
        m_state.movedWhileSelected = true;
    m_state.pressed = false;
    if ((m_caretPainter.noHandleCursor() && m_item.getFocusFlag() != FocusObject) || m_state.doubleClicked)
        return;
    moveUpEventPosWhenHasHandleCaret(event);
    m_state.lastScenePos = event->lastScenePos();
    m_item.QGraphicsTextItem::mouseMoveEvent(event);
    m_state.newScenePos = event->scenePos();
    resetItemPos();
    if (m_item.textCursor().hasSelection() && !m_state.selectionMoved) {
        m_state.selectionMoved = true;
        putCursor(m_state.previous.position);
    }
    synchronizeKeyBoardCursorPos();
}

void TouchTextEditor::resetItemPos()
{
    GraphicsText* parent = m_item.parentTextItem();
    if (m_item.getFocusFlag() != FocusObject || !parent)
        return;
    parent->setPos(parent->scenePos() + m_state.newScenePos - m_state.lastScenePos);
    m_item.setPos(0.0, 0.0);
    parent->update();
}

void TouchTextEditor::synchronizeKeyBoardCursorPos()
{
    const QTextCursor cursor = m_item.textCursor();
    if (!cursor.hasSelection())
        return;
    m_state.handleMoving = false;
    m_state.handleCaret = true;
    m_state.longPressed = false;
    if (!selectionIsSaved())
        requestKeyboardForSelection();
    m_longPressTimer.stop();
}

bool TouchTextEditor::selectionIsSaved() const
{
    const QTextCursor cursor = m_item.textCursor();
    return cursor.selectionStart() == m_state.savedSelectionStart &&
           cursor.selectionEnd() == m_state.savedSelectionEnd;
}

void TouchTextEditor::requestKeyboardForSelection()
{
    requestKeyboard();
    const QTextCursor cursor = m_item.textCursor();
    m_state.savedSelectionStart = cursor.selectionStart();
    m_state.savedSelectionEnd = cursor.selectionEnd();
    m_state.keyboardAsked = true;
}

void TouchTextEditor::requestKeyboard()
{
    Q_EMIT m_item.signalNotifySceneCurrentObjectInEditMode(&m_item);
}

bool TouchTextEditor::filter(QEvent* event)
{
    if (isRightMouseEvent(event))
        return true;
    if (event->type() == QEvent::GraphicsSceneMousePress) {
        m_state.lastDragPoint = static_cast<QGraphicsSceneMouseEvent*>(event)->scenePos();
        return false;
    }
    if (event->type() != QEvent::GraphicsSceneMouseMove)
        return false;
    auto* mouse = static_cast<QGraphicsSceneMouseEvent*>(event);
    if (m_item.getFocusFlag() == FocusObject)
        return filterDrag(*mouse);
    makeMouseMoveYPosInsideTextObject(mouse);
    return false;
}

void TouchTextEditor::makeMouseMoveYPosInsideTextObject(QGraphicsSceneMouseEvent* event) const
{
    const QRectF area = m_item.layoutRect();
    const double margin = m_item.document()->documentMargin();
    QPointF point = event->pos();
    if (point.y() > area.bottom())
        point.setY(area.height() - margin / 2.0);
    else if (point.y() < area.top())
        point.setY(margin * 2.0);
    else
        return;
    event->setPos(point);
    event->setScenePos(m_item.mapToScene(point));
}

bool TouchTextEditor::filterDrag(const QGraphicsSceneMouseEvent& event)
{
    const QPointF mapped = event.scenePos();
    const QPointF proposed = m_item.scenePos() + mapped - m_state.lastDragPoint;
    m_state.lastDragPoint = mapped;
    const int side = itemIsOutOfRange(proposed);
    if (side == 0)
        return false;
    // A drag against the limit is a drag all the same.
    m_state.movedWhileSelected = true;
    adjustItemPos(side);
    return true;
}

int TouchTextEditor::itemIsOutOfRange(QPointF position) const
{
    const QSizeF size = m_item.layoutRect().size();
    int side = 0;
    if (position.x() < SCENE_RECT.left() - (size.width() - LIMITEDNUM))
        side = 1;
    else if (position.x() > SCENE_RECT.width() - LIMITEDNUM)
        side = 2;
    if (position.y() < SCENE_RECT.top() - (size.height() - LIMITEDNUM))
        side = 3;
    else if (position.y() > SCENE_RECT.height() - LIMITEDNUM)
        side = 4;
    return side;
}

void TouchTextEditor::adjustItemPos(int side)
{
    QGraphicsItem* placed = m_item.placedItem();
    const QSizeF size = m_item.layoutRect().size();
    const QPointF before = placed->pos();
    switch (side) {
    case 1:
        placed->setX(SCENE_RECT.left() - (size.width() - LIMITEDNUM));
        m_state.lastDragPoint =
            m_item.scenePos() + QPointF(LeftReturnFactor * (size.width() - LIMITEDNUM), 0.0);
        break;
    case 2:
        placed->setX(SCENE_RECT.width() - LIMITEDNUM);
        m_state.lastDragPoint = m_item.scenePos();
        break;
    case 3:
        placed->setY(SCENE_RECT.top() - (size.height() - LIMITEDNUM));
        m_state.lastDragPoint =
            m_item.scenePos() + QPointF(0.0, TopReturnFactor * (size.height() - LIMITEDNUM));
        break;
    case 4:
        placed->setY(SCENE_RECT.height() - LIMITEDNUM);
        m_state.lastDragPoint = m_item.scenePos();
        break;
    default:
        return;
    }
    if (placed->pos() != before)
        markPositionChanged();
}

// Release

void TouchTextEditor::mouseRelease(QGraphicsSceneMouseEvent* event)
{
    m_state.pressed = false;
    m_state.selectionMoved = false;
    m_state.released = true;
    m_state.moved = false;
    m_state.handleMoving = false;
    setBoundingRectLineStatus();
    savePostionMoveUndoCommandWhenPositionChanged();
    moveUpEventPosWhenHasHandleCaret(event);
    passReleaseToDocument(event);
    getPressedPos(event->pos());
    m_item.showCurrentTextStyle();
    notifyTextPropertyAreaItemFocusState();
    m_longPressTimer.stop();
    showOrHideHandleCaretAccordingCurPos();
    showOrHideSoftWare();
    m_item.update();
}

// For a release on a widget Qt asks for the keyboard by itself, before caret and selection are where they
// belong.
void TouchTextEditor::passReleaseToDocument(QGraphicsSceneMouseEvent* event)
{
    QWidget* const widget = event->widget();
    event->setWidget(nullptr);
    m_item.QGraphicsTextItem::mouseReleaseEvent(event);
    event->setWidget(widget);
}

void TouchTextEditor::cancelTouch()
{
    m_longPressTimer.stop();
    // The text control and the item's dragging end as with a release; no touch of this class's does.
    QGraphicsSceneMouseEvent release(QEvent::GraphicsSceneMouseRelease);
    release.setButton(Qt::LeftButton);
    release.setPos(m_state.pressPoint);
    release.setScenePos(m_item.mapToScene(m_state.pressPoint));
    m_item.QGraphicsTextItem::mouseReleaseEvent(&release);
    if (m_item.getFocusFlag() == FocusObject && m_state.movedWhileSelected) {
        m_item.placedItem()->setPos(m_state.placeAtPress);
        m_state.positionChanged = false;
    }
    m_state.pressed = false;
    m_state.moved = false;
    m_state.released = true;
    m_state.selectionMoved = false;
    m_state.handleMoving = false;
    m_state.movedWhileSelected = false;
    m_state.doubleClicked = false;
    m_state.tapPlacesCursor = false;
    m_item.parentFollows();
    m_item.update();
}

void TouchTextEditor::enterEditMode()
{
    m_item.setFocusFlag(FocusEdit);
    m_item.setTextInteractionFlags(Qt::TextEditorInteraction);
    m_item.setFocus();
}

void TouchTextEditor::setBoundingRectLineStatus()
{
    if (m_item.textInteractionFlags() == Qt::TextEditorInteraction) {
        m_item.setFocusFlag(FocusEdit);
        m_item.setFocus();
        m_state.tapPlacesCursor = false;
    } else if (m_state.movedWhileSelected) {
        m_item.setFocusFlag(FocusObject);
        m_state.movedWhileSelected = false;
        m_state.handleCaret = false;
        m_state.tapPlacesCursor = false;
    } else if (m_item.getFocusFlag() == FocusNone) {
        m_item.setFocusFlag(FocusObject);
        m_item.styleEditor().showStyleOfWholeText();
        m_state.pressCursor = -2;
        m_state.handleCaret = false;
        m_state.tapPlacesCursor = false;
    } else {
        m_state.tapPlacesCursor = true;
        m_state.handleCaret = false;
        Q_EMIT m_item.signalGetSceneInputLanguage(&m_item);
        enterEditMode();
        m_item.showCurrentTextStyle();
    }
    m_item.parentFollows();
}

void TouchTextEditor::savePostionMoveUndoCommandWhenPositionChanged()
{
    if (!m_state.positionChanged)
        return;
    m_state.positionChanged = false;
    m_item.pushLastEditTextIntoStack();
    TText& record = m_item.styles().current();
    const QPointF old(record.getXValue(), record.getYValue());
    const QPointF now = m_item.scenePos();
    record.setXValue(float(now.x()));
    record.setYValue(float(now.y()));
    Q_EMIT m_item.signalObjectPositionChanged(record.getTextObjectID(), old, now);
    m_item.styleEditor().reportMovedObject();
}

void TouchTextEditor::getPressedPos(QPointF point)
{
    if (!m_state.tapPlacesCursor || m_item.styles().isEmpty())
        return;
    const QTextDocument& document = *m_item.document();
    CaretGeometry& carets = m_item.textPainter().carets();
    const auto reaches = [&](const QTextBlock& block) {
        return carets.heightAbove(block.blockNumber()) + block.layout()->boundingRect().height() >= point.y();
    };
    QTextBlock tapped = document.begin();
    while (!reaches(tapped) && tapped.next().isValid())
        tapped = tapped.next();
    // Below the text the caret goes to the last line, in the column of the first.
    const bool below = !reaches(tapped);
    const QTextBlock measured = below ? document.begin() : tapped;
    if (measured.layout()->lineCount() == 0)
        return;
    const double inside = point.y() - carets.heightAbove(measured.blockNumber());
    QTextLine line = measured.layout()->lineAt(0);
    for (int i = 1; !below && i < measured.layout()->lineCount() && line.y() + line.height() < inside; ++i)
        line = measured.layout()->lineAt(i);
    // What lies left of the line is taken off by the line itself.
    putCursor(tapped.position() + line.xToCursor(point.x() - document.documentMargin() - CaretShift));
}

bool TouchTextEditor::wholeTextSelected() const
{
    const QTextCursor cursor = m_item.textCursor();
    const int count = m_item.styles().count();
    return count > 0 && cursor.selectionStart() == 0 && cursor.selectionEnd() >= count;
}

void TouchTextEditor::notifyTextPropertyAreaItemFocusState()
{
    if (m_item.getFocusFlag() == FocusObject)
        Q_EMIT m_item.signalNotifyTextPropertyAreaObjectSelectionMode(true, true);
    else if (!wholeTextSelected())
        Q_EMIT m_item.signalNotifyTextPropertyAreaObjectSelectionMode(false, false);
    else if (m_item.getFocusFlag() == FocusEdit)
        Q_EMIT m_item.signalNotifyTextPropertyAreaObjectSelectionMode(true, false);
}

void TouchTextEditor::showOrHideHandleCaretAccordingCurPos()
{
    if (m_state.doubleClicked) {
        m_state.doubleClicked = false;
        m_state.handleCaret = false;
        return;
    }
    QTextCursor cursor = m_item.textCursor();
    if (cursor.hasSelection()) {
        m_state.handleCaret = true;
        setPreviousAndCurrentCursorPos();
        return;
    }
    if (!m_state.handleCaret)
        return;
    if (m_item.styles().isEmpty()) {
        m_state.handleCaret = false;
        return;
    }
    // While handles show, at least one character stays selected.
    const int position = cursor.position();
    if (position == clampedPosition(m_item.styles().count()) ||
        (position != 0 && position == m_state.savedSelectionStart))
        cursor.movePosition(QTextCursor::Left, QTextCursor::KeepAnchor);
    else if (position == 0 || position == m_state.savedSelectionEnd)
        cursor.movePosition(QTextCursor::Right, QTextCursor::KeepAnchor);
    m_item.setTextCursor(cursor);
    m_item.showCurrentTextStyle();
    setPreviousAndCurrentCursorPos();
}

void TouchTextEditor::setPreviousAndCurrentCursorPos()
{
    const QTextCursor cursor = m_item.textCursor();
    m_state.previous.position = cursor.anchor();
    m_state.current.position = cursor.position();
}

void TouchTextEditor::showOrHideSoftWare()
{
    const bool knowsSelection = m_state.keyboardAsked && selectionIsSaved();
    if (m_item.getFocusFlag() == FocusEdit && !knowsSelection)
        requestKeyboard();
    else if (m_item.getFocusFlag() == FocusObject)
        Q_EMIT m_item.signalNotifySceneCurrentObjectInEditMode(nullptr);
}

// Double tap and long press

void TouchTextEditor::mouseDoubleClick(QGraphicsSceneMouseEvent* event)
{
    m_state.handleCaret = false;
    m_state.previous.position = -1;
    m_state.current.position = -1;
    m_state.handleMoving = false;
    m_state.keyboardAsked = false;
    m_state.doubleClicked = true;
    m_item.setTextInteractionFlags(Qt::TextEditorInteraction);
    m_item.QGraphicsTextItem::mouseDoubleClickEvent(event);
    m_item.styleEditor().selectWholeText();
    m_state.doubleClickedSelection = true;
    m_item.setTextInteractionFlags(Qt::TextEditorInteraction);
    Q_EMIT m_item.signalNotifySceneCurrentMousePressedObjectId(m_item.getItemTText()->getTextObjectID());
    m_item.update();
}

void TouchTextEditor::setNearestCurPos()
{
    TouchState::End caret;
    QTextCursor cursor = m_item.textCursor();
    if (!m_item.textPainter().carets().caretPoint(caret.line, caret.point, caret.block, cursor.position()))
        return;
    if (m_state.pressPoint.x() < caret.line.x1() && cursor.position() > 0) {
        cursor.movePosition(QTextCursor::Left);
        m_item.setTextCursor(cursor);
    }
}

int TouchTextEditor::getSelectionModel(const QTextCursor& word, int position)
{
    if (position > word.selectionStart() && position < word.selectionEnd())
        return 2;
    return word.position() <= position ? 1 : 0;
}

void TouchTextEditor::longPressed()
{
    // Editing may have ended under the finger.
    if (m_item.getFocusFlag() != FocusEdit || !m_item.isEnabled())
        return;
    m_state.longPressed = true;
    setNearestCurPos();
    QTextCursor cursor = m_item.textCursor();
    const int position = cursor.position();
    cursor.select(QTextCursor::WordUnderCursor);
    if (!cursor.hasSelection()) {
        putCursor(position);
        return;
    }
    const int begin = cursor.selectionStart();
    const int end = cursor.selectionEnd();
    switch (getSelectionModel(cursor, position)) {
    case 1:
        cursor.setPosition(end);
        cursor.movePosition(QTextCursor::Left, QTextCursor::KeepAnchor);
        break;
    case 2:
        cursor.setPosition(position);
        cursor.movePosition(QTextCursor::Right, QTextCursor::KeepAnchor);
        break;
    default:
        cursor.setPosition(begin);
        cursor.movePosition(QTextCursor::Right, QTextCursor::KeepAnchor);
        break;
    }
    m_item.setTextCursor(cursor);
    setPreviousAndCurrentCursorPos();
    m_state.handleCaret = true;
    requestKeyboardForSelection();
    m_item.update();
}

// Keyboards

void TouchTextEditor::keyPress(QKeyEvent* event)
{
    m_state.doubleClickedSelection = false;
    m_item.QGraphicsTextItem::keyPressEvent(event);
    switch (event->key()) {
    case Qt::Key_Left:
    case Qt::Key_Up:
    case Qt::Key_Right:
    case Qt::Key_Down:
        m_item.showCurrentTextStyle();
        requestKeyboard();
        break;
    default:
        break;
    }
    m_item.update();
}

void TouchTextEditor::keyboardClosed()
{
    LOG_DEBUG_OPERATE(L"Edit Area", 200, L"*****SoftKeyBoardClosed event is received*****");
    // No later step may come between what was typed and the end of it.
    m_item.pushLastEditTextIntoStack();
    StyleDocument& styles = m_item.styles();
    if (!(styles.undoBaseline() == styles.current())) {
        TText before = styles.undoBaseline();
        TText last = styles.lastAlpha();
        Q_EMIT m_item.signalObjectContentsEdited(&before, &styles.current(), &last, &styles.lastAlpha());
        styles.refreshUndoBaseline();
    }
    Q_EMIT m_item.signalSoftWareClosedWhenEditObject();
    Q_EMIT m_item.signalSaveArchive(&m_item);
    if (m_item.isBlank()) {
        Q_EMIT m_item.signalNotifyIfExistSelectedObject(false);
        Q_EMIT m_item.signalDeleteItem();
    } else {
        changeItemToSolidLineState();
    }
}

void TouchTextEditor::setCursorPosition(int position)
{
    m_state.doubleClickedSelection = false;
    if (m_state.selectionMoved)
        return;
    m_item.setTextInteractionFlags(Qt::TextEditorInteraction);
    putCursor(position);
}

void TouchTextEditor::selectionFromBeginToEnd(int begin, int end)
{
    m_state.doubleClickedSelection = false;
    if (m_state.selectionMoved)
        return;
    m_item.setTextInteractionFlags(Qt::TextEditorInteraction);
    end = clampedPosition(end);
    QTextCursor cursor = m_item.textCursor();
    cursor.setPosition(clampedPosition(begin));
    const bool forward = end > cursor.position();
    const auto step = forward ? QTextCursor::Right : QTextCursor::Left;
    while (forward ? cursor.position() < end : cursor.position() > end) {
        if (!cursor.movePosition(step, QTextCursor::KeepAnchor))
            break;
    }
    m_item.setTextCursor(cursor);
}

void TouchTextEditor::getSelectionInfo(int begin, int end, int current, int mode)
{
    bool shadowAndAlign = false;
    switch (mode) {
    case 2:
        m_item.styleEditor().selectWholeText();
        m_state.handleCaret = false;
        shadowAndAlign = true;
        break;
    case 1:
        m_state.handleCaret = true;
        m_state.released = true;
        selectionFromBeginToEnd(begin, end);
        shadowAndAlign = wholeTextSelected() && m_item.getFocusFlag() == FocusEdit;
        break;
    case 0:
        m_state.handleCaret = false;
        setCursorPosition(current);
        break;
    default:
        break;
    }
    if (mode >= 0 && mode <= 2)
        Q_EMIT m_item.signalNotifyTextPropertyAreaObjectSelectionMode(shadowAndAlign, false);
    m_item.showCurrentTextStyle();
    setPreviousAndCurrentCursorPos();
    m_item.update();
}

void TouchTextEditor::changeItemToSolidLineState()
{
    m_longPressTimer.stop();
    m_item.setFocusFlag(FocusObject);
    m_state.handleCaret = false;
    m_item.styleEditor().showStyleOfWholeText();
    m_item.clearFocus();
    m_item.setTextInteractionFlags(Qt::NoTextInteraction);
    m_state.pressCursor = -2;
    m_item.parentFollows();
    m_item.update();
    Q_EMIT m_item.signalNotifyIfExistSelectedObject(true);
    Q_EMIT m_item.signalNotifyTextPropertyAreaObjectSelectionMode(true, true);
}

void TouchTextEditor::initNewTextSelectAll()
{
    Q_EMIT m_item.signalGetSceneInputLanguage(&m_item);
    enterEditMode();
    requestKeyboard();
    m_item.showCurrentTextStyle();
    m_item.parentFollows();
    m_item.update();
}
