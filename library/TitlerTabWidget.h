#pragma once

#include "canvas/DrawBoundingRectangle.h"
#include "touchui/KSTabWidget.h"

#include <QPoint>

#include <optional>

// The tab widget of a picker, which draws the frame of a list pane in its page.
class TitlerTabWidget : public KSTabWidget
{
    Q_OBJECT

public:
    explicit TitlerTabWidget(QWidget* parent = nullptr);

    // Shows the frame of a list pane; x and y are its top left corner, in coordinates of the widget.
    void setPainLine(int x, int y);

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    DrawBoundingRectangle m_frame;
    std::optional<QPoint> m_frameCorner; // empty if there is no frame
};
