#pragma once

#include "canvas/CaretPainter.h"
#include "canvas/TextObjectConstants.h"
#include "canvas/TouchState.h"

#include <QTimer>

class GraphicsText;
class QEvent;
class QGraphicsSceneMouseEvent;
class QKeyEvent;
class QPainter;
class QTextCursor;

// What a finger and the soft keyboard do to a text object: the first tap selects it, a second edits it, a
// drag moves it within limits, handles and long press select characters. GUI thread only.
class TouchTextEditor : public TextObjectConstants
{
public:
    explicit TouchTextEditor(GraphicsText& item);

    bool isHandleCaret() const { return m_state.handleCaret; }
    bool isDoubleClickedSelection() const { return m_state.doubleClickedSelection; }
    void clearHandleCaret() { m_state.handleCaret = false; }
    void markPositionChanged() { m_state.positionChanged = true; }
    void clearPositionChanged() { m_state.positionChanged = false; }

    void mousePress(QGraphicsSceneMouseEvent* event);
    void mouseMove(QGraphicsSceneMouseEvent* event);
    void mouseRelease(QGraphicsSceneMouseEvent* event);
    void mouseDoubleClick(QGraphicsSceneMouseEvent* event);
    // The press ends without a release.
    void cancelTouch();
    void keyPress(QKeyEvent* event);
    void longPressed();
    // True swallows the event.
    bool filter(QEvent* event);

    // The keyboard was closed by the operator.
    void keyboardClosed();
    void getSelectionInfo(int begin, int end, int current, int mode);
    void initNewTextSelectAll();
    void changeItemToSolidLineState();

    // Side over which an object placed at the point (scene coordinates) would leave the canvas: 1 left, 2
    // right, 3 top, 4 bottom, 0 none.
    int itemIsOutOfRange(QPointF position) const;
    // Places the object at the limit of that side.
    void adjustItemPos(int side);

    void paintBelowGlyphs(QPainter* painter) { m_caretPainter.paintSelectionWhenContinueSelect(painter); }
    void paintAboveGlyphs(QPainter* painter) { m_caretPainter.paintCaretAndHandles(painter); }

private:
    // Which handle a press hit.
    enum HandleHit { NoHandle = -1, CurrentHandle = 0, PreviousHandle = 1 };

    HandleHit changePaintStateWhenHandleIsPressed(QPointF point);
    static bool handleIsHit(const TouchState::End& end, QPointF point);
    void exchangeValueofCurrentAndPreviousCursor();
    void adjustMousePressedPos(QGraphicsSceneMouseEvent* event, HandleHit hit);
    void moveUpEventPosWhenHasHandleCaret(QGraphicsSceneMouseEvent* event) const;
    void resetItemPos();
    void synchronizeKeyBoardCursorPos();
    void makeMouseMoveYPosInsideTextObject(QGraphicsSceneMouseEvent* event) const;
    bool filterDrag(const QGraphicsSceneMouseEvent& event);
    void setBoundingRectLineStatus();
    void enterEditMode();
    void savePostionMoveUndoCommandWhenPositionChanged();
    void getPressedPos(QPointF point);
    void notifyTextPropertyAreaItemFocusState();
    bool wholeTextSelected() const;
    void showOrHideHandleCaretAccordingCurPos();
    void setPreviousAndCurrentCursorPos();
    void showOrHideSoftWare();
    void setNearestCurPos();
    static int getSelectionModel(const QTextCursor& word, int position);
    bool selectionIsSaved() const;
    void requestKeyboardForSelection();
    void passReleaseToDocument(QGraphicsSceneMouseEvent* event);
    void setCursorPosition(int position);
    void selectionFromBeginToEnd(int begin, int end);
    int clampedPosition(int position) const;
    void putCursor(int position);
    void requestKeyboard();

    GraphicsText& m_item;
    TouchState m_state;
    CaretPainter m_caretPainter;
    QTimer m_longPressTimer;
};
