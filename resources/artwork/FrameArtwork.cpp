#include "resources/artwork/DesignTokens.h"
#include "resources/artwork/Families.h"
#include "resources/artwork/Surfaces.h"

#include <QPainter>
#include <QPolygonF>

#include <cmath>

namespace
{

const QSize CORNER(16, 16);
const QSize TIP_PIECE(28, 28); // the tip over as many rows of the frame as a corner has
constexpr int TIP_HEIGHT = 12;
constexpr int TIP_HALF_WIDTH = 12;

// A frame as layers, from the outside in: each is so many pixels inside the outer edge.
struct Layer {
    qreal inset;
    QColor color;
};

QList<Layer> dialogLayers()
{
    return {{0, Tokens::OUTLINE}, {2, Tokens::EDGE_LIGHT}, {3, Tokens::DIALOG}};
}

QList<Layer> balloonLayers()
{
    return {{0, Tokens::OUTLINE}, {1, Tokens::BALLOON_RIM}, {2, Tokens::BALLOON}};
}

void balloon(QPainter& painter, const QSize& size)
{
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(Qt::NoPen);
    for (const Layer& layer : balloonLayers()) {
        painter.setBrush(layer.color);
        painter.drawRoundedRect(
            QRectF(QPointF(0, 0), size).adjusted(layer.inset, layer.inset, -layer.inset, -layer.inset),
            Tokens::RADIUS_PANE + 2 - layer.inset, Tokens::RADIUS_PANE + 2 - layer.inset);
    }
}

// A piece of the frame's upper row with a tip on it, the frame open below the tip. Every layer of the tip
// lies as far inside the outer edge as that of the frame, so that they run into each other.
void tipUp(QPainter& painter, const QSize& size, const QList<Layer>& layers)
{
    const qreal middle = size.width() / 2.0;
    const qreal slant = std::hypot(TIP_HEIGHT, TIP_HALF_WIDTH) / TIP_HALF_WIDTH;
    painter.setRenderHint(QPainter::Antialiasing);
    painter.setPen(Qt::NoPen);
    for (const Layer& layer : layers) {
        const qreal top = layer.inset * slant;
        const qreal foot = TIP_HEIGHT + layer.inset;
        const qreal half = (foot - top) * TIP_HALF_WIDTH / TIP_HEIGHT;
        painter.setBrush(layer.color);
        painter.fillRect(QRectF(0, foot, size.width(), size.height() - foot), layer.color);
        painter.drawPolygon(
            QPolygonF({QPointF(middle, top), QPointF(middle + half, foot), QPointF(middle - half, foot)}));
    }
}

void tipDown(QPainter& painter, const QSize& size, const QList<Layer>& layers)
{
    painter.translate(0, size.height());
    painter.scale(1, -1);
    tipUp(painter, size, layers);
}

} // namespace

void Families::addFrames(QList<Picture>& table)
{
    const auto add = [&table](const QString& name, const QSize& size, const DrawWhole& draw) {
        table.append(sizedPicture(WIDGET_COLLECTION, name, size, draw));
    };
    addNineSlice(table, WIDGET_COLLECTION, QStringLiteral("Dialog/dialog_base_"), nineNames(), CORNER,
                 Surfaces::dialog);
    addNineSlice(table, WIDGET_COLLECTION, QStringLiteral("Dialog/Dialog_base_"), nineNames(), CORNER,
                 Surfaces::dialog);
    add(QStringLiteral("Menu/context_menu_allow"), TIP_PIECE,
        [](QPainter& painter, const QSize& size) { tipUp(painter, size, dialogLayers()); });
    add(QStringLiteral("Menu/List_Cursor"), QSize(8, 60), Surfaces::selectionBar);
    add(QStringLiteral("Menu/Separator_H"), QSize(8, 2), Surfaces::horizontalGroove);
    addNineSlice(table, WIDGET_COLLECTION, QStringLiteral("ToolTip/Balloon_Common_"), nineNames(), CORNER,
                 balloon);
    add(QStringLiteral("ToolTip/Balloon_Common_Upper_Center_Allow-02"), TIP_PIECE,
        [](QPainter& painter, const QSize& size) { tipUp(painter, size, balloonLayers()); });
    add(QStringLiteral("ToolTip/Balloon_Common_Bottom_Center_Allow"), TIP_PIECE,
        [](QPainter& painter, const QSize& size) { tipDown(painter, size, balloonLayers()); });
}
