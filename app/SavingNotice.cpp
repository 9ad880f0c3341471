#include "app/SavingNotice.h"

#include "touchui/DialogMasks.h"

SavingNotice::SavingNotice(QWidget* window) : QLabel(window)
{
    setFocusPolicy(Qt::NoFocus);
    setAlignment(Qt::AlignCenter);
    setStyleSheet(QStringLiteral("color:rgb(220,220,220); font:40px;"));
    DialogMasks::darken(this);
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
