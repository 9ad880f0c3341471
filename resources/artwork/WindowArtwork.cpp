#include "resources/artwork/DesignTokens.h"
#include "resources/artwork/Families.h"
#include "resources/artwork/Icons.h"
#include "resources/artwork/Surfaces.h"

#include <QPainter>

namespace
{

const QSize CORNER(16, 16);
const QSize FOLDER_PICKER(1088, 742);

DrawWhole paneOf(const QColor& fill)
{
    return [fill](QPainter& painter, const QSize& size) { Surfaces::pane(painter, size, fill); };
}

} // namespace

void Families::addWindow(QList<Picture>& table)
{
    const auto add = [&table](const QString& name, const QSize& size, const DrawWhole& draw) {
        table.append(sizedPicture(TOOL_COLLECTION, name, size, draw));
    };
    addNineSlice(table, TOOL_COLLECTION, QStringLiteral("PanelBG/Pane_1_"), nineNames(), CORNER,
                 paneOf(Tokens::PANEL));
    addNineSlice(table, TOOL_COLLECTION, QStringLiteral("PanelBG/Pane_2_"), nineNames(), CORNER,
                 paneOf(Tokens::PANEL_INSET));
    addNineSlice(table, TOOL_COLLECTION, QStringLiteral("PanelBG/Dialog_base_"), nineNames(), CORNER,
                 Surfaces::dialog);
    QStringList lowerNames = nineNames();
    lowerNames.replaceInStrings(QStringLiteral("Bottom"), QStringLiteral("bottom"));
    addNineSlice(table, TOOL_COLLECTION, QStringLiteral("dialog_base/dialog_base_"), lowerNames, CORNER,
                 Surfaces::dialog);
    // The window puts this picture at (579, 75) and the canvas at (609, 97).
    add(QStringLiteral("PanelBG/Titler_Canvas"), QSize(1340, 764),
        [](QPainter& painter, const QSize&) { Surfaces::canvasFrame(painter, QRect(30, 22, 1280, 720)); });
    add(QStringLiteral("ToolBarbg_bluegrid"), FOLDER_PICKER, Surfaces::grid);
    add(QStringLiteral("Separator_H"), QSize(8, 4), Surfaces::horizontalGroove);
    add(QStringLiteral("Separator_V"), QSize(4, 8), Surfaces::verticalGroove);
    for (const bool pressed : {false, true}) {
        add(pressed ? QStringLiteral("Caret/Select_Handle_Single_Pressed")
                    : QStringLiteral("Caret/Select_Handle_Single"),
            QSize(24, 27), [pressed](QPainter& painter, const QSize& size) {
                Surfaces::caretHandle(painter, size, pressed);
            });
    }
    const QSize tile(2 * Tokens::PICTURE_CHECKER_CELL, 2 * Tokens::PICTURE_CHECKER_CELL);
    add(QStringLiteral("checker"), tile, [](QPainter& painter, const QSize& size) {
        Surfaces::checker(painter, QRect(QPoint(0, 0), size), Tokens::PICTURE_CHECKER_CELL,
                          Tokens::PICTURE_CHECKER_LIGHT, Tokens::PICTURE_CHECKER_DARK);
    });
    for (const char* name : {"FolderPicker/Titler_folder_icon", "FolderPicker/Picker_Icon_Enabel"}) {
        add(QString::fromLatin1(name), QSize(28, 28),
            [](QPainter& painter, const QSize&) { Icons::smallFolder(painter, Tokens::TEXT); });
    }
}
