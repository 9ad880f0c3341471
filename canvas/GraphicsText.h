#pragma once

#include "canvas/ReportingTextItem.h"
#include "canvas/TextPlacement.h"
#include "messaging/services/SystemSetupDef.h"

#include <QPointF>
#include <QRectF>
#include <memory>

class QGraphicsDropShadowEffect;
class StyleDocument;
class TextItemSurface;
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
// The object makes its units and is what others call; the units do the work: TextStyleEditor keeps document
// and record synchronised, TouchTextEditor handles finger and keys, TextPainter paints, TextItemSurface is
// the item as they see it.
//
// Coordinates: item coordinates are pixels of the raster that the object is laid out for; positions in
// records are scene coordinates of the 1280 canvas, font sizes and outline widths are pixels of the 1920
// raster. GUI thread only.
class GraphicsText : public ReportingTextItem
{
    Q_OBJECT
public:
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

    // Returns whether handles are shown for a selection.
    bool isHandleCaret() const;
    // Returns whether the keyboard is sent the description for a double tap.
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

    QRectF boundingRect() const override;
    void paint(QPainter* painter, const QStyleOptionGraphicsItem* option, QWidget* widget) override;

    // Returns a number that changes whenever what is drawn may have changed.
    quint64 contentVersion() const;
    // Returns the raster pixels per stored pixel.
    double canvasRatio() const;
    QGraphicsDropShadowEffect* shadowEffect() const { return m_shadowEffect; }
    // Returns the area that the glyphs and their outlines cover, in item coordinates; empty without ink.
    // Shadows are not counted.
    QRectF inkRect() const;
    // Copies focus, interaction and layout width to the parent and repaints it.
    void parentFollows();

public Q_SLOTS:
    void slotObjectDocumentChange(int position, int removed, int added);
    void slotObjectPositionChanged();
    void slotUndoTimeOut();
    void slotLongPressed();
    void slotObjectDisplayInputLanguage(SystemSetupDef::emInputLanguageType language);

protected:
    void customEvent(QEvent* event) override;
    QVariant itemChange(GraphicsItemChange change, const QVariant& value) override;

private:
    // ITextObjectListener
    void objectMoved(QPointF from, QPointF to) override;
    void textTyped() override;
    void objectPressed() override;
    void editingBegins() override;
    void keyboardWanted(bool wanted) override;

    void initDataForGraphicsText();
    void makeUnits();
    // Called when the operator closed the keyboard.
    void keyboardClosed();
    QRectF limitedBoundingRect() const;
    void paintFrame(QPainter* painter, const QRectF& exposed);

    std::unique_ptr<StyleDocument> m_styles;
    std::unique_ptr<TextPainter> m_painter;
    TextPlacement m_placement;
    std::unique_ptr<TextItemSurface> m_surface;
    std::unique_ptr<TextStyleEditor> m_styleEditor;
    std::unique_ptr<TouchTextEditor> m_touchEditor;
    // Owned by the item, see setGraphicsEffect().
    QGraphicsDropShadowEffect* m_shadowEffect = nullptr;
    bool m_parentObject = false;
    bool m_bigScene = false;
    bool m_boundingRectFlag = false;
};
