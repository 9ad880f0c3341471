#include "resources/artwork/DesignTokens.h"
#include "resources/artwork/Families.h"
#include "resources/artwork/Icons.h"
#include "resources/artwork/PanelIcons.h"
#include "resources/artwork/Surfaces.h"

#include <QPainter>
#include <QPolygonF>

namespace
{

const QSize ICON(48, 48);
constexpr int ICON_AT = (48 - Icons::ICON_BOX) / 2;
constexpr int BOX_HEIGHT = 48;
constexpr int BOX_CAP = 8;
constexpr int PULLDOWN_WIDTH = 24;

struct PanelIcon {
    const char* name;
    void (*draw)(QPainter&, const QColor&);
    bool hasSelected;
};

constexpr PanelIcon PANEL_ICONS[] = {
    {"SizeDown", PanelIcons::sizeDown, false},
    {"SizeUp", PanelIcons::sizeUp, false},
    {"KerningSmaller", PanelIcons::kerningSmaller, false},
    {"KerningLarger", PanelIcons::kerningLarger, false},
    {"MoveUp", PanelIcons::moveUp, false},
    {"MoveRight", PanelIcons::moveRight, false},
    {"MoveDown", PanelIcons::moveDown, false},
    {"MoveLeft", PanelIcons::moveLeft, false},
    {"AlignLeft", PanelIcons::alignLeft, true},
    {"AlignCenter", PanelIcons::alignCenter, true},
    {"AlignRight", PanelIcons::alignRight, true},
    {"Bold", PanelIcons::bold, true},
    {"Italic", PanelIcons::italic, true},
    {"EdgeOff", PanelIcons::none, true},
    {"EdgeOn", PanelIcons::edge, true},
    {"ShadowOff", PanelIcons::none, true},
    {"ShadowRight", PanelIcons::shadowRight, true},
    {"ShadowCenter", PanelIcons::shadowCenter, true},
    {"ShadowLeft", PanelIcons::shadowLeft, true},
};

void addIcons(QList<Picture>& table)
{
    for (const PanelIcon& icon : PANEL_ICONS) {
        const auto add = [&table, &icon](const char* form, const QColor& color) {
            table.append({TOOL_COLLECTION,
                          QStringLiteral("TextToolPanel_Buttons/Icon_") + QLatin1String(icon.name) +
                              QLatin1String(form),
                          ICON, [draw = icon.draw, color](QPainter& painter) {
                              painter.translate(ICON_AT, ICON_AT);
                              draw(painter, color);
                          }});
        };
        add("", Tokens::TEXT);
        add("_Disabled", Tokens::TEXT_DISABLED);
        if (icon.hasSelected) {
            add("_Selected", Tokens::TEXT_SELECTED);
        }
    }
}

void textBox(QPainter& painter, const QSize& size, bool enabled)
{
    if (!enabled) {
        Surfaces::button(painter, size, Surfaces::Button::Disabled);
        return;
    }
    Surfaces::drawFace(painter, size,
                       {Tokens::WELL, Tokens::WELL, Tokens::WELL_EDGE, Tokens::WELL_SHADE, Tokens::BORDER},
                       Tokens::RADIUS_BUTTON);
}

// The right end of a box whose list opens below it.
void pulldown(QPainter& painter, bool enabled)
{
    const QSize whole(PULLDOWN_WIDTH + BOX_CAP, BOX_HEIGHT);
    painter.save();
    painter.setClipRect(0, 0, PULLDOWN_WIDTH, BOX_HEIGHT);
    painter.translate(-BOX_CAP, 0);
    textBox(painter, whole, enabled);
    painter.restore();
    Icons::begin(painter, enabled ? Tokens::TEXT : Tokens::TEXT_DISABLED);
    painter.drawPolyline(QPolygonF({QPointF(5, 21), QPointF(11, 27), QPointF(17, 21)}));
}

void addTextBoxes(QList<Picture>& table)
{
    for (const bool enabled : {true, false}) {
        const QString base = enabled ? QStringLiteral("TextToolPanel_TextBox/TextBox_Edittable_")
                                     : QStringLiteral("TextToolPanel_TextBox/TextBox_Edittable_Disable_");
        addThreeSlice(
            table, TOOL_COLLECTION,
            {base + QStringLiteral("Left"), base + QStringLiteral("Center"), base + QStringLiteral("Right")},
            BOX_HEIGHT, BOX_CAP,
            [enabled](QPainter& painter, const QSize& size) { textBox(painter, size, enabled); });
        table.append(sizedPicture(
            TOOL_COLLECTION, base + QStringLiteral("Pulldown"), QSize(PULLDOWN_WIDTH, BOX_HEIGHT),
            [enabled](QPainter& painter, const QSize&) { pulldown(painter, enabled); }));
    }
}

} // namespace

void Families::addTextPanel(QList<Picture>& table)
{
    addIcons(table);
    addTextBoxes(table);
}
