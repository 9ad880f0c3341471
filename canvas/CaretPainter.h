#pragma once

#include "canvas/TextObjectParts.h"
#include "canvas/TouchState.h"

class QPainter;
class QPixmap;

// Paints caret and selection handles of a text object that is edited. GUI thread only.
class CaretPainter
{
public:
    // The state outlives this object.
    CaretPainter(const TextObjectParts& parts, TouchState& state);

    // Below the glyphs: the selection while a handle is dragged.
    void paintSelectionWhenContinueSelect(QPainter* painter) const;
    // Above the glyphs: caret, or the handles.
    void paintCaretAndHandles(QPainter* painter);

    // Brings both ends to where the cursor stands now.
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
