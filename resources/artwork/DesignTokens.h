// The look of the desk, in one table: every picture is painted from these.
#pragma once

#include <QColor>

namespace Tokens
{

// The light falls from above: upper edges are lighter than their surface, lower ones darker. What is sunk
// into a surface (text boxes, grooves, wells) has it the other way round.

// Surfaces.
inline const QColor PANEL(50, 50, 50);
inline const QColor PANEL_INSET(38, 38, 38);
inline const QColor DIALOG(51, 51, 51);
inline const QColor OUTLINE(18, 18, 18);
inline const QColor EDGE_LIGHT(92, 92, 92);
inline const QColor EDGE_DARK(28, 28, 28);
inline const QColor GROOVE_LIGHT(72, 72, 72);
inline const QColor GRID(55, 61, 74);
inline const QColor GRID_MAJOR(58, 68, 90);
inline const QColor BALLOON(26, 28, 32);
inline const QColor BALLOON_RIM(150, 156, 168);

// Text and icons.
inline const QColor TEXT(220, 220, 220);
inline const QColor TEXT_DISABLED(102, 102, 102);
inline const QColor TEXT_SELECTED(255, 255, 255);
inline const QColor RECORDING(236, 48, 48);

// Buttons: upper and lower end of the face, the line around it, the light inside its upper edge.
inline const QColor FACE_TOP(84, 84, 84);
inline const QColor FACE_BOTTOM(62, 62, 62);
inline const QColor FACE_LIGHT(116, 116, 116);
inline const QColor FACE_PRESSED_TOP(12, 14, 18);
inline const QColor FACE_PRESSED_BOTTOM(22, 26, 34);
inline const QColor FACE_DISABLED(44, 44, 44);
inline const QColor OUTLINE_DISABLED(60, 60, 60);

// What is selected, and the accent that goes round it.
inline const QColor ACCENT(0, 129, 255);
inline const QColor ACCENT_LIGHT(140, 198, 255);
inline const QColor SELECTED_TOP(58, 87, 176);
inline const QColor SELECTED_BOTTOM(24, 55, 164);
inline const QColor SELECTED_LIGHT(98, 128, 214);
inline const QColor SELECTED_PRESSED_TOP(8, 20, 72);
inline const QColor SELECTED_PRESSED_BOTTOM(14, 30, 92);
inline const QColor SELECTED_DISABLED(30, 44, 88);
inline const QColor SELECTED_OUTLINE_DISABLED(48, 64, 112);

// Sunk surfaces.
inline const QColor WELL(24, 24, 24);
inline const QColor WELL_EDGE(112, 112, 112);
inline const QColor WELL_SHADE(10, 10, 10);

// What a finger drags along a track.
inline const QColor HANDLE_TOP(158, 158, 158);
inline const QColor HANDLE_BOTTOM(116, 116, 116);
inline const QColor HANDLE(112, 112, 112);
inline const QColor HANDLE_LIGHT(160, 160, 160);
inline const QColor HANDLE_GRIP(40, 40, 40);
inline const QColor TRACK(30, 30, 30);

// What is lifted off a list.
inline const QColor LIFTED_TOP(88, 92, 100);
inline const QColor LIFTED_BOTTOM(68, 71, 78);

// Tabs that are not in front.
inline const QColor TAB_TOP(44, 44, 44);
inline const QColor TAB_BOTTOM(34, 34, 34);

// The pattern that stands for transparency.
inline const QColor CHECKER_LIGHT(120, 120, 120);
inline const QColor CHECKER_DARK(88, 88, 88);
constexpr int CHECKER_CELL = 16;
// Under small pictures. Saved ones carry the same checker in them, which lies in the data path.
inline const QColor PICTURE_CHECKER_LIGHT(153, 153, 153);
inline const QColor PICTURE_CHECKER_DARK(102, 102, 102);
constexpr int PICTURE_CHECKER_CELL = 15;

// Lengths in pixels.
constexpr qreal STROKE = 2.0; // every line of every icon
constexpr qreal RADIUS_BUTTON = 4.0;
constexpr qreal RADIUS_PANE = 6.0;
constexpr qreal BORDER = 1.0;
constexpr qreal BORDER_PRESSED = 2.0;
constexpr int GRID_CELL = 32;
constexpr int TAB_LINE = 2;   // around the pane of a tab, and at the foot of the tabs behind
constexpr int TAB_ACCENT = 4; // on the tab in front

} // namespace Tokens
