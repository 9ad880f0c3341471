#pragma once

#include <QString>

class GraphicsText;

// Makes the object name with which a text object, as an input field, describes itself to the soft keyboard.
class SoftKeyboardField
{
public:
    // Describes a new object: the keyboard starts with a cleared state.
    static QString newText(const QString& title, const QString& text);
    // Describes an object whose whole text was selected by a double tap.
    static QString doubleClick(const QString& title, const QString& text);
    // Describes the current cursor and selection of the item.
    static QString commonState(const QString& title, const QString& text, const GraphicsText& item);

    // Returns the end of the selection that is not the cursor; without a selection the cursor.
    static int getCursorSelectionStartPosition(const GraphicsText& item);
};
