#pragma once

#include <QLineF>
#include <QPointF>

// Touch state of one text object: what the finger does and what the selection handles show. Item coordinates
// unless said otherwise.
struct TouchState {
    // Handles are shown for a selection.
    bool handleCaret = false;
    bool handleMoving = false;
    // A move has begun with a selection present.
    bool selectionMoved = false;
    bool longPressed = false;
    bool released = false;
    bool moved = false;
    bool pressed = false;
    // Until the next release.
    bool doubleClicked = false;
    // Chooses what the keyboard is told.
    bool doubleClickedSelection = false;
    // The release that entered edit mode places the cursor.
    bool tapPlacesCursor = false;
    bool movedWhileSelected = false;
    bool positionChanged = false;

    // The fixed and the moving end of the selection: position, block, caret, top left of the handle.
    struct End {
        int position = -1;
        int block = -1;
        QLineF line;
        QPointF point;
    };
    End previous;
    End current;

    // The keyboard was asked for since the finger went down, with the selection saved below.
    bool keyboardAsked = false;
    // Selection that the keyboard knows.
    int savedSelectionStart = -1;
    int savedSelectionEnd = -1;
    int pressCursor = -2;
    QPointF pressPoint;
    // Of the placed object, in scene coordinates.
    QPointF placeAtPress;

    // Scene coordinates.
    QPointF lastDragPoint;
    QPointF lastScenePos;
    QPointF newScenePos;
};
