#include "resources/artwork/DesignTokens.h"
#include "resources/artwork/Families.h"
#include "resources/artwork/Surfaces.h"

#include <QLinearGradient>
#include <QPainter>
#include <QPainterPath>

namespace
{

constexpr int TAB_HEIGHT = 52;
constexpr int TAB_CAP = 12;
constexpr int TAB_LOWER = 4; // how much lower than the tab in front the others stand
const QSize PANE_CORNER(8, 8);

enum class Tab { Rest, Pressed, Selected, Disabled };

// Rounded above and open below.
QPainterPath tabShape(const QSize& size, qreal top, qreal inset)
{
    const qreal radius = Tokens::RADIUS_PANE - inset;
    const qreal left = inset;
    const qreal right = size.width() - inset;
    const qreal upper = top + inset;
    QPainterPath shape;
    shape.moveTo(left, size.height());
    shape.lineTo(left, upper + radius);
    shape.quadTo(left, upper, left + radius, upper);
    shape.lineTo(right - radius, upper);
    shape.quadTo(right, upper, right, upper + radius);
    shape.lineTo(right, size.height());
    return shape;
}

void tab(QPainter& painter, const QSize& size, Tab state)
{
    painter.setRenderHint(QPainter::Antialiasing);
    const bool inFront = state == Tab::Selected;
    const qreal top = inFront ? 0 : TAB_LOWER;
    QLinearGradient face(0, top, 0, size.height());
    QColor line = Tokens::EDGE_LIGHT;
    switch (state) {
    case Tab::Rest:
        face.setColorAt(0, Tokens::TAB_TOP);
        face.setColorAt(1, Tokens::TAB_BOTTOM);
        line = Tokens::GROOVE_LIGHT;
        break;
    case Tab::Pressed:
        face.setColorAt(0, Tokens::FACE_PRESSED_TOP);
        face.setColorAt(1, Tokens::FACE_PRESSED_BOTTOM);
        line = Tokens::ACCENT;
        break;
    case Tab::Selected:
        face.setColorAt(0, Tokens::DIALOG);
        break;
    case Tab::Disabled:
        face.setColorAt(0, Tokens::FACE_DISABLED);
        line = Tokens::OUTLINE_DISABLED;
        break;
    }
    painter.fillPath(tabShape(size, top, 0), line);
    painter.fillPath(tabShape(size, top, Tokens::TAB_LINE), face);
    if (inFront) {
        painter.setClipRect(0, 0, size.width(), Tokens::TAB_ACCENT);
        painter.fillPath(tabShape(size, top, 0), Tokens::ACCENT);
    } else {
        painter.fillRect(0, size.height() - Tokens::TAB_LINE, size.width(), Tokens::TAB_LINE,
                         Tokens::EDGE_LIGHT);
    }
}

void tabPane(QPainter& painter, const QSize& size)
{
    const QRect whole(QPoint(0, 0), size);
    constexpr int LINE = Tokens::TAB_LINE;
    painter.fillRect(whole, Tokens::EDGE_LIGHT);
    painter.fillRect(whole.adjusted(LINE, LINE, -LINE, -LINE), Tokens::DIALOG);
}

void addTabs(QList<Picture>& table)
{
    const struct {
        Tab state;
        const char* name;
    } rows[] = {{Tab::Rest, "Rest"},
                {Tab::Pressed, "Pressed"},
                {Tab::Selected, "Selected"},
                {Tab::Disabled, "Disabled"}};
    for (const auto& row : rows) {
        const QString base = QStringLiteral("Pane_Tab/Tab_") + QLatin1String(row.name);
        addThreeSlice(table, WIDGET_COLLECTION,
                      {base + QStringLiteral("_Left"), base + QStringLiteral("_Center"),
                       base + QStringLiteral("_Right")},
                      TAB_HEIGHT, TAB_CAP, [state = row.state](QPainter& painter, const QSize& size) {
                          tab(painter, size, state);
                      });
    }
    addNineSlice(table, WIDGET_COLLECTION, QStringLiteral("Pane_Tab/Pane_"), nineNames(), PANE_CORNER,
                 tabPane);
}

void header(QPainter& painter, const QSize& size)
{
    QLinearGradient face(0, 0, 0, size.height());
    face.setColorAt(0, Tokens::FACE_TOP);
    face.setColorAt(1, Tokens::FACE_BOTTOM);
    painter.fillRect(QRect(QPoint(0, 0), size), face);
    painter.fillRect(0, 0, size.width(), 1, Tokens::FACE_LIGHT);
    painter.fillRect(0, size.height() - 2, size.width(), 2, Tokens::OUTLINE);
}

} // namespace

void Families::addViews(QList<Picture>& table)
{
    addTabs(table);
    const auto add = [&table](const char* name, const QSize& size, const DrawWhole& draw) {
        table.append(sizedPicture(WIDGET_COLLECTION, QString::fromLatin1(name), size, draw));
    };
    add("Pane_Tab/Separator_H", QSize(8, 4), Surfaces::horizontalGroove);
    add("Views/Header_Main_1", QSize(8, 40), header);
    add("Views/List_Cursor", QSize(8, 60), Surfaces::selectionBar);
    add("Views/Separator_H", QSize(8, 2), Surfaces::horizontalGroove);
    add("Views/Separator_V", QSize(2, 8), Surfaces::verticalGroove);
}
