#include "touchui/KSSoftKeyboardCursorSettingEvent.h"

const QEvent::Type KSSoftKeyboardCursorSettingEvent::myType =
    static_cast<QEvent::Type>(QEvent::registerEventType());

KSSoftKeyboardCursorSettingEvent::KSSoftKeyboardCursorSettingEvent(int begin, int end, int current, int mode)
    : QEvent(myType), m_begin(begin), m_end(end), m_current(current), m_mode(mode)
{
}
