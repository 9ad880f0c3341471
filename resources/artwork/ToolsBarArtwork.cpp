#include "resources/artwork/DesignTokens.h"
#include "resources/artwork/Families.h"
#include "resources/artwork/Icons.h"

#include <QPainter>

namespace
{

const QSize TOOL_ICON(120, 67); // the icon stands in the upper part, over the label
constexpr QPoint TOOL_ICON_AT(42, 6);

struct ToolIcon {
    const char* name;
    void (*draw)(QPainter&, const QColor&);
    bool hasDisabled;
};

constexpr ToolIcon TOOL_ICONS[] = {
    {"Folder", Icons::folder, true},      {"Text", Icons::newText, true},
    {"Delete", Icons::trash, true},       {"Undo", Icons::undo, true},
    {"Redo", Icons::redo, true},          {"SafeArea", Icons::safeArea, false},
    {"Canvas", Icons::canvasMenu, false}, {"Close", Icons::close, false},
};

} // namespace

void Families::addToolIcons(QList<Picture>& table)
{
    for (const ToolIcon& icon : TOOL_ICONS) {
        const auto at = [draw = icon.draw](const QColor& color) {
            return [draw, color](QPainter& painter) {
                painter.translate(TOOL_ICON_AT);
                draw(painter, color);
            };
        };
        const QString name = QString::fromLatin1(icon.name);
        table.append({TOOL_COLLECTION, QStringLiteral("Icon_") + name, TOOL_ICON, at(Tokens::TEXT)});
        if (icon.hasDisabled) {
            table.append({TOOL_COLLECTION, QStringLiteral("Icon_Disabled_") + name, TOOL_ICON,
                          at(Tokens::TEXT_DISABLED)});
        }
    }
}
