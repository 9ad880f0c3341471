#include "app/SavingNotice.h"

#include <QPalette>

namespace
{

const QColor MASK_COLOR(0, 0, 0, 166);

}

SavingNotice::SavingNotice(QWidget* window) : QLabel(window)
{
    setFocusPolicy(Qt::NoFocus);
    setAlignment(Qt::AlignCenter);
    setStyleSheet(QStringLiteral("color:rgb(220,220,220); font:40px;"));
    QPalette mask = palette();
    mask.setColor(QPalette::Window, MASK_COLOR);
    setPalette(mask);
    setAutoFillBackground(true);
    hide();
}

void SavingNotice::showAtOnce()
{
    setText(tr("Saving..."));
    setGeometry(parentWidget()->rect());
    raise();
    show();
    repaint();
}
