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

    // Called for a change that becomes an undo step: old and new record, old and new last style.
    virtual void contentsEdited(TText& before, TText& after, TText& lastBefore, TText& lastAfter) = 0;
    // Called when the object was moved; scene coordinates.
    virtual void objectMoved(QPointF from, QPointF to) = 0;
    // Reports the style at the cursor or of the selection.
    virtual void styleShown(TText& style) = 0;
    // Reports whether shadow and align, and whether the move buttons are available.
    virtual void selectionModeChanged(bool shadowAndAlign, bool move) = 0;
    // Called when the object is selected and no longer edited.
    virtual void objectSelected() = 0;
    // Called when a family is not installed and was replaced.
    virtual void familyReplaced(const QString& family) = 0;
    // Called when characters were typed or erased.
    virtual void textTyped() = 0;
    // Called when a finger came down on the object.
    virtual void objectPressed() = 0;
    // Called before the object is edited, which requires the scene's input language.
    virtual void editingBegins() = 0;
    // Requests the soft keyboard: true opens it for the object or updates it, false closes it.
    virtual void keyboardWanted(bool wanted) = 0;
};
