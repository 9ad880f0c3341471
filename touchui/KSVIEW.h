// The roles and design values that the touch tree and its model share.
#pragma once

#include <Qt>

namespace KSVIEW
{

// Item roles beyond Qt's own. They lie under Qt::UserRole: they are attributes of this model alone.
enum _enumItemRole {
    ItemEnableRole = 33,                // bool
    ItemEditableRole = 34,              // bool
    ItemIsForderRole = 35,              // bool
    ItemHeightRole = 36,                // int, pixels; 0 takes the view's row height
    ItemCheckableRole = 37,             // bool
    ItemSelectableRole = 38,            // bool
    ItemDragEnableRole = 39,            // bool
    ItemDropEnableRole = 40,            // bool
    OnOrPartialChildrenNumberRole = 41, // int
    ItemDateRole = 50,                  // QDateTime, what the date sort compares
    ItemSizeRole = 51,                  // qint64 bytes, what the size sort compares
    ItemLoadingRole = 52,               // int, 0 not loading, else the picture, 1 to LOADING_IMAGE_COUNT
    ItemRecordingRole = 53              // bool
};
using enumItemRole = _enumItemRole;

constexpr int LOADING_IMAGE_COUNT = 8;

// What a view looks like; sizes in pixels.
enum _enumDesignAttributeRole {
    DesignRowHeight = 0,
    DesignHeaderHeight,
    DesignIndentation,   // of each level, the indicator's column included
    DesignIndicatorSize, // of the expand and collapse pictures
    DesignCheckBoxSize,
    DesignIconSize,
    DesignItemSpacing, // between indicator, check box, icon and text, and at the row's ends
    DesignFontSize,    // pixel size of a text that brings no font
    DesignTextColor,
    DesignSelectedTextColor,
    DesignDisabledTextColor,
    DesignHeaderTextColor,
    DesignOperationColor, // border of the row that is being edited
    DesignAttributeCount
};
using enumDesignAttributeRole = _enumDesignAttributeRole;

} // namespace KSVIEW
