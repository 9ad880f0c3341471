#pragma once

#include "resources/artwork/Picture.h"

// The pictures by family; each adds its own to the table.
namespace Families
{

void addToolIcons(QList<Picture>& table);
void addButtons(QList<Picture>& table);
void addWindow(QList<Picture>& table);
void addTextPanel(QList<Picture>& table);
void addMarks(QList<Picture>& table);  // check boxes, radio buttons, signs of a tree
void addFrames(QList<Picture>& table); // dialogs, menus, balloons
void addTracks(QList<Picture>& table); // scroll bars, sliders, what is dragged
void addViews(QList<Picture>& table);  // tabs, headers, rows, separators

} // namespace Families
