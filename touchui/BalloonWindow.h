#pragma once

#include "touchui/MenuPlacement.h"

#include <QPixmap>
#include <QWidget>

// The small window of a balloon: it shows one picture, takes no touch, mouse or focus, and lies above
// everything.
class BalloonWindow : public QWidget
{
    Q_OBJECT
public:
    // window bounds the placement and is the parent; null: the screen does.
    explicit BalloonWindow(QWidget* window);

    // Shows the picture at the global place. Its transparent pixels are no part of the window.
    void showPicture(const QPixmap& picture, const QPoint& globalPosition);

    // In global coordinates: the window's rectangle, or that of the screen at the point.
    static QRect bounds(const QWidget* window, const QPoint& globalPoint);

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    QPixmap m_picture;
};
