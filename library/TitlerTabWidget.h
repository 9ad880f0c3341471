// The tabs of a picker, with the frame of a list pane drawn in their page.
#pragma once

#include "touchui/KSTabWidget.h"

#include <QPixmap>

class TitlerTabWidget : public KSTabWidget
{
    Q_OBJECT

public:
    explicit TitlerTabWidget(QWidget* parent = nullptr);

    // Makes the frame of a list pane and draws it with its corner at this point of the widget.
    void setPainLine(int x, int y);

protected:
    void paintEvent(QPaintEvent* event) override;

private:
    QPixmap mFrame;
    int mFrameX = 0;
    int mFrameY = 0;
};
