#pragma once

#include <QImage>
#include <QString>
#include <QStringList>

class QWidget;

// Makes pictures of pages, and digests for comparing them: grids of average colours, as text, which are small
// enough to be kept with the sources.
namespace PagePicture
{

constexpr int COLUMNS = 64;
constexpr int ROWS = 36;

// Returns a picture of the window and of all other windows of this process above it, such as menus and
// balloons.
QImage shoot(QWidget* window);

// Returns one line per row of the grid, with six hexadecimal digits per cell. The picture may have any size.
QStringList digest(const QImage& picture);

struct Difference {
    bool sameShape = false; // whether both digests are complete
    int worst = 0;          // largest difference of a colour component, 0 to 255
    int cells = 0;          // number of cells that differ by more than the tolerance
    double mean = 0;        // average difference of all colour components
};

Difference compare(const QStringList& kept, const QStringList& seen, int tolerance);
// Returns the picture, dimmed, with the cells that differ by more than the tolerance marked in red.
QImage explain(const QImage& picture, const QStringList& kept, int tolerance);

} // namespace PagePicture
