// The look of the desk, in one table: every picture is painted from these.
#pragma once

#include <QColor>

namespace Tokens
{

// Surfaces. The light falls from above: upper edges are lighter than the surface, lower ones darker.
inline const QColor PANEL(50, 50, 50);
inline const QColor PANEL_INSET(38, 38, 38);
inline const QColor DIALOG(51, 51, 51);
inline const QColor OUTLINE(18, 18, 18);
inline const QColor EDGE_LIGHT(92, 92, 92);
inline const QColor EDGE_DARK(28, 28, 28);

// Text and icons.
inline const QColor TEXT(220, 220, 220);
inline const QColor TEXT_DISABLED(102, 102, 102);

// Buttons: upper and lower end of the face.
inline const QColor FACE_TOP(84, 84, 84);
inline const QColor FACE_BOTTOM(62, 62, 62);
inline const QColor FACE_PRESSED_TOP(30, 30, 30);
inline const QColor FACE_PRESSED_BOTTOM(44, 44, 44);
inline const QColor FACE_DISABLED(40, 40, 40);

// What is selected, and the accent that goes round it.
inline const QColor ACCENT(0, 129, 255);
inline const QColor SELECTED_TOP(58, 87, 176);
inline const QColor SELECTED_BOTTOM(24, 55, 164);
inline const QColor SELECTED_PRESSED_TOP(18, 40, 118);
inline const QColor SELECTED_PRESSED_BOTTOM(26, 52, 140);
inline const QColor SELECTED_DISABLED(34, 42, 66);
inline const QColor TITLE_SELECTION_TOP(64, 94, 185);
inline const QColor TITLE_SELECTION_BOTTOM(24, 55, 164);

// The pattern that stands for transparency.
inline const QColor CHECKER_LIGHT(120, 120, 120);
inline const QColor CHECKER_DARK(88, 88, 88);
constexpr int CHECKER_CELL = 16;
constexpr int CHECKER_CELL_SMALL = 8;

// Lengths in pixels.
constexpr qreal STROKE = 2.0; // every line of every icon
constexpr qreal RADIUS_BUTTON = 4.0;
constexpr qreal RADIUS_PANE = 6.0;
constexpr qreal BORDER = 1.0;

} // namespace Tokens
