#pragma once

#include <QString>

class GraphicsText;

// How a text object describes itself to the soft keyboard: the name that it bears as a field.
class SoftKeyboardField
{
public:
    // A new object: the keyboard starts afresh.
    static QString newText(const QString& title, const QString& text);
    // A double tap has selected the whole text.
    static QString doubleClick(const QString& title, const QString& text);
    // Cursor and selection of the item as they are.
    static QString commonState(const QString& title, const QString& text, const GraphicsText& item);

    // The end of the selection that is not the cursor; the cursor itself without a selection.
    static int getCursorSelectionStartPosition(const GraphicsText& item);
};
