#pragma once

#include "messaging/services/SubCommonDefine.h"

#include <QString>

class GraphicsText;

// How a text object describes itself to the soft keyboard: eleven fields separated by "#", in the order of
// tagSoftKeyBoardInitData.
class SoftKeyboardField
{
public:
    static QString getDataInfo(const SubCommonDefine::tagSoftKeyBoardInitData& data);

    // A new object: the keyboard starts afresh.
    static QString newText(const QString& title, const QString& text);
    // A double tap has selected the whole text.
    static QString doubleClick(const QString& title, const QString& text);
    // Cursor and selection of the item as they are.
    static QString commonState(const QString& title, const QString& text, const GraphicsText& item);

    // The end of the selection that is not the cursor; the cursor itself without a selection.
    static int getCursorSelectionStartPosition(const GraphicsText& item);
};
