#include "gallery/PagePicture.h"

#include <QApplication>
#include <QPainter>
#include <QWidget>

#include <algorithm>
#include <cstdlib>
#include <utility>

namespace
{

using Grid = QList<QRgb>;

// Returns an empty grid when the text is not a digest.
Grid parse(const QStringList& digest)
{
    Grid grid;
    if (digest.size() != PagePicture::ROWS)
        return grid;
    for (const QString& line : digest) {
        const QStringList cells = line.split(QLatin1Char(' '), Qt::SkipEmptyParts);
        if (cells.size() != PagePicture::COLUMNS)
            return Grid();
        for (const QString& cell : cells) {
            bool valid = false;
            grid.append(cell.toUInt(&valid, 16) | 0xff000000U);
            if (!valid)
                return Grid();
        }
    }
    return grid;
}

QRect cellRect(const QSize& size, int column, int row)
{
    const int left = size.width() * column / PagePicture::COLUMNS;
    const int top = size.height() * row / PagePicture::ROWS;
    return QRect(left, top, qMax(1, size.width() * (column + 1) / PagePicture::COLUMNS - left),
                 qMax(1, size.height() * (row + 1) / PagePicture::ROWS - top));
}

QRgb average(const QImage& picture, const QRect& cell)
{
    quint64 red = 0;
    quint64 green = 0;
    quint64 blue = 0;
    for (int y = cell.top(); y <= cell.bottom(); ++y) {
        for (int x = cell.left(); x <= cell.right(); ++x) {
            const QRgb pixel = picture.pixel(x, y);
            red += static_cast<quint64>(qRed(pixel));
            green += static_cast<quint64>(qGreen(pixel));
            blue += static_cast<quint64>(qBlue(pixel));
        }
    }
    const auto count = static_cast<quint64>(cell.width()) * static_cast<quint64>(cell.height());
    return qRgb(static_cast<int>(red / count), static_cast<int>(green / count),
                static_cast<int>(blue / count));
}

int distance(QRgb a, QRgb b)
{
    return qMax(std::abs(qRed(a) - qRed(b)),
                qMax(std::abs(qGreen(a) - qGreen(b)), std::abs(qBlue(a) - qBlue(b))));
}

} // namespace

QImage PagePicture::shoot(QWidget* window)
{
    QImage picture = window->grab().toImage().convertToFormat(QImage::Format_RGB32);
    QPainter painter(&picture);
    const QPoint origin = window->mapToGlobal(QPoint(0, 0));
    QList<QWidget*> others;
    for (QWidget* other : QApplication::topLevelWidgets())
        if (other != window && other->isVisible())
            others.append(other);
    // Sorted, since Qt returns the windows in no fixed order.
    std::sort(others.begin(), others.end(), [](const QWidget* a, const QWidget* b) {
        return std::make_pair(a->y(), a->x()) < std::make_pair(b->y(), b->x());
    });
    for (QWidget* other : others)
        painter.drawPixmap(other->pos() - origin, other->grab());
    return picture;
}

QStringList PagePicture::digest(const QImage& picture)
{
    QStringList lines;
    if (picture.isNull())
        return lines;
    const QImage source = picture.width() < COLUMNS || picture.height() < ROWS
                              ? picture.scaled(picture.size().expandedTo(QSize(COLUMNS, ROWS)))
                              : picture;
    for (int row = 0; row < ROWS; ++row) {
        QStringList cells;
        for (int column = 0; column < COLUMNS; ++column) {
            const QRgb color = average(source, cellRect(source.size(), column, row));
            cells.append(QStringLiteral("%1").arg(color & 0xffffffU, 6, 16, QLatin1Char('0')));
        }
        lines.append(cells.join(QLatin1Char(' ')));
    }
    return lines;
}

PagePicture::Difference PagePicture::compare(const QStringList& kept, const QStringList& seen, int tolerance)
{
    const Grid a = parse(kept);
    const Grid b = parse(seen);
    Difference result;
    if (a.isEmpty() || b.isEmpty())
        return result;
    result.sameShape = true;
    qint64 sum = 0;
    for (qsizetype i = 0; i < a.size(); ++i) {
        const int apart = distance(a.at(i), b.at(i));
        result.worst = qMax(result.worst, apart);
        result.cells += apart > tolerance ? 1 : 0;
        sum += std::abs(qRed(a.at(i)) - qRed(b.at(i))) + std::abs(qGreen(a.at(i)) - qGreen(b.at(i))) +
               std::abs(qBlue(a.at(i)) - qBlue(b.at(i)));
    }
    result.mean = static_cast<double>(sum) / (3.0 * static_cast<double>(a.size()));
    return result;
}

QImage PagePicture::explain(const QImage& picture, const QStringList& kept, int tolerance)
{
    const Grid a = parse(kept);
    const Grid b = parse(digest(picture));
    QImage result = picture.convertToFormat(QImage::Format_RGB32);
    QPainter painter(&result);
    painter.fillRect(result.rect(), QColor(0, 0, 0, 120));
    for (qsizetype i = 0; i < qMin(a.size(), b.size()); ++i) {
        if (distance(a.at(i), b.at(i)) > tolerance) {
            painter.fillRect(
                cellRect(result.size(), static_cast<int>(i) % COLUMNS, static_cast<int>(i) / COLUMNS),
                QColor(255, 0, 0, 140));
        }
    }
    return result;
}
