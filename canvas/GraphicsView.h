#pragma once

#include "touchui/OneFinger.h"

#include <QGraphicsView>
#include <QTimer>

// The view of the canvas: turns the first finger into mouse events for the scene. Two touches within 350 ms
// are a double click; movements within the drag distance are dropped as jitter. A cancelled touch selects
// nothing, and an object that it dragged returns to its place.
class GraphicsView : public QGraphicsView
{
    Q_OBJECT
public:
    explicit GraphicsView(QGraphicsScene* scene, QWidget* parent = nullptr);

    // Cancels the current touch, if there is one.
    void cancelTouch() { m_finger.cancel(); }

Q_SIGNALS:
    // Emitted when a finger was lifted, before the release reaches the scene.
    void deleteEmptyItem();

public Q_SLOTS:
    // Called when the time has passed in which a second touch makes a double click.
    void mouseClick();

protected:
    bool viewportEvent(QEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void mouseReleaseEvent(QMouseEvent* event) override;
    void mouseMoveEvent(QMouseEvent* event) override;
    void mouseDoubleClickEvent(QMouseEvent* event) override;

private:
    QPoint fingerPosition() const;
    void rest();
    void touchBegin();
    void touchUpdate();
    void touchEnd();

    OneFinger m_finger{this};
    Qt::KeyboardModifiers m_modifiers; // of the last touch event
    QTimer m_clickTimer;
    // Widget coordinates of the viewport.
    int m_lastPressX = 0;
    int m_lastPressY = 0;
};
