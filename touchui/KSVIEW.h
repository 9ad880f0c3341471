#pragma once

#include <Qt>

// The roles and design values that the touch tree and its model share.
namespace KSVIEW
{

// Item roles in addition to Qt's. They are below Qt::UserRole because they exist only in this model.
enum _enumItemRole {
    ItemEnableRole = 33,                // bool
    ItemEditableRole = 34,              // bool
    ItemIsForderRole = 35,              // bool
    ItemHeightRole = 36,                // int, pixels; 0 for the view's row height
    ItemCheckableRole = 37,             // bool
    ItemSelectableRole = 38,            // bool
    ItemDragEnableRole = 39,            // bool
    ItemDropEnableRole = 40,            // bool
    OnOrPartialChildrenNumberRole = 41, // int
    ItemDateRole = 50,                  // QDateTime, for sorting by date
    ItemSizeRole = 51,                  // qint64 bytes, for sorting by size
    ItemLoadingRole = 52,  // int; 0 if not loading, else number of the picture, 1 to LOADING_IMAGE_COUNT
    ItemRecordingRole = 53 // bool
};
using enumItemRole = _enumItemRole;

constexpr int LOADING_IMAGE_COUNT = 8;

// Design values of a view; sizes are in pixels.
enum _enumDesignAttributeRole {
    DesignRowHeight = 0,
    DesignHeaderHeight,
    DesignIndentation,   // per level, including the column of the indicator
    DesignIndicatorSize, // of the expand and collapse pictures
    DesignCheckBoxSize,
    DesignIconSize,
    DesignItemSpacing, // between indicator, check box, icon and text, and at both ends of the row
    DesignFontSize,    // pixel size of a text without a font of its own
    DesignTextColor,
    DesignSelectedTextColor,
    DesignDisabledTextColor,
    DesignHeaderTextColor,
    DesignOperationColor, // border of the row that is being edited
    DesignAttributeCount
};
using enumDesignAttributeRole = _enumDesignAttributeRole;

} // namespace KSVIEW
