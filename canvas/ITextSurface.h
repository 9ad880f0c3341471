#pragma once

#include <QEvent>

class QTextCursor;
class TShadow;

// What the units of a text object need from the item that shows it. The item implements it and outlives its
// units. GUI thread only.
class ITextSurface
{
public:
    virtual ~ITextSurface() = default;

    virtual QTextCursor selection() const = 0;
    virtual void select(const QTextCursor& cursor) = 0;

    // Returns one of TextObjectConstants::FocusState.
    virtual int getFocusFlag() const = 0;
    virtual void setFocusFlag(int flag) = 0;
    // Returns whether text can be typed into the object.
    virtual bool isWritable() const = 0;
    virtual void setWritable(bool writable) = 0;
    virtual void takeFocus() = 0;
    virtual void giveUpFocus() = 0;

    // Returns the raster pixels per stored pixel.
    virtual double canvasRatio() const = 0;
    // Lets Qt's text item handle a mouse or key event as one of the given type; other types are ignored. The
    // two types may differ: Qt treats a double click on an object without focus as a press.
    virtual void handleByTextItem(QEvent::Type type, QEvent& event) = 0;

    // Call before the layout changes: the frame of the pair changes with it.
    virtual void announceGeometryChange() = 0;
    // Call after the layout changed: discards what was computed from it.
    virtual void layoutChanged() = 0;
    // Copies focus, interaction and layout width to the parent and repaints it.
    virtual void parentFollows() = 0;
    virtual void repaint() = 0;
    // Repaints the paragraph at the position and what its caret and outlines cover around it; everything if
    // there is none.
    virtual void repaintBlock(int position) = 0;
    // Call after characters of one paragraph changed and the layout of the others did not: as
    // layoutChanged(), but repaints that paragraph only.
    virtual void blockChanged(int position) = 0;
    // Shows the shadow; an offset of (0,0) switches it off.
    virtual void showShadow(const TShadow& shadow) = 0;
};
