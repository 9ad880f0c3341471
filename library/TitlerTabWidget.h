#pragma once

#include "touchui/KSTabWidget.h"

#include <QPixmap>

// The tab widget of a picker, which draws the frame of a list pane in its page.
class TitlerTabWidget : public KSTabWidget
{
    Q_OBJECT

public:
    explicit TitlerTabWidget(QWidget* parent = nullptr);

    // Creates the frame of a list pane and sets its top left corner, in coordinates of the widget.
    void setPainLine(int x, int y);

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    QPixmap m_frame;
    int m_frameX = 0;
    int m_frameY = 0;
};
