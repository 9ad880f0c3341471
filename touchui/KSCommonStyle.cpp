#include "touchui/KSCommonStyle.h"

#include <QEvent>

int KSCommonStyle::styleHint(StyleHint hint, const QStyleOption* option, const QWidget* widget,
                             QStyleHintReturn* returnData) const
{
    switch (hint) {
    // Turn off hover, mnemonics, blinking and context menus, which are of no use with a finger.
    case SH_UnderlineShortcut:
    case SH_BlinkCursorWhenTextSelected:
    case SH_Menu_FlashTriggeredItem:
    case SH_Menu_FadeOutOnHide:
    case SH_EtchDisabledText:
    case SH_DitherDisabledText:
    case SH_ToolTip_WakeUpDelay:
        return 0;
    case SH_TabBar_Alignment:
        return Qt::AlignLeft;
    case SH_TabBar_ElideMode:
        return Qt::ElideRight;
    case SH_TabBar_PreferNoArrows:
        return 1;
    case SH_TabBar_SelectMouseType:
        return QEvent::MouseButtonRelease;
    default:
        return QCommonStyle::styleHint(hint, option, widget, returnData);
    }
}
