#include "touchui/ElidedTextTip.h"

#include "touchui/KSToolTip.h"

namespace
{

constexpr int SHOW_TIME = 3000; // ms

} // namespace

ElidedTextTip::ElidedTextTip()
{
    m_timer.setSingleShot(true);
    m_timer.setInterval(SHOW_TIME);
    connect(&m_timer, &QTimer::timeout, this, &ElidedTextTip::hide);
}

void ElidedTextTip::show(const QRect& row, const QString& text, int textWidth)
{
    KSToolTip::showTextForTreeView(row, text, textWidth);
    m_shown = true;
    m_timer.start();
}

void ElidedTextTip::hide()
{
    m_timer.stop();
    if (m_shown) {
        m_shown = false;
        KSToolTip::hideText();
    }
}

void ElidedTextTip::restartIfActive()
{
    if (m_timer.isActive())
        m_timer.start();
}
