#pragma once

#include <QColor>
#include <QRectF>
#include <QString>

// Numbers and looks shared by the units of a text object. Lengths are pixels of the raster that the object is
// laid out for (1280 by 720 on the canvas) unless said otherwise.
struct TextObjectConstants {
    inline static const QString ENTER = QStringLiteral("\n");
    inline static const QString EMPTY = QString();
    static constexpr char CHARENTER = 10;

    inline static const QString ITEMBOUNDINGSOLIDCOLOR = QStringLiteral("#0099FF");
    inline static const QString ITEMBOUNDINGDOTUPCOLOR = QStringLiteral("#3366FF");
    inline static const QString ITEMBOUNDINGDOTDOWNCOLOR = QStringLiteral("black");
    static constexpr int ITEMBOUNDINGWIDTH = 4;

    // Limits of the canvas and of the full raster: pixels 0 to 1279 and 0 to 719, and so on.
    static constexpr QRectF SCENE_RECT{0.0, 0.0, 1280.0, 720.0};
    static constexpr QRectF BIG_SCENE_RECT{0.0, 0.0, 1920.0, 1080.0};
    // Stored sizes are pixels of the 1920 raster; the canvas shows them at two thirds.
    static constexpr double SCENEPERCENTAGE = 0.6666666666666666;
    static constexpr double CENTERPERCNTAGE = 0.5;
    // How far an object may lie outside the raster, and how much of it has to stay inside.
    static constexpr double LIMITEDNUM = 100.0;

    static constexpr double DOCUMENT_MARGIN = 27.0;
    static constexpr double BIG_DOCUMENT_MARGIN = 40.5;
    // Both margins beside a line together, as part of its height: room for the handles.
    static constexpr double MARGIN_SHARE_OF_LINE = 0.6;
    static constexpr double HANDLEPIXMAPWIDTH = 24.0;
    static constexpr double HANDLEPIXMAPHEIGHT = 27.0;

    static constexpr int STANDARD_FONT_SIZE = 34;
    static constexpr double STANDARD_OFFSET = 4.0;
    static constexpr double STANDARD_BLUR_RADIUS = 16.0;
    static constexpr double MINIMUM_BLUR_RADIUS = 1.0;
    static constexpr int DEFAULT_MINIMUM_SIZE = 20;
    // The largest size that the panel offers.
    static constexpr int MAXIMUM_FONT_SIZE = 999;
    // Text objects are drawn with this colour, whatever their record says.
    inline static const QColor DROP_SHADOW_COLOR{0, 0, 0, 190};

    // Milliseconds of silence after which typing becomes one undo step.
    static constexpr int EDIT_AUTO_SAVE_TIME = 5000;
    // Milliseconds.
    static constexpr int LONG_PRESS_TIME = 1000;
    // Characters of one object; line breaks are not counted.
    static constexpr int CHARACTER_LIMIT = 300;

    static constexpr int HUNDERD = 100;
    static constexpr int TEN = 10;
    static constexpr int MINIMUM_BOUNDING_RECT_EXPAND_REGION = 30;
    // Follow the tallest line of the object that was laid out last.
    inline static double BOUNDING_RECT_EXPAND_REGION = 30.0;
    inline static double BOUNDING_RECT_EXPAND_REGION_FOR_HANDLE = 15.0;

    inline static const QString UN_PRESSED_CARET_PIXMAP_PATH = QStringLiteral(":/Caret/Select_Handle_Single");
    inline static const QString PRESSED_CARET_PIXMAP_PATH =
        QStringLiteral(":/Caret/Select_Handle_Single_Pressed");

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

    // Undo flag of a style change: a preview leaves no step of undo and is taken back by Cancel.
    enum UndoFlag { PreviewedChange = 0, CommittedChange = 1, CancelledChange = 2 };

    // Focus flag and bounding line status.
    enum FocusState { FocusNone = -1, FocusEdit = 0, FocusObject = 1 };
};
