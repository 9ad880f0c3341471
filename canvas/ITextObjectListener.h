#pragma once

#include <QPointF>
#include <QString>

class TText;

// Receives from the units of a text object what the scene and the panel need to know. Records are valid
// during the call only. GUI thread only.
class ITextObjectListener
{
public:
    virtual ~ITextObjectListener() = default;

    // A change that becomes an undo step: old and new record, old and new last style.
    virtual void contentsEdited(TText& before, TText& after, TText& lastBefore, TText& lastAfter) = 0;
    // The object was moved; scene coordinates.
    virtual void objectMoved(QPointF from, QPointF to) = 0;
    // The style at the cursor or of the selection.
    virtual void styleShown(TText& style) = 0;
    // Whether shadow and align, and whether the move buttons are available.
    virtual void selectionModeChanged(bool shadowAndAlign, bool move) = 0;
    // The object is selected and no longer edited.
    virtual void objectSelected() = 0;
    // The family is not installed and was replaced.
    virtual void familyReplaced(const QString& family) = 0;
    // Characters were typed or erased.
    virtual void textTyped() = 0;
    // A finger came down on the object.
    virtual void objectPressed() = 0;
    // Called before the object is edited. It needs the scene's input language then.
    virtual void editingBegins() = 0;
    // True opens the soft keyboard for the object or updates it, false closes it.
    virtual void keyboardWanted(bool wanted) = 0;
};
