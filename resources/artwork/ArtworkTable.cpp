#include "resources/artwork/ArtworkTable.h"

#include "resources/artwork/DesignTokens.h"
#include "resources/artwork/Icons.h"
#include "resources/artwork/Surfaces.h"

#include <QPainter>
#include <QStringList>

namespace
{

using Surfaces::Button;

const QSize TOOL_ICON(120, 67); // the icon stands in the upper part, over the label
constexpr QPoint TOOL_ICON_AT(42, 6);

struct ButtonRow {
    Button state;
    const char* name; // "Rest", "selected_Rest", ... as the names spell it
};

constexpr ButtonRow BUTTON_ROWS[] = {
    {Button::Rest, "_Rest"},
    {Button::Pressed, "_Pressed"},
    {Button::Disabled, "_Disabled"},
    {Button::SelectedRest, "selected_Rest"},
    {Button::SelectedPressed, "selected_Pressed"},
    {Button::SelectedDisabled, "selected_Disabled"},
};

void addToolIcons(QList<Picture>& table)
{
    struct ToolIcon {
        const char* name;
        void (*draw)(QPainter&, const QColor&);
        bool hasDisabled;
    };
    const ToolIcon icons[] = {
        {"Folder", Icons::folder, true},      {"Text", Icons::newText, true},
        {"Delete", Icons::trash, true},       {"Undo", Icons::undo, true},
        {"Redo", Icons::redo, true},          {"SafeArea", Icons::safeArea, false},
        {"Canvas", Icons::canvasMenu, false}, {"Close", Icons::close, false},
    };
    for (const ToolIcon& icon : icons) {
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

void addButtonFamily(QList<Picture>& table, const QString& rest, const QString& selected, int height,
                     void (*draw)(QPainter&, const QSize&, Button))
{
    constexpr int CAP = 10;
    for (const ButtonRow& row : BUTTON_ROWS) {
        const QString name = QString::fromLatin1(row.name);
        const bool isSelected = name.startsWith(QLatin1String("selected"));
        if (draw == Surfaces::toolPlate &&
            (row.state == Button::Rest || name.endsWith(QLatin1String("Disabled")))) {
            continue; // nothing is behind the icon
        }
        const QString base = isSelected ? selected + name.mid(8) : rest + name;
        addThreeSlice(table, TOOL_COLLECTION,
                      {base + QStringLiteral("_Left"), base + QStringLiteral("_Center"),
                       base + QStringLiteral("_Right")},
                      height, CAP, [draw, state = row.state](QPainter& painter, const QSize& size) {
                          draw(painter, size, state);
                      });
    }
}

void addButtons(QList<Picture>& table)
{
    const QString folder = QStringLiteral("TextToolPanel_Buttons/");
    addButtonFamily(table, folder + QStringLiteral("Button_48"), folder + QStringLiteral("Button_48selected"),
                    48, Surfaces::button);
    addButtonFamily(table, folder + QStringLiteral("Button-38B"),
                    folder + QStringLiteral("Button-38selected"), 38, Surfaces::button);
    addButtonFamily(table, QStringLiteral("ToolsBar_Buttons/Button_67"),
                    QStringLiteral("ToolsBar_Buttons/Button_67selected"), 67, Surfaces::toolPlate);
}

void addPanes(QList<Picture>& table)
{
    const QStringList names{
        QStringLiteral("Upper_Left"),  QStringLiteral("Upper_Center"),  QStringLiteral("Upper_Right"),
        QStringLiteral("Middle_Left"), QStringLiteral("Middle_Center"), QStringLiteral("Middle_Right"),
        QStringLiteral("Bottom_Left"), QStringLiteral("Bottom_Center"), QStringLiteral("Bottom_Right")};
    QStringList lowerNames = names;
    lowerNames.replaceInStrings(QStringLiteral("Bottom"), QStringLiteral("bottom"));
    const QSize corner(16, 16);
    const auto fill = [](const QColor& color) {
        return [color](QPainter& painter, const QSize& size) { Surfaces::pane(painter, size, color); };
    };
    addNineSlice(table, TOOL_COLLECTION, QStringLiteral("PanelBG/Pane_1_"), names, corner,
                 fill(Tokens::PANEL));
    addNineSlice(table, TOOL_COLLECTION, QStringLiteral("PanelBG/Pane_2_"), names, corner,
                 fill(Tokens::PANEL_INSET));
    addNineSlice(table, TOOL_COLLECTION, QStringLiteral("PanelBG/Dialog_base_"), names, corner,
                 Surfaces::dialog);
    addNineSlice(table, TOOL_COLLECTION, QStringLiteral("dialog_base/dialog_base_"), lowerNames, corner,
                 Surfaces::dialog);
    // The window puts this picture at (579, 75) and the canvas at (609, 97).
    table.append({TOOL_COLLECTION, QStringLiteral("PanelBG/Titler_Canvas"), QSize(1340, 764),
                  [](QPainter& painter) { Surfaces::canvasFrame(painter, QRect(30, 22, 1280, 720)); }});
}

void addRest(QList<Picture>& table)
{
    const auto sized = [&table](const QString& collection, const QString& name, const QSize& size,
                                void (*draw)(QPainter&, const QSize&)) {
        table.append({collection, name, size, [size, draw](QPainter& painter) { draw(painter, size); }});
    };
    sized(TOOL_COLLECTION, QStringLiteral("Separator_H"), QSize(8, 4), Surfaces::horizontalGroove);
    sized(TOOL_COLLECTION, QStringLiteral("Separator_V"), QSize(4, 8), Surfaces::verticalGroove);
    sized(WIDGET_COLLECTION, QStringLiteral("Menu/List_Cursor"), QSize(8, 60), Surfaces::selectionBar);
    sized(WIDGET_COLLECTION, QStringLiteral("Menu/Separator_H"), QSize(8, 2), Surfaces::horizontalGroove);
    for (const bool pressed : {false, true}) {
        const QSize size(24, 27);
        table.append({TOOL_COLLECTION,
                      pressed ? QStringLiteral("Caret/Select_Handle_Single_Pressed")
                              : QStringLiteral("Caret/Select_Handle_Single"),
                      size,
                      [size, pressed](QPainter& painter) { Surfaces::caretHandle(painter, size, pressed); }});
    }
    const QSize tile(2 * Tokens::CHECKER_CELL_SMALL, 2 * Tokens::CHECKER_CELL_SMALL);
    table.append({TOOL_COLLECTION, QStringLiteral("checker"), tile, [tile](QPainter& painter) {
                      Surfaces::checker(painter, QRect(QPoint(0, 0), tile), Tokens::CHECKER_CELL_SMALL);
                  }});
    table.append({TOOL_COLLECTION, QStringLiteral("FolderPicker/Titler_folder_icon"), QSize(28, 28),
                  [](QPainter& painter) {
                      painter.translate(0, 0.5);
                      painter.scale(28.0 / Icons::ICON_BOX, 28.0 / Icons::ICON_BOX);
                      Icons::folder(painter, Tokens::TEXT);
                  }});
}

} // namespace

QList<Picture> artworkTable()
{
    QList<Picture> table;
    addToolIcons(table);
    addButtons(table);
    addPanes(table);
    addRest(table);
    return table;
}
