#pragma once

#include "canvas/ITextObjectListener.h"
#include "canvas/ITextSurface.h"
#include "canvas/TextObjectConstants.h"
#include "canvas/TextPlacement.h"
#include "messaging/services/SystemSetupDef.h"
#include "touchui/CanvasTextField.h"

#include <QGraphicsTextItem>
#include <QPointF>
#include <QRectF>
#include <memory>

class CaretGeometry;
class QGraphicsDropShadowEffect;
class QKeyEvent;
class StyleDocument;
class TextPainter;
class TextStyle;
class TextStyleEditor;
class TouchTextEditor;
class TText;

// One text object of a title. On the canvas an object is a pair: a parent, which is placed in the scene and
// paints the frame, and its child at (0,0), which holds the document and the record. Off-screen scenes use a
// child alone.
//
// The record keeps one TextStyle per position of the document, line breaks included. A character beyond the
// basic plane takes two positions: the first style holds the whole character, the second an empty string. The
// Qt document does layout only; glyphs, outlines and caret are painted here.
//
// Coordinates: item coordinates are pixels of the raster that the object is laid out for; positions in
// records are scene coordinates of the 1280 canvas, font sizes and outline widths are pixels of the 1920
// raster. GUI thread only.
class GraphicsText : public QGraphicsTextItem, private ITextSurface, private ITextObjectListener
{
    Q_OBJECT
public:
    enum { Type = CanvasTextField::ITEM_TYPE };

    // A child that shows a copy of the record (null: a default record without characters). An id that is not
    // 0 becomes the id of the copy.
    GraphicsText(TText* record, int id, QGraphicsItem* parent = nullptr, QGraphicsScene* scene = nullptr);
    // A parent, or with parentObject false an empty child. Added to the scene when one is given.
    GraphicsText(bool parentObject, QGraphicsItem* parent, QGraphicsScene* scene);
    ~GraphicsText() override;

    bool isParentObject() const { return m_parentObject; }
    // A parent object that has its child.
    bool isParentItem() const;
    // The other half of the pair, or null.
    GraphicsText* parentTextItem() const;
    GraphicsText* childTextItem() const;
    // Places the pair and its record; the next change of style starts from there. Scene coordinates.
    void placeAt(QPointF position);

    // The live record, owned by the item.
    TText* getItemTText() const;
    // A new copy of the record with the plain text set as its text and without what is only previewed; the
    // caller owns it.
    TText* getTextList() const;
    // The style that the next character of an emptied object takes; owned by the item.
    TText* getLastAlpaTextStyleValue() const;
    void setLastAlpaTextStyleValue(TText& style);

    // Lays the record out: after construction, or after the record was changed from outside.
    void initShowText();
    // Shows a copy of the record; places the parent. A negative cursor position leaves the cursor.
    void resetDocument(TText* record, int cursorPos);

    // 0 selected as an object, 1 has a selection, 2 caret without selection, -1 not active.
    int getStatusId() const;
    int getBoundingLineStatus() const;
    int getFocusFlag() const override { return m_focusFlag; }
    void setFocusFlag(int flag) override;
    bool isHandleCaret() const;
    bool isDoubleClickedSelection() const;

    // Style changes; source holds one style per changed character, property ids are those of StyleProperty
    // and flags those of UndoFlag. Only a committed change is a step of undo.
    void changeAllStyleWhenSelectionMode(TText* source, int id, bool overall, int undoFlag);
    void changeAllStyleWhenEditMode(TText* source, int id, bool overall, int undoFlag);
    void changeAllStyleWhenHasSelection(TText* source, int id);
    void changePartStyleWhenHasSelection(TText* source, int id, int undoFlag);
    void saveStyleForNextInsert(TText* style, int undoFlag, int id);
    // Gives back every character's own style after previews; does nothing without one.
    void cancelPreview();

    // Row of the font tables, shared by all objects.
    void setInputLanguage(int row);
    // 1: the first character of an empty object takes the family used last for its script.
    void setFontFamilyEnsureMode(int mode);
    // ratio: raster pixels per stored pixel; big: laid out for the 1920 raster.
    void setRadio(double ratio, bool big);
    // True crops boundingRect() to 100 pixels around the raster.
    void setBoundingRectFlag(bool flag);

    // The touch that the object has is cancelled: nothing is chosen or edited by it, and a dragged object
    // returns to where it was.
    void cancelTouch();
    void initNewTextSelectAll();
    void changeItemToSolidLineState();
    void pushLastEditTextIntoStack();
    // Whether there is typing that is not part of an undo step yet.
    bool isTyping() const;
    // Forgets typing that has not become a step: the object is about to be hidden.
    void discardBurst();
    // Cursor of the soft keyboard: mode 0 places the cursor, 1 selects from begin to end, 2 selects all.
    void getSelectionInfo(int begin, int end, int current, int mode);
    void showCurrentTextStyle();

    // Empty once simplified.
    bool isBlank() const;

    int type() const override { return Type; }
    QRectF boundingRect() const override;
    void paint(QPainter* painter, const QStyleOptionGraphicsItem* option, QWidget* widget) override;
    // Updates the frame with the item.
    void update(const QRectF& rect = QRectF());

    // Where the positions of the text stand, in item coordinates.
    CaretGeometry& carets();
    // Another number whenever what is drawn may have changed.
    quint64 contentVersion() const;
    double canvasRatio() const override;
    QGraphicsDropShadowEffect* shadowEffect() const { return m_shadowEffect; }
    // The rectangle of the layout, whatever the bounding rect flag.
    QRectF layoutRect() const { return QGraphicsTextItem::boundingRect(); }
    void parentFollows() override;

public Q_SLOTS:
    void slotObjectDocumentChange(int position, int removed, int added);
    void slotObjectPositionChanged();
    void slotUndoTimeOut();
    void slotLongPressed();
    void slotObjectDisplayInputLanguage(SystemSetupDef::emInputLanguageType language);

Q_SIGNALS:
    // Old and new record, old and new last style. Valid during the call only.
    void signalObjectContentsEdited(TText* oldText, TText* newText, TText* oldLast, TText* newLast);
    // The style at the cursor or of the selection. Valid during the call only.
    void signalNotifyPropertyAreaObjectSelectionStyleChange(TText* style);
    // Whether shadow and align, and whether the move buttons apply.
    void signalNotifyTextPropertyAreaObjectSelectionMode(bool shadowAndAlign, bool move);
    // The family that is not installed.
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
    // What is selected or written is about to change from outside: a preview has to end first.
    void signalEndPreview();

protected:
    void mousePressEvent(QGraphicsSceneMouseEvent* event) override;
    void mouseMoveEvent(QGraphicsSceneMouseEvent* event) override;
    void mouseReleaseEvent(QGraphicsSceneMouseEvent* event) override;
    void mouseDoubleClickEvent(QGraphicsSceneMouseEvent* event) override;
    void contextMenuEvent(QGraphicsSceneContextMenuEvent* event) override;
    void keyPressEvent(QKeyEvent* event) override;
    void focusOutEvent(QFocusEvent* event) override;
    void dragEnterEvent(QGraphicsSceneDragDropEvent* event) override;
    void dragLeaveEvent(QGraphicsSceneDragDropEvent* event) override;
    void dragMoveEvent(QGraphicsSceneDragDropEvent* event) override;
    void dropEvent(QGraphicsSceneDragDropEvent* event) override;
    void customEvent(QEvent* event) override;
    bool eventFilter(QObject* watched, QEvent* event) override;
    QVariant itemChange(GraphicsItemChange change, const QVariant& value) override;

private:
    // ITextSurface
    QTextCursor selection() const override { return textCursor(); }
    void select(const QTextCursor& cursor) override { setTextCursor(cursor); }
    bool isWritable() const override { return textInteractionFlags() == Qt::TextEditorInteraction; }
    void setWritable(bool writable) override;
    void takeFocus() override { setFocus(); }
    void giveUpFocus() override { clearFocus(); }
    void handleByTextItem(QEvent::Type type, QEvent& event) override;
    void announceGeometryChange() override;
    void layoutChanged() override;
    void repaint() override { update(); }
    void showShadow(const TShadow& shadow) override;

    // ITextObjectListener
    void contentsEdited(TText& before, TText& after, TText& lastBefore, TText& lastAfter) override;
    void objectMoved(QPointF from, QPointF to) override;
    void styleShown(TText& style) override;
    void selectionModeChanged(bool shadowAndAlign, bool move) override;
    void objectSelected() override;
    void familyReplaced(const QString& family) override;
    void textTyped() override;
    void objectPressed() override;
    void editingBegins() override;
    void keyboardWanted(bool wanted) override;

    void initDataForGraphicsText();
    void makeUnits();
    // The keyboard was closed by the operator.
    void keyboardClosed();
    QRectF limitedBoundingRect() const;
    void paintFrame(QPainter* painter);

    std::unique_ptr<StyleDocument> m_styles;
    std::unique_ptr<TextPainter> m_painter;
    TextPlacement m_placement;
    std::unique_ptr<TextStyleEditor> m_styleEditor;
    std::unique_ptr<TouchTextEditor> m_touchEditor;
    // Owned by the item through setGraphicsEffect.
    QGraphicsDropShadowEffect* m_shadowEffect = nullptr;
    int m_focusFlag = TextObjectConstants::FocusNone;
    bool m_parentObject = false;
    bool m_bigScene = false;
    bool m_boundingRectFlag = false;
};
