#include "library/DialogMasks.h"

#include <QPalette>
#include <QWidget>

namespace
{

constexpr QColor MASK_COLOR(0, 0, 0, 166);

QWidget* createMask(QWidget* owner, const QRect& area)
{
    auto* mask = new QWidget(owner);
    mask->setFocusPolicy(Qt::NoFocus);
    QPalette palette;
    palette.setColor(QPalette::Window, MASK_COLOR);
    mask->setPalette(palette);
    mask->setAutoFillBackground(true);
    mask->setGeometry(area);
    mask->raise();
    return mask;
}

} // namespace

DialogMasks::DialogMasks(QWidget* owner, const QRect& area) : mOwner(owner), mArea(area)
{
}

void DialogMasks::setShown(QWidget*& mask, bool show)
{
    if (!mask && !show)
        return;
    if (!mask)
        mask = createMask(mOwner, mArea);
    mask->setVisible(show);
}

void DialogMasks::showDialogMaskWidget(bool show)
{
    setShown(mDialogMask, show);
    mOwner->setAttribute(Qt::WA_AcceptTouchEvents, !show);
}

void DialogMasks::showMessageMaskWidget(bool show)
{
    setShown(mMessageMask, show);
    const bool isDialogMasked = mDialogMask && !mDialogMask->isHidden();
    mOwner->setAttribute(Qt::WA_AcceptTouchEvents, !show && !isDialogMasked);
}
