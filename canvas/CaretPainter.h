#pragma once

#include "canvas/TextObjectParts.h"
#include "canvas/TouchState.h"

class QPainter;
class QPixmap;

// Paints the caret and the selection handles of a text object that is being edited. GUI thread only.
class CaretPainter
{
public:
    // Keeps a reference to the state, which must outlive this object.
    CaretPainter(const TextObjectParts& parts, TouchState& state);

    // Paints the selection below the glyphs while a handle is dragged.
    void paintSelectionWhenContinueSelect(QPainter* painter) const;
    // Paints the caret or the handles above the glyphs.
    void paintCaretAndHandles(QPainter* painter);

    // Moves both handles to the ends of the cursor's selection.
    void refreshHandles();
    // Returns whether no handle is shown, so that the selection cannot be dragged.
    bool noHandleCursor() const;

private:
    void adjustCurPosToPaintSelectionWhenContinueSelect();
    void paintCursor(QPainter* painter) const;
    void paintMovingHandles(QPainter* painter) const;
    void showCursorForSelecting(QPainter* painter);
    void drawCurPosPixmap(QPainter* painter) const;
    static void drawHandle(QPainter* painter, const TouchState::End& end, const QPixmap& picture);
    void paintShadowBlockFromPreviousCaretToCurrentCaret(QPainter* painter) const;

    TextObjectParts m_parts;
    TouchState& m_state;
};
