#include "panel/PanelPalette.h"

#include "panel/ColorPalette.h"
#include "touchui/KSInputContext.h"

#include <utility>

namespace
{

constexpr QPoint PALETTE_PLACE(640, 350); // relative to the window

} // namespace

PanelPalette::Answer::Answer(PanelPalette& palette)
    : m_palette(palette), m_before(std::exchange(palette.m_answers, true))
{
}

PanelPalette::Answer::~Answer()
{
    m_palette.m_answers = m_before;
}

PanelPalette::PanelPalette(QWidget* panel) : m_palette(new ColorPalette(panel))
{
}

bool PanelPalette::open(Owner owner, const QString& color, QPoint window)
{
    if (m_palette->isVisible() && m_owner == owner)
        return false;
    m_palette->reject();
    m_owner = owner;
    m_palette->setCurrentColor(color);
    m_palette->move(window + PALETTE_PLACE);
    m_palette->show();
    if (KSInputContext* input = KSInputContext::instance())
        input->showMaskOnSoftKeyboard();
    return true;
}

void PanelPalette::forget()
{
    m_owner = NO_OWNER;
    m_savedColors.clear();
}

void PanelPalette::cancel()
{
    m_palette->reject();
}

void PanelPalette::cancelUnlessAnswering()
{
    if (!m_answers)
        cancel();
}
