#pragma once

#include <QRectF>
#include <QSizeF>

// Where the titles of a contact sheet stand: pages of rows and columns, each cell a picture of 16:9 with a
// name below it. Pure arithmetic; lengths are pixels of the page.
class SheetLayout
{
public:
    static constexpr int COLUMNS = 4;
    static constexpr int ROWS = 4;
    static constexpr int PER_PAGE = COLUMNS * ROWS;

    // The cells share what the margins and the heading leave of the page.
    explicit SheetLayout(QSizeF page);

    // Returns the number of pages for this many titles; one for none.
    static int pages(int titles);

    QRectF heading() const;
    // Return the places on the page for the title at the index, 0 to PER_PAGE - 1.
    QRectF picture(int index) const;
    QRectF name(int index) const;
    double nameHeight() const;

private:
    QRectF cell(int index) const;

    QSizeF m_page;
};
