#include "resources/artwork/Picture.h"

#include <QPainter>

namespace
{

constexpr int MIDDLE = 8; // length of the stretched pieces

} // namespace

QStringList nineNames()
{
    return {QStringLiteral("Upper_Left"),  QStringLiteral("Upper_Center"),  QStringLiteral("Upper_Right"),
            QStringLiteral("Middle_Left"), QStringLiteral("Middle_Center"), QStringLiteral("Middle_Right"),
            QStringLiteral("Bottom_Left"), QStringLiteral("Bottom_Center"), QStringLiteral("Bottom_Right")};
}

Picture sizedPicture(const QString& collection, const QString& name, const QSize& size,
                     const DrawWhole& drawWhole)
{
    return {collection, name, size, [size, drawWhole](QPainter& painter) { drawWhole(painter, size); }};
}

Picture cutPicture(const QString& collection, const QString& name, const QRect& part, const QSize& whole,
                   const DrawWhole& drawWhole)
{
    return {collection, name, part.size(), [part, whole, drawWhole](QPainter& painter) {
                painter.translate(-part.topLeft());
                drawWhole(painter, whole);
            }};
}

void addNineSlice(QList<Picture>& table, const QString& collection, const QString& prefix,
                  const QStringList& names, const QSize& corner, const DrawWhole& drawWhole)
{
    const QSize whole(2 * corner.width() + MIDDLE, 2 * corner.height() + MIDDLE);
    const int xs[] = {0, corner.width(), corner.width() + MIDDLE};
    const int ys[] = {0, corner.height(), corner.height() + MIDDLE};
    const int widths[] = {corner.width(), MIDDLE, corner.width()};
    const int heights[] = {corner.height(), MIDDLE, corner.height()};
    for (int row = 0; row < 3; ++row) {
        for (int column = 0; column < 3; ++column) {
            const QRect part(xs[column], ys[row], widths[column], heights[row]);
            table.append(cutPicture(collection, prefix + names.at(row * 3 + column), part, whole, drawWhole));
        }
    }
}

void addThreeSlice(QList<Picture>& table, const QString& collection, const QStringList& names, int height,
                   int cap, const DrawWhole& drawWhole)
{
    const QSize whole(2 * cap + MIDDLE, height);
    table.append(cutPicture(collection, names.at(0), QRect(0, 0, cap, height), whole, drawWhole));
    table.append(cutPicture(collection, names.at(1), QRect(cap, 0, MIDDLE, height), whole, drawWhole));
    table.append(cutPicture(collection, names.at(2), QRect(cap + MIDDLE, 0, cap, height), whole, drawWhole));
}

void addThreeSliceDown(QList<Picture>& table, const QString& collection, const QStringList& names, int width,
                       int cap, const DrawWhole& drawWhole)
{
    const QSize whole(width, 2 * cap + MIDDLE);
    table.append(cutPicture(collection, names.at(0), QRect(0, 0, width, cap), whole, drawWhole));
    table.append(cutPicture(collection, names.at(1), QRect(0, cap, width, MIDDLE), whole, drawWhole));
    table.append(cutPicture(collection, names.at(2), QRect(0, cap + MIDDLE, width, cap), whole, drawWhole));
}
