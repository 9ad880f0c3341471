#pragma once

#include "canvas/TextObjectConstants.h"
#include "touchui/CanvasTextField.h"

#include <QEvent>
#include <QGraphicsTextItem>
#include <QRectF>

class ITextInput;

// The item of a text object as Qt sees it: gives the events of finger, mouse and keyboard to one input, and
// keeps whether the object is selected or edited. Without an input Qt's text item handles the events. Nothing
// can be dropped on it, and it has no context menu. GUI thread only.
class TouchTextItem : public QGraphicsTextItem
{
    Q_OBJECT
public:
    enum { Type = CanvasTextField::ITEM_TYPE };

    explicit TouchTextItem(QGraphicsItem* parent);

    int type() const override { return Type; }
    // Repaints the parent, which paints the frame, together with the item.
    void update(const QRectF& rect = QRectF());
    // Returns the rectangle of the layout, in item coordinates. A limit of boundingRect() does not change it.
    QRectF layoutRect() const { return QGraphicsTextItem::boundingRect(); }
    // Call before the rectangle of the item changes.
    void announceGeometryChange() { prepareGeometryChange(); }

    // Returns 0 when selected as an object, 1 with a selection, 2 with a caret and no selection, -1 when not
    // active.
    int getStatusId() const;
    // Returns one of TextObjectConstants::FocusState: what the frame shows.
    int getBoundingLineStatus() const;
    // The focus flag is one of TextObjectConstants::FocusState.
    int getFocusFlag() const { return m_focusFlag; }
    void setFocusFlag(int flag);

    // Lets Qt's text item handle a mouse or key event as one of the given type; other types are ignored.
    void handleByTextItem(QEvent::Type type, QEvent& event);

protected:
    // Sets the input, which the derived class owns; null for none.
    void setInput(ITextInput* input) { m_input = input; }

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
    bool eventFilter(QObject* watched, QEvent* event) override;

private:
    ITextInput* m_input = nullptr;
    int m_focusFlag = TextObjectConstants::FocusNone;
};
