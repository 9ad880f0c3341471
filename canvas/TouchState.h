#pragma once

#include <QLineF>
#include <QPointF>

// The current gesture on one text object and its selection handles. Item coordinates unless said otherwise.
struct TouchState {
    // What the finger does now.
    enum class Gesture {
        None,        // not down
        Press,       // down without any effect yet
        LongPress,   // has selected a character by a long press
        MoveObject,  // drags the selected object
        HandlePress, // down on a handle
        HandleDrag,  // drags the handle; no character is selected yet
        Select,      // drags the end of the selection
        DoubleTap    // has selected the whole text by a double tap
    };
    Gesture gesture = Gesture::None;

    bool isHandleHeld() const { return gesture == Gesture::HandlePress || gesture == Gesture::HandleDrag; }
    // Returns whether a drag of the selection has begun.
    bool isSelecting() const { return gesture == Gesture::HandleDrag || gesture == Gesture::Select; }

    // Whether handles are shown for a selection.
    bool handleCaret = false;
    // Whether the keyboard is sent the description for a double tap.
    bool doubleClickedSelection = false;
    // Whether the keyboard was requested since the finger came down, with the selection saved below.
    bool keyboardAsked = false;

    // An end of the selection: position, block, caret, top left of the handle. previous is fixed, current
    // moves.
    struct End {
        int position = -1;
        int block = -1;
        QLineF line;
        QPointF point;
    };
    End previous;
    End current;

    // The selection that was last sent to the keyboard.
    int savedSelectionStart = -1;
    int savedSelectionEnd = -1;

    QPointF pressPoint;
    // Position of the object, in scene coordinates.
    QPointF placeAtPress;
    // Scene coordinates.
    QPointF lastDragPoint;
};
