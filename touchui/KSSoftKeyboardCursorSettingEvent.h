#pragma once

#include <QEvent>

// Reports the cursor position or the selection of the soft keyboard to the focused text item of the canvas.
// Positions are character positions in the item's document. They come from another process, so the receiver
// must clamp them.
class KSSoftKeyboardCursorSettingEvent : public QEvent
{
public:
    static const QEvent::Type myType;

    // Mode 0 puts the cursor at current, 1 selects from begin to end, 2 selects all.
    KSSoftKeyboardCursorSettingEvent(int begin, int end, int current, int mode);

    int getCursorBeginPos() const { return m_begin; }
    int getCursorEndPos() const { return m_end; }
    int getCursorCurrentPos() const { return m_current; }
    int getCursorSelectionMode() const { return m_mode; }

private:
    int m_begin;
    int m_end;
    int m_current;
    int m_mode;
};
