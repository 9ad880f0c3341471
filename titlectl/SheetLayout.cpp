#include "titlectl/SheetLayout.h"

#include <algorithm>

namespace
{

// Shares of the height of the page.
constexpr double MARGIN = 0.04;
constexpr double HEADING = 0.035;
constexpr double GAP = 0.015;
constexpr double NAME = 0.022;
constexpr double RATIO = 16.0 / 9.0;

} // namespace

SheetLayout::SheetLayout(QSizeF page) : m_page(page)
{
}

int SheetLayout::pages(int titles)
{
    return std::max(1, (titles + PER_PAGE - 1) / PER_PAGE);
}

double SheetLayout::nameHeight() const
{
    return NAME * m_page.height();
}

QRectF SheetLayout::heading() const
{
    const double margin = MARGIN * m_page.height();
    return {margin, margin, m_page.width() - 2 * margin, HEADING * m_page.height()};
}

QRectF SheetLayout::cell(int index) const
{
    const double margin = MARGIN * m_page.height();
    const double gap = GAP * m_page.height();
    const double top = heading().bottom() + gap;
    const double width = (m_page.width() - 2 * margin - (COLUMNS - 1) * gap) / COLUMNS;
    const double height = (m_page.height() - margin - top - (ROWS - 1) * gap) / ROWS;
    const int column = index % COLUMNS;
    const int row = index / COLUMNS;
    return {margin + column * (width + gap), top + row * (height + gap), width, height};
}

QRectF SheetLayout::picture(int index) const
{
    const QRectF place = cell(index);
    const double width = std::min(place.width(), (place.height() - nameHeight()) * RATIO);
    return {place.left() + (place.width() - width) / 2, place.top(), width, width / RATIO};
}

QRectF SheetLayout::name(int index) const
{
    const QRectF place = picture(index);
    return {cell(index).left(), place.bottom(), cell(index).width(), nameHeight()};
}
