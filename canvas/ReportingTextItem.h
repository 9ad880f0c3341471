#pragma once

#include "canvas/ITextObjectListener.h"
#include "canvas/TouchTextItem.h"

#include <QPointF>
#include <QString>

class GraphicsText;
class TText;

// The signals of a text object for the scene and the panel. What the units report becomes a signal here;
// reports that name the object are made by the object itself. GUI thread only.
class ReportingTextItem : public TouchTextItem, protected ITextObjectListener
{
    Q_OBJECT
public:
    using TouchTextItem::TouchTextItem;

Q_SIGNALS:
    // Reports old and new record, old and new last style. They are valid during the call only.
    void signalObjectContentsEdited(TText* oldText, TText* newText, TText* oldLast, TText* newLast);
    // Reports the style at the cursor or of the selection. It is valid during the call only.
    void signalNotifyPropertyAreaObjectSelectionStyleChange(TText* style);
    // Reports whether shadow and align, and whether the move buttons are available.
    void signalNotifyTextPropertyAreaObjectSelectionMode(bool shadowAndAlign, bool move);
    // Reports a family that is not installed.
    void signalShowMessageWhenUsingDefaultFont(QString family);
    void signalObjectPositionChanged(int id, QPointF from, QPointF to);
    // Opens the keyboard for the item, or closes it when null.
    void signalNotifySceneCurrentObjectInEditMode(GraphicsText* item);
    void signalNotifySceneCurrentMousePressedObjectId(int id);
    void signalNotifyIfExistSelectedObject(bool exists);
    void signalSoftWareClosedWhenEditObject();
    void signalSaveArchive(GraphicsText* item);
    void signalDeleteItem();
    void signalObjectSelectedHasChanged(QGraphicsItem* item);
    void signalObjectHasLostFocus(GraphicsText* item);
    void signalGetSceneInputLanguage(GraphicsText* item);
    // Emitted before the selection or the text is changed from outside: previews have to end first.
    void signalEndPreview();

protected:
    // ITextObjectListener
    void contentsEdited(TText& before, TText& after, TText& lastBefore, TText& lastAfter) override;
    void styleShown(TText& style) override;
    void selectionModeChanged(bool shadowAndAlign, bool move) override;
    void objectSelected() override;
    void familyReplaced(const QString& family) override;
};
