#pragma once

#include <QColor>
#include <QRectF>
#include <QString>

// Constants shared by the units of a text object. Lengths are pixels of the raster that the object is laid
// out for (1280 by 720 on the canvas) unless said otherwise.
namespace TextObjectConstants
{

inline const QString ENTER = QStringLiteral("\n");
inline const QString EMPTY = QString();
inline constexpr char CHARENTER = 10;

inline const QString ITEMBOUNDINGSOLIDCOLOR = QStringLiteral("#0099FF");
inline const QString ITEMBOUNDINGDOTUPCOLOR = QStringLiteral("#3366FF");
inline const QString ITEMBOUNDINGDOTDOWNCOLOR = QStringLiteral("black");
inline constexpr int ITEMBOUNDINGWIDTH = 4;

// Limits of the canvas and of the full raster: pixels 0 to 1279 and 0 to 719, and so on.
inline constexpr QRectF SCENE_RECT{0.0, 0.0, 1280.0, 720.0};
inline constexpr QRectF BIG_SCENE_RECT{0.0, 0.0, 1920.0, 1080.0};
// Stored sizes are pixels of the 1920 raster; the canvas shows them at two thirds.
inline constexpr double SCENEPERCENTAGE = 0.6666666666666666;
inline constexpr double CENTERPERCNTAGE = 0.5;
// How far an object may extend beyond the raster, and how much of it has to stay inside.
inline constexpr double LIMITEDNUM = 100.0;

inline constexpr double DOCUMENT_MARGIN = 27.0;
inline constexpr double BIG_DOCUMENT_MARGIN = 40.5;
// Left and right margin of a line together, as a fraction of its height: room for the handles.
inline constexpr double MARGIN_SHARE_OF_LINE = 0.6;
inline constexpr double HANDLEPIXMAPWIDTH = 24.0;
inline constexpr double HANDLEPIXMAPHEIGHT = 27.0;

inline constexpr int STANDARD_FONT_SIZE = 34;
inline constexpr double STANDARD_OFFSET = 4.0;
inline constexpr double STANDARD_BLUR_RADIUS = 16.0;
inline constexpr double MINIMUM_BLUR_RADIUS = 1.0;
inline constexpr int DEFAULT_MINIMUM_SIZE = 20;
// The largest size that the panel offers.
inline constexpr int MAXIMUM_FONT_SIZE = 999;
// Colour in which shadows are drawn, whatever the record contains.
inline const QColor DROP_SHADOW_COLOR{0, 0, 0, 190};

// Milliseconds without typing after which the typed text becomes one undo step.
inline constexpr int EDIT_AUTO_SAVE_TIME = 5000;
// Milliseconds.
inline constexpr int LONG_PRESS_TIME = 1000;
// Characters of one object; line breaks are not counted.
inline constexpr int CHARACTER_LIMIT = 300;

inline constexpr int HUNDERD = 100;
inline constexpr int TEN = 10;
inline constexpr int MINIMUM_BOUNDING_RECT_EXPAND_REGION = 30;

inline const QString UN_PRESSED_CARET_PIXMAP_PATH = QStringLiteral(":/Caret/Select_Handle_Single");
inline const QString PRESSED_CARET_PIXMAP_PATH = QStringLiteral(":/Caret/Select_Handle_Single_Pressed");

// Property ids of a style change.
enum StyleProperty {
    PropertyFamily = 0,
    PropertySize = 1,
    PropertyBold = 2,
    PropertyItalic = 3,
    PropertyColor = 4,
    PropertyEdge = 5,
    PropertyEdgeWidthPreview = 6,
    PropertyEdgeWidthOrColor = 7,
    PropertyShadow = 8,
    PropertyAlign = 9,
    PropertyKerning = 10,
    PropertyPosition = 11
};

// Undo flag of a style change: a preview is not an undo step and is taken back by Cancel.
enum UndoFlag { PreviewedChange = 0, CommittedChange = 1, CancelledChange = 2 };

// Values of the focus flag and of the bounding line status.
enum FocusState { FocusNone = -1, FocusEdit = 0, FocusObject = 1 };

} // namespace TextObjectConstants
