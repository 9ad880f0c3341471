#pragma once

#include "canvas/CaretPainter.h"
#include "canvas/TextObjectParts.h"
#include "canvas/TouchState.h"

#include <QTimer>

class QEvent;
class QGraphicsSceneMouseEvent;
class QKeyEvent;
class QPainter;
class QTextCursor;
class TextStyleEditor;

// Handles the finger and the soft keyboard for a text object: the first tap selects the object, a second one
// starts editing, a drag moves it within limits, handles and long press select characters. The state of the
// finger is one TouchState::Gesture, which press, move and release change in turn. GUI thread only.
class TouchTextEditor
{
public:
    // The style editor belongs to the same object.
    TouchTextEditor(const TextObjectParts& parts, TextStyleEditor& styleEditor);

    bool isHandleCaret() const { return m_state.handleCaret; }
    bool isDoubleClickedSelection() const { return m_state.doubleClickedSelection; }
    void clearHandleCaret() { m_state.handleCaret = false; }

    void mousePress(QGraphicsSceneMouseEvent* event);
    void mouseMove(QGraphicsSceneMouseEvent* event);
    void mouseRelease(QGraphicsSceneMouseEvent* event);
    void mouseDoubleClick(QGraphicsSceneMouseEvent* event);
    // Ends the current press without a release.
    void cancelTouch();
    void keyPress(QKeyEvent* event);
    // Returns the timer of the long press. Connect its timeout to longPressed().
    const QTimer& longPressTimer() const { return m_longPressTimer; }
    void longPressed();
    // Returns whether the event is handled and has to be swallowed.
    bool filter(QEvent* event);

    void getSelectionInfo(int begin, int end, int current, int mode);
    void initNewTextSelectAll();
    void changeItemToSolidLineState();

    void paintBelowGlyphs(QPainter* painter) { m_caretPainter.paintSelectionWhenContinueSelect(painter); }
    void paintAboveGlyphs(QPainter* painter) { m_caretPainter.paintCaretAndHandles(painter); }

private:
    // The handle that a press hit.
    enum HandleHit { NoHandle = -1, CurrentHandle = 0, PreviousHandle = 1 };

    HandleHit changePaintStateWhenHandleIsPressed(QPointF point);
    static bool handleIsHit(const TouchState::End& end, QPointF point);
    void exchangeValueofCurrentAndPreviousCursor();
    void adjustMousePressedPos(QGraphicsSceneMouseEvent* event, HandleHit hit);
    void moveUpEventPosWhenHasHandleCaret(QGraphicsSceneMouseEvent* event) const;
    void dragObject(QGraphicsSceneMouseEvent* event);
    void dragSelection(QGraphicsSceneMouseEvent* event);
    void synchronizeKeyBoardCursorPos();
    void makeMouseMoveYPosInsideTextObject(QGraphicsSceneMouseEvent* event) const;
    void repaintBetween(const QTextCursor& before, const QTextCursor& after);
    bool filterDrag(const QGraphicsSceneMouseEvent& event);
    // Returns whether editing of the object starts with this tap, so that it places the cursor.
    bool setBoundingRectLineStatus(TouchState::Gesture ended);
    void enterEditMode();
    void savePostionMoveUndoCommandWhenPositionChanged();
    void getPressedPos(QPointF point);
    void notifyTextPropertyAreaItemFocusState();
    bool wholeTextSelected() const;
    void showOrHideHandleCaretAccordingCurPos();
    void keepOneCharacterSelected();
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

    QTextDocument& m_document;
    StyleDocument& m_styles;
    CaretGeometry& m_carets;
    TextPlacement& m_placement;
    ITextSurface& m_surface;
    ITextObjectListener& m_listener;
    TextStyleEditor& m_styleEditor;
    TouchState m_state;
    CaretPainter m_caretPainter;
    QTimer m_longPressTimer;
};
