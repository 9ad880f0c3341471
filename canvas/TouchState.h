#pragma once

#include <QLineF>
#include <QPointF>

// What the finger does to one text object and what the selection handles show. Item coordinates unless said
// otherwise.
struct TouchState {
    // What the finger on the object does now.
    enum class Gesture {
        None,        // it is up
        Press,       // it came down and has done nothing yet
        LongPress,   // it stayed until a character was selected
        MoveObject,  // it drags the selected object
        HandlePress, // it came down on a handle
        HandleDrag,  // it drags the handle, and no character is selected yet
        Select,      // it drags the end of the selection
        DoubleTap    // it came down for the second time and selected the whole text
    };
    Gesture gesture = Gesture::None;

    bool isHandleHeld() const { return gesture == Gesture::HandlePress || gesture == Gesture::HandleDrag; }
    // The selection has been taken over from its fixed end.
    bool isSelecting() const { return gesture == Gesture::HandleDrag || gesture == Gesture::Select; }

    // Handles are shown for a selection.
    bool handleCaret = false;
    // Chooses what the keyboard is sent.
    bool doubleClickedSelection = false;
    // The keyboard was asked for since the finger came down, with the selection saved below.
    bool keyboardAsked = false;

    // The fixed and the moving end of the selection: position, block, caret, top left of the handle.
    struct End {
        int position = -1;
        int block = -1;
        QLineF line;
        QPointF point;
    };
    End previous;
    End current;

    // Selection that the keyboard knows.
    int savedSelectionStart = -1;
    int savedSelectionEnd = -1;

    QPointF pressPoint;
    // Of the placed object, in scene coordinates.
    QPointF placeAtPress;
    // Scene coordinates.
    QPointF lastDragPoint;
};
