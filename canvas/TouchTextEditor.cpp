#include "canvas/TouchTextEditor.h"

#include "canvas/CaretGeometry.h"
#include "canvas/ITextObjectListener.h"
#include "canvas/ITextSurface.h"
#include "canvas/StyleDocument.h"
#include "canvas/TextObjectConstants.h"
#include "canvas/TextPlacement.h"
#include "canvas/TextStyleEditor.h"

#include <QGraphicsSceneMouseEvent>
#include <QKeyEvent>
#include <QTextBlock>
#include <QTextCursor>
#include <QTextDocument>
#include <QTextLayout>
#include <algorithm>
#include <utility>

using namespace TextObjectConstants;
using Gesture = TouchState::Gesture;

namespace
{

// Pixels around the picture of a handle that still count as the handle.
constexpr double HANDLE_TOLERANCE = 8.0;
constexpr double CARET_SHIFT = 1.0;

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

TouchTextEditor::TouchTextEditor(const TextObjectParts& parts, TextStyleEditor& styleEditor)
    : m_document(parts.document)
    , m_styles(parts.styles)
    , m_carets(parts.carets)
    , m_placement(parts.placement)
    , m_surface(parts.surface)
    , m_listener(parts.listener)
    , m_styleEditor(styleEditor)
    , m_caretPainter(parts, m_state)
{
    m_longPressTimer.setSingleShot(true);
    m_longPressTimer.setInterval(LONG_PRESS_TIME);
}

// Press

void TouchTextEditor::mousePress(QGraphicsSceneMouseEvent* event)
{
    m_state.doubleClickedSelection = false;
    m_state.keyboardAsked = false;
    m_state.pressPoint = event->pos();
    m_state.placeAtPress = m_placement.place();
    if (!m_surface.selection().hasSelection() && m_surface.getFocusFlag() == FocusEdit)
        m_longPressTimer.start();
    const HandleHit hit = changePaintStateWhenHandleIsPressed(event->pos());
    switch (hit) {
    case PreviousHandle:
    case CurrentHandle:
        m_state.gesture = Gesture::HandlePress;
        break;
    case NoHandle:
        m_state.gesture = Gesture::Press;
        break;
    }
    adjustMousePressedPos(event, hit);
    m_surface.handleByTextItem(QEvent::GraphicsSceneMousePress, *event);
    m_styleEditor.clearSelection();
    m_listener.objectPressed();
    m_placement.setMovable(m_surface.getFocusFlag() == FocusObject);
    m_surface.repaint();
}

bool TouchTextEditor::handleIsHit(const TouchState::End& end, QPointF point)
{
    const QRectF picture(end.point, QSizeF(HANDLEPIXMAPWIDTH, HANDLEPIXMAPHEIGHT));
    return picture.adjusted(-HANDLE_TOLERANCE, -HANDLE_TOLERANCE, HANDLE_TOLERANCE, HANDLE_TOLERANCE)
        .contains(point);
}

TouchTextEditor::HandleHit TouchTextEditor::changePaintStateWhenHandleIsPressed(QPointF point)
{
    m_caretPainter.refreshHandles();
    const bool selecting = m_surface.selection().hasSelection();
    m_state.handleCaret = false;
    if (!selecting || m_state.previous.position < 0 || m_state.current.position < 0)
        return NoHandle;
    if (handleIsHit(m_state.previous, point)) {
        const int wanted = m_state.current.position;
        putCursor(wanted);
        // The pressed handle has to be the current one.
        if (m_surface.selection().position() == wanted)
            exchangeValueofCurrentAndPreviousCursor();
        return PreviousHandle;
    }
    if (handleIsHit(m_state.current, point)) {
        putCursor(m_state.previous.position);
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
    // The caret is placed above the finger, where it can be seen.
    if (m_state.handleCaret || m_state.isHandleHeld())
        event->setPos(event->pos() - QPointF(0.0, HANDLEPIXMAPHEIGHT));
}

void TouchTextEditor::adjustMousePressedPos(QGraphicsSceneMouseEvent* event, HandleHit hit)
{
    moveUpEventPosWhenHasHandleCaret(event);
    if (hit == NoHandle)
        return;
    const QTextBlock block = m_document.findBlock(m_state.current.position);
    if (m_state.current.position == block.position())
        event->setPos(event->pos() + QPointF(HANDLEPIXMAPWIDTH, 0.0));
    else if (m_state.current.position == block.position() + block.length() - 1)
        event->setPos(event->pos() - QPointF(HANDLEPIXMAPWIDTH, 0.0));
}

void TouchTextEditor::putCursor(int position)
{
    QTextCursor cursor = m_surface.selection();
    cursor.setPosition(clampedPosition(position));
    m_surface.select(cursor);
}

int TouchTextEditor::clampedPosition(int position) const
{
    position = std::clamp(position, 0, m_document.characterCount() - 1);
    // A caret inside a surrogate pair would split the character. Services count characters in different ways.
    const bool insidePair = position > 0 && m_document.characterAt(position).isLowSurrogate() &&
                            m_document.characterAt(position - 1).isHighSurrogate();
    return insidePair ? position - 1 : position;
}

// Move

void TouchTextEditor::mouseMove(QGraphicsSceneMouseEvent* event)
{
    m_surface.repaint();
    const bool isSelected = m_surface.getFocusFlag() == FocusObject;
    if (isSelected && m_state.gesture != Gesture::DoubleTap)
        m_state.gesture = Gesture::MoveObject;
    switch (m_state.gesture) {
    case Gesture::DoubleTap:
        break;
    case Gesture::MoveObject:
        if (isSelected) // otherwise the selection ended while the finger was down
            dragObject(event);
        break;
    default:
        if (!m_caretPainter.noHandleCursor())
            dragSelection(event);
        break;
    }
}

void TouchTextEditor::dragObject(QGraphicsSceneMouseEvent* event)
{
    moveUpEventPosWhenHasHandleCaret(event);
    m_surface.handleByTextItem(QEvent::GraphicsSceneMouseMove, *event);
    m_placement.followFinger(event->scenePos() - event->lastScenePos());
}

void TouchTextEditor::dragSelection(QGraphicsSceneMouseEvent* event)
{
    moveUpEventPosWhenHasHandleCaret(event);
    m_surface.handleByTextItem(QEvent::GraphicsSceneMouseMove, *event);
    if (!m_surface.selection().hasSelection())
        return;
    if (m_state.isSelecting()) {
        synchronizeKeyBoardCursorPos();
        return;
    }
    // The new selection starts at the fixed end.
    m_state.gesture = m_state.isHandleHeld() ? Gesture::HandleDrag : Gesture::Select;
    putCursor(m_state.previous.position);
}

void TouchTextEditor::synchronizeKeyBoardCursorPos()
{
    m_state.gesture = Gesture::Select;
    m_state.handleCaret = true;
    if (!selectionIsSaved())
        requestKeyboardForSelection();
    m_longPressTimer.stop();
}

bool TouchTextEditor::selectionIsSaved() const
{
    const QTextCursor cursor = m_surface.selection();
    return cursor.selectionStart() == m_state.savedSelectionStart &&
           cursor.selectionEnd() == m_state.savedSelectionEnd;
}

void TouchTextEditor::requestKeyboardForSelection()
{
    requestKeyboard();
    const QTextCursor cursor = m_surface.selection();
    m_state.savedSelectionStart = cursor.selectionStart();
    m_state.savedSelectionEnd = cursor.selectionEnd();
    m_state.keyboardAsked = true;
}

void TouchTextEditor::requestKeyboard()
{
    m_listener.keyboardWanted(true);
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
    if (m_surface.getFocusFlag() == FocusObject)
        return filterDrag(*mouse);
    makeMouseMoveYPosInsideTextObject(mouse);
    return false;
}

void TouchTextEditor::makeMouseMoveYPosInsideTextObject(QGraphicsSceneMouseEvent* event) const
{
    const QRectF area = m_placement.area();
    const double margin = m_document.documentMargin();
    QPointF point = event->pos();
    if (point.y() > area.bottom())
        point.setY(area.height() - margin / 2.0);
    else if (point.y() < area.top())
        point.setY(margin * 2.0);
    else
        return;
    event->setPos(point);
    event->setScenePos(m_placement.mapToScene(point));
}

bool TouchTextEditor::filterDrag(const QGraphicsSceneMouseEvent& event)
{
    const QPointF mapped = event.scenePos();
    const QPointF proposed = m_placement.textPlace() + mapped - m_state.lastDragPoint;
    m_state.lastDragPoint = mapped;
    const TextPlacement::Side side = m_placement.itemIsOutOfRange(proposed);
    if (side == TextPlacement::Inside)
        return false;
    // A drag that is stopped by the limit still counts as a drag.
    if (m_state.gesture != Gesture::DoubleTap)
        m_state.gesture = Gesture::MoveObject;
    m_state.lastDragPoint = m_placement.adjustItemPos(side);
    return true;
}

// Release

void TouchTextEditor::mouseRelease(QGraphicsSceneMouseEvent* event)
{
    const Gesture ended = std::exchange(m_state.gesture, Gesture::None);
    const bool tapPlacesCursor = setBoundingRectLineStatus(ended);
    savePostionMoveUndoCommandWhenPositionChanged();
    moveUpEventPosWhenHasHandleCaret(event);
    passReleaseToDocument(event);
    if (tapPlacesCursor)
        getPressedPos(event->pos());
    m_styleEditor.showCurrentTextStyle();
    notifyTextPropertyAreaItemFocusState();
    m_longPressTimer.stop();
    if (ended == Gesture::DoubleTap)
        m_state.handleCaret = false;
    else
        showOrHideHandleCaretAccordingCurPos();
    showOrHideSoftWare();
    m_surface.repaint();
}

// Hides the widget from Qt, which would otherwise request the keyboard on the release, before caret and
// selection are updated.
void TouchTextEditor::passReleaseToDocument(QGraphicsSceneMouseEvent* event)
{
    QWidget* const widget = event->widget();
    event->setWidget(nullptr);
    m_surface.handleByTextItem(QEvent::GraphicsSceneMouseRelease, *event);
    event->setWidget(widget);
}

void TouchTextEditor::cancelTouch()
{
    m_longPressTimer.stop();
    // Sends a release, which ends the gesture of Qt's text control and the dragging of the item, without the
    // effects that a release has in this class.
    QGraphicsSceneMouseEvent release(QEvent::GraphicsSceneMouseRelease);
    release.setButton(Qt::LeftButton);
    release.setPos(m_state.pressPoint);
    release.setScenePos(m_placement.mapToScene(m_state.pressPoint));
    m_surface.handleByTextItem(QEvent::GraphicsSceneMouseRelease, release);
    const Gesture ended = std::exchange(m_state.gesture, Gesture::None);
    if (m_surface.getFocusFlag() == FocusObject && ended == Gesture::MoveObject) {
        m_placement.setPlace(m_state.placeAtPress);
        m_placement.clearMoved();
    }
    m_surface.parentFollows();
    m_surface.repaint();
}

void TouchTextEditor::enterEditMode()
{
    m_surface.setFocusFlag(FocusEdit);
    m_surface.setWritable(true);
    m_surface.takeFocus();
}

bool TouchTextEditor::setBoundingRectLineStatus(Gesture ended)
{
    bool tapPlacesCursor = false;
    if (m_surface.isWritable()) {
        m_surface.setFocusFlag(FocusEdit);
        m_surface.takeFocus();
    } else {
        m_state.handleCaret = false;
        if (ended == Gesture::MoveObject) {
            m_surface.setFocusFlag(FocusObject);
        } else if (m_surface.getFocusFlag() == FocusNone) {
            m_surface.setFocusFlag(FocusObject);
            m_styleEditor.showStyleOfWholeText();
        } else {
            tapPlacesCursor = true;
            m_listener.editingBegins();
            enterEditMode();
            m_styleEditor.showCurrentTextStyle();
        }
    }
    m_surface.parentFollows();
    return tapPlacesCursor;
}

void TouchTextEditor::savePostionMoveUndoCommandWhenPositionChanged()
{
    if (!m_placement.isMoved())
        return;
    m_placement.clearMoved();
    m_styleEditor.pushLastEditTextIntoStack();
    TText& record = m_styles.current();
    const QPointF old(record.getXValue(), record.getYValue());
    const QPointF now = m_placement.textPlace();
    record.setXValue(float(now.x()));
    record.setYValue(float(now.y()));
    m_listener.objectMoved(old, now);
    m_styleEditor.reportMovedObject();
}

void TouchTextEditor::getPressedPos(QPointF point)
{
    if (m_styles.isEmpty())
        return;
    const auto reaches = [&](const QTextBlock& block) {
        return m_carets.heightAbove(block.blockNumber()) + block.layout()->boundingRect().height() >=
               point.y();
    };
    QTextBlock tapped = m_document.begin();
    while (!reaches(tapped) && tapped.next().isValid())
        tapped = tapped.next();
    // A tap below the text places the caret in the last line, in the column of the first.
    const bool below = !reaches(tapped);
    const QTextBlock measured = below ? m_document.begin() : tapped;
    if (measured.layout()->lineCount() == 0)
        return;
    const double inside = point.y() - m_carets.heightAbove(measured.blockNumber());
    QTextLine line = measured.layout()->lineAt(0);
    for (int i = 1; !below && i < measured.layout()->lineCount() && line.y() + line.height() < inside; ++i)
        line = measured.layout()->lineAt(i);
    // xToCursor() subtracts the left offset of the line itself.
    putCursor(tapped.position() + line.xToCursor(point.x() - m_document.documentMargin() - CARET_SHIFT));
}

bool TouchTextEditor::wholeTextSelected() const
{
    const QTextCursor cursor = m_surface.selection();
    const int count = m_styles.count();
    return count > 0 && cursor.selectionStart() == 0 && cursor.selectionEnd() >= count;
}

void TouchTextEditor::notifyTextPropertyAreaItemFocusState()
{
    if (m_surface.getFocusFlag() == FocusObject)
        m_listener.selectionModeChanged(true, true);
    else if (!wholeTextSelected())
        m_listener.selectionModeChanged(false, false);
    else if (m_surface.getFocusFlag() == FocusEdit)
        m_listener.selectionModeChanged(true, false);
}

void TouchTextEditor::showOrHideHandleCaretAccordingCurPos()
{
    if (m_surface.selection().hasSelection()) {
        m_state.handleCaret = true;
        setPreviousAndCurrentCursorPos();
        return;
    }
    if (!m_state.handleCaret)
        return;
    if (m_styles.isEmpty()) {
        m_state.handleCaret = false;
        return;
    }
    keepOneCharacterSelected();
}

// Keeps at least one character selected while handles are shown.
void TouchTextEditor::keepOneCharacterSelected()
{
    QTextCursor cursor = m_surface.selection();
    const int position = cursor.position();
    if (position == clampedPosition(m_styles.count()) ||
        (position != 0 && position == m_state.savedSelectionStart))
        cursor.movePosition(QTextCursor::Left, QTextCursor::KeepAnchor);
    else if (position == 0 || position == m_state.savedSelectionEnd)
        cursor.movePosition(QTextCursor::Right, QTextCursor::KeepAnchor);
    m_surface.select(cursor);
    m_styleEditor.showCurrentTextStyle();
    setPreviousAndCurrentCursorPos();
}

void TouchTextEditor::setPreviousAndCurrentCursorPos()
{
    const QTextCursor cursor = m_surface.selection();
    m_state.previous.position = cursor.anchor();
    m_state.current.position = cursor.position();
}

void TouchTextEditor::showOrHideSoftWare()
{
    const bool knowsSelection = m_state.keyboardAsked && selectionIsSaved();
    if (m_surface.getFocusFlag() == FocusEdit && !knowsSelection)
        requestKeyboard();
    else if (m_surface.getFocusFlag() == FocusObject)
        m_listener.keyboardWanted(false);
}

// Double tap and long press

void TouchTextEditor::mouseDoubleClick(QGraphicsSceneMouseEvent* event)
{
    m_state.handleCaret = false;
    m_state.previous.position = -1;
    m_state.current.position = -1;
    m_state.keyboardAsked = false;
    m_surface.setWritable(true);
    m_surface.handleByTextItem(QEvent::GraphicsSceneMouseDoubleClick, *event);
    // Set after Qt has handled the event, which may have called the press.
    m_state.gesture = Gesture::DoubleTap;
    m_styleEditor.selectWholeText();
    m_state.doubleClickedSelection = true;
    m_surface.setWritable(true);
    m_listener.objectPressed();
    m_surface.repaint();
}

void TouchTextEditor::setNearestCurPos()
{
    TouchState::End caret;
    QTextCursor cursor = m_surface.selection();
    if (!m_carets.caretPoint(caret.line, caret.point, caret.block, cursor.position()))
        return;
    if (m_state.pressPoint.x() < caret.line.x1() && cursor.position() > 0) {
        cursor.movePosition(QTextCursor::Left);
        m_surface.select(cursor);
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
    // Editing may have ended while the finger was down.
    if (m_surface.getFocusFlag() != FocusEdit)
        return;
    m_state.gesture = Gesture::LongPress;
    setNearestCurPos();
    QTextCursor cursor = m_surface.selection();
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
    m_surface.select(cursor);
    setPreviousAndCurrentCursorPos();
    m_state.handleCaret = true;
    requestKeyboardForSelection();
    m_surface.repaint();
}

// Keyboards

void TouchTextEditor::keyPress(QKeyEvent* event)
{
    m_state.doubleClickedSelection = false;
    const QTextCursor before = m_surface.selection();
    m_surface.handleByTextItem(QEvent::KeyPress, *event);
    switch (event->key()) {
    case Qt::Key_Left:
    case Qt::Key_Up:
    case Qt::Key_Right:
    case Qt::Key_Down:
        m_styleEditor.showCurrentTextStyle();
        requestKeyboard();
        break;
    default:
        break;
    }
    repaintBetween(before, m_surface.selection());
}

// Repaints what a key changed in the paragraphs of the old and the new caret.
void TouchTextEditor::repaintBetween(const QTextCursor& before, const QTextCursor& after)
{
    if (before.hasSelection() || after.hasSelection() || m_state.handleCaret) {
        m_surface.repaint();
        return;
    }
    m_surface.repaintBlock(before.position());
    m_surface.repaintBlock(after.position());
}

void TouchTextEditor::setCursorPosition(int position)
{
    m_state.doubleClickedSelection = false;
    if (m_state.isSelecting())
        return;
    m_surface.setWritable(true);
    putCursor(position);
}

void TouchTextEditor::selectionFromBeginToEnd(int begin, int end)
{
    m_state.doubleClickedSelection = false;
    if (m_state.isSelecting())
        return;
    m_surface.setWritable(true);
    end = clampedPosition(end);
    QTextCursor cursor = m_surface.selection();
    cursor.setPosition(clampedPosition(begin));
    const bool forward = end > cursor.position();
    const auto step = forward ? QTextCursor::Right : QTextCursor::Left;
    while (forward ? cursor.position() < end : cursor.position() > end)
        if (!cursor.movePosition(step, QTextCursor::KeepAnchor))
            break;
    m_surface.select(cursor);
}

void TouchTextEditor::getSelectionInfo(int begin, int end, int current, int mode)
{
    bool shadowAndAlign = false;
    switch (mode) {
    case 2:
        m_styleEditor.selectWholeText();
        m_state.handleCaret = false;
        shadowAndAlign = true;
        break;
    case 1:
        m_state.handleCaret = true;
        if (m_state.gesture == Gesture::Press || m_state.gesture == Gesture::LongPress)
            m_state.gesture = Gesture::None; // the finger is not on an end of this selection
        selectionFromBeginToEnd(begin, end);
        shadowAndAlign = wholeTextSelected() && m_surface.getFocusFlag() == FocusEdit;
        break;
    case 0:
        m_state.handleCaret = false;
        setCursorPosition(current);
        break;
    default:
        break;
    }
    if (mode >= 0 && mode <= 2)
        m_listener.selectionModeChanged(shadowAndAlign, false);
    m_styleEditor.showCurrentTextStyle();
    setPreviousAndCurrentCursorPos();
    m_surface.repaint();
}

void TouchTextEditor::changeItemToSolidLineState()
{
    m_longPressTimer.stop();
    m_surface.setFocusFlag(FocusObject);
    m_state.handleCaret = false;
    m_styleEditor.showStyleOfWholeText();
    m_surface.giveUpFocus();
    m_surface.setWritable(false);
    m_surface.parentFollows();
    m_surface.repaint();
    m_listener.objectSelected();
    m_listener.selectionModeChanged(true, true);
}

void TouchTextEditor::initNewTextSelectAll()
{
    m_listener.editingBegins();
    enterEditMode();
    requestKeyboard();
    m_styleEditor.showCurrentTextStyle();
    m_surface.parentFollows();
    m_surface.repaint();
}
