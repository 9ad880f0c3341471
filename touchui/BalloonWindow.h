#pragma once

#include "touchui/MenuPlacement.h"

#include <QPixmap>
#include <QWidget>

// The window of a balloon: shows one picture above all other windows and accepts no touch, mouse or focus.
class BalloonWindow : public QWidget
{
    Q_OBJECT
public:
    // window limits the placement and is the parent. If null, the screen is the limit.
    explicit BalloonWindow(QWidget* window);

    // Shows the picture at a global position. Its transparent pixels are not part of the window.
    void showPicture(const QPixmap& picture, const QPoint& globalPosition);

    // Returns the rectangle of the window, or of the screen at the point if window is null, in global
    // coordinates.
    static QRect bounds(const QWidget* window, const QPoint& globalPoint);

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    QPixmap m_picture;
};
