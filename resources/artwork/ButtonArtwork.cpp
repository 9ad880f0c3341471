#include "resources/artwork/Families.h"
#include "resources/artwork/Surfaces.h"

#include <QPainter>

namespace
{

using Surfaces::Button;

constexpr int CAP = 10;

struct ButtonRow {
    Button state;
    const char* name; // as the names of a family spell it after the size
    bool hasPlate;    // whether a button of the tools bar has something behind its icon
};

constexpr ButtonRow BUTTON_ROWS[] = {
    {Button::Rest, "_Rest", false},
    {Button::Pressed, "_Pressed", true},
    {Button::Disabled, "_Disabled", false},
    {Button::SelectedRest, "selected_Rest", true},
    {Button::SelectedPressed, "selected_Pressed", true},
    {Button::SelectedDisabled, "selected_Disabled", false},
};

struct ButtonFamily {
    QString rest;     // before the names of the plain states
    QString selected; // before the names of the selected ones
    int height;
    void (*draw)(QPainter&, const QSize&, Button);
    bool hasAllStates;
};

void addFamily(QList<Picture>& table, const ButtonFamily& family)
{
    for (const ButtonRow& row : BUTTON_ROWS) {
        if (!family.hasAllStates && !row.hasPlate) {
            continue;
        }
        const QString name = QString::fromLatin1(row.name);
        const QString base =
            name.startsWith(QLatin1String("selected")) ? family.selected + name : family.rest + name;
        addThreeSlice(table, TOOL_COLLECTION,
                      {base + QStringLiteral("_Left"), base + QStringLiteral("_Center"),
                       base + QStringLiteral("_Right")},
                      family.height, CAP,
                      [draw = family.draw, state = row.state](QPainter& painter, const QSize& size) {
                          draw(painter, size, state);
                      });
    }
}

} // namespace

void Families::addButtons(QList<Picture>& table)
{
    const QString folder = QStringLiteral("TextToolPanel_Buttons/");
    addFamily(table, {folder + QStringLiteral("Button_48"), folder + QStringLiteral("Button_48"), 48,
                      Surfaces::button, true});
    addFamily(table, {folder + QStringLiteral("Button-38B"), folder + QStringLiteral("Button-38"), 38,
                      Surfaces::button, true});
    const QString tools = QStringLiteral("ToolsBar_Buttons/Button_67");
    addFamily(table, {tools, tools, 67, Surfaces::toolPlate, false});
    const QSize separator(3, 48);
    for (const bool enabled : {true, false}) {
        table.append(sizedPicture(TOOL_COLLECTION,
                                  folder + (enabled ? QStringLiteral("Button_48_switch_separator")
                                                    : QStringLiteral("Button_48_Disabled_switch_separator")),
                                  separator, [enabled](QPainter& painter, const QSize& size) {
                                      Surfaces::switchSeparator(painter, size, enabled);
                                  }));
    }
}
