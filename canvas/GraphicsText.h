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
#include <QTextCursor>
#include <memory>

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

    // Makes a child that shows a copy of the record (null: a default record without characters). An id that
    // is not 0 becomes the id of the copy.
    GraphicsText(TText* record, int id, QGraphicsItem* parent = nullptr, QGraphicsScene* scene = nullptr);
    // Makes a parent, or with parentObject false an empty child, and adds it to the scene when one is given.
    GraphicsText(bool parentObject, QGraphicsItem* parent, QGraphicsScene* scene);
    ~GraphicsText() override;

    bool isParentObject() const { return m_parentObject; }
    // Returns whether this is a parent that has its child.
    bool isParentItem() const;
    // Returns the other half of the pair, or null.
    GraphicsText* parentTextItem() const;
    GraphicsText* childTextItem() const;
    // Places the pair and updates its record and the state that undo returns to. Scene coordinates.
    void placeAt(QPointF position);

    // Returns the live record, which the item owns.
    TText* getItemTText() const;
    // Returns a new copy of the record with the plain text set as its text and without any preview. The
    // caller owns it.
    TText* getTextList() const;
    // Returns the style of the next character typed into an emptied object; the item owns it.
    TText* getLastAlpaTextStyleValue() const;
    void setLastAlpaTextStyleValue(TText& style);

    // Lays the record out. Call after construction and after the record was changed from outside.
    void initShowText();
    // Shows a copy of the record and places the parent. A negative cursor position leaves the cursor where it
    // is.
    void resetDocument(TText* record, int cursorPos);

    // Returns 0 when selected as an object, 1 with a selection, 2 with a caret and no selection, -1 when not
    // active.
    int getStatusId() const;
    int getBoundingLineStatus() const;
    int getFocusFlag() const override { return m_focusFlag; }
    void setFocusFlag(int flag) override;
    bool isHandleCaret() const;
    bool isDoubleClickedSelection() const;

    // Change the style. source holds one style per changed character, property ids are those of StyleProperty
    // and flags those of UndoFlag. Only a committed change becomes an undo step.
    void changeAllStyleWhenSelectionMode(TText* source, int id, bool overall, int undoFlag);
    void changeAllStyleWhenEditMode(TText* source, int id, bool overall, int undoFlag);
    void changeAllStyleWhenHasSelection(TText* source, int id);
    void changePartStyleWhenHasSelection(TText* source, int id, int undoFlag);
    void saveStyleForNextInsert(TText* style, int undoFlag, int id);
    // Restores every character's style from before the preview; does nothing without one.
    void cancelPreview();

    // Sets the row of the font tables, which all objects share.
    void setInputLanguage(int row);
    // Sets how the family of the first character is chosen: with 1 the first character of an empty object
    // takes the family used last for its script.
    void setFontFamilyEnsureMode(int mode);
    // Sets the scale of the layout. ratio: raster pixels per stored pixel; big: laid out for the 1920 raster.
    void setRadio(double ratio, bool big);
    // Sets whether boundingRect() is limited to the raster and 100 pixels around it.
    void setBoundingRectFlag(bool flag);

    // Cancels the current touch: it selects and edits nothing, and a dragged object returns to where it was.
    void cancelTouch();
    void initNewTextSelectAll();
    void changeItemToSolidLineState();
    void pushLastEditTextIntoStack();
    // Returns whether there is typing that is not part of an undo step yet.
    bool isTyping() const;
    // Drops the typing that is not part of an undo step yet, since the object is about to be hidden.
    void discardBurst();
    // Handles a request of the soft keyboard: mode 0 places the cursor, 1 selects from begin to end, 2
    // selects all.
    void getSelectionInfo(int begin, int end, int current, int mode);
    void showCurrentTextStyle();

    // Returns whether the text is empty or consists of white space only.
    bool isBlank() const;

    int type() const override { return Type; }
    QRectF boundingRect() const override;
    void paint(QPainter* painter, const QStyleOptionGraphicsItem* option, QWidget* widget) override;
    // Repaints the frame together with the item.
    void update(const QRectF& rect = QRectF());

    // Returns a number that changes whenever what is drawn may have changed.
    quint64 contentVersion() const;
    double canvasRatio() const override;
    QGraphicsDropShadowEffect* shadowEffect() const { return m_shadowEffect; }
    // Returns the rectangle of the layout, which does not depend on the bounding rect flag.
    QRectF layoutRect() const { return QGraphicsTextItem::boundingRect(); }
    // Returns the area that the glyphs and their outlines cover, in item coordinates; empty without ink.
    // Shadows are not counted.
    QRectF inkRect() const;
    void parentFollows() override;

public Q_SLOTS:
    void slotObjectDocumentChange(int position, int removed, int added);
    void slotObjectPositionChanged();
    void slotUndoTimeOut();
    void slotLongPressed();
    void slotObjectDisplayInputLanguage(SystemSetupDef::emInputLanguageType language);

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
    void repaintBlock(int position) override;
    void blockChanged(int position) override;
    void repaintLayout(const QRectF& area);
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
    // Called when the operator closed the keyboard.
    void keyboardClosed();
    QRectF limitedBoundingRect() const;
    void paintFrame(QPainter* painter);

    std::unique_ptr<StyleDocument> m_styles;
    std::unique_ptr<TextPainter> m_painter;
    TextPlacement m_placement;
    std::unique_ptr<TextStyleEditor> m_styleEditor;
    std::unique_ptr<TouchTextEditor> m_touchEditor;
    // Owned by the item, see setGraphicsEffect().
    QGraphicsDropShadowEffect* m_shadowEffect = nullptr;
    int m_focusFlag = TextObjectConstants::FocusNone;
    bool m_isBlockRepainted = false; // until the layout requests to repaint everything
    bool m_parentObject = false;
    bool m_bigScene = false;
    bool m_boundingRectFlag = false;
};
