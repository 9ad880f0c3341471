#pragma once

class QEvent;
class QGraphicsSceneMouseEvent;
class QKeyEvent;

// Handles what the finger and the keys do to a text object, instead of Qt's text item. Points of events are
// item coordinates unless said otherwise. GUI thread only.
class ITextInput
{
public:
    virtual ~ITextInput() = default;

    // Called before every event of the item. Returns whether the event is handled and has to be swallowed.
    virtual bool filter(QEvent* event) = 0;

    virtual void mousePress(QGraphicsSceneMouseEvent* event) = 0;
    virtual void mouseMove(QGraphicsSceneMouseEvent* event) = 0;
    virtual void mouseRelease(QGraphicsSceneMouseEvent* event) = 0;
    virtual void mouseDoubleClick(QGraphicsSceneMouseEvent* event) = 0;
    virtual void keyPress(QKeyEvent* event) = 0;
    // Called when the item loses the input focus.
    virtual void focusLost() = 0;
};
