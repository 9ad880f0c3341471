#include "touchui/DialogMasks.h"

#include <QPalette>
#include <QWidget>

namespace
{

constexpr QColor MASK_COLOR(0, 0, 0, 166);

} // namespace

DialogMasks::DialogMasks(QWidget* owner, const QMargins& margins, Press press)
    : m_owner(owner), m_margins(margins), m_press(press)
{
}

QWidget* DialogMasks::createMask(QWidget* owner, const QRect& area)
{
    auto* mask = new QWidget(owner);
    mask->setFocusPolicy(Qt::NoFocus);
    darken(mask);
    mask->setGeometry(area);
    mask->raise();
    return mask;
}

void DialogMasks::darken(QWidget* widget)
{
    QPalette palette;
    palette.setColor(QPalette::Window, MASK_COLOR);
    widget->setPalette(palette);
    widget->setAutoFillBackground(true);
}

void DialogMasks::setShown(QWidget*& mask, bool show)
{
    if (!mask && !show)
        return;
    if (!mask) {
        mask = createMask(m_owner, m_owner->rect().marginsRemoved(m_margins));
        mask->setAttribute(Qt::WA_NoMousePropagation, m_press == Press::EndsHere);
    }
    mask->setVisible(show);
}

void DialogMasks::showDialogMaskWidget(bool show)
{
    setShown(m_dialogMask, show);
    m_owner->setAttribute(Qt::WA_AcceptTouchEvents, !show);
}

void DialogMasks::showMessageMaskWidget(bool show)
{
    setShown(m_messageMask, show);
    const bool isDialogMasked = m_dialogMask && !m_dialogMask->isHidden();
    m_owner->setAttribute(Qt::WA_AcceptTouchEvents, !show && !isDialogMasked);
}
