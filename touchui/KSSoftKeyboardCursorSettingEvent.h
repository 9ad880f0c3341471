#pragma once

#include <QEvent>

// Tells the focused text item of the canvas where the soft keyboard has put the cursor or the selection.
// Positions are character positions in the item's document and come from another process: the receiver clamps
// them.
class KSSoftKeyboardCursorSettingEvent : public QEvent
{
public:
    static const QEvent::Type myType;

    // Mode 0 puts the cursor at current, 1 selects begin to end, 2 selects all.
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
