#pragma once

// The pictures of the buttons of the dialogs, as KSPushbutton takes them.
inline constexpr char DIALOG_BUTTON_IMAGES[] =
    "TextToolPanel_Buttons:Button_48_Rest_Left:Button_48_Rest_Center:Button_48_Rest_Right:"
    "Button_48_Pressed_Left:Button_48_Pressed_Center:Button_48_Pressed_Right:"
    "Button_48_Disabled_Left:Button_48_Disabled_Center:Button_48_Disabled_Right:"
    "Button_48selected_Rest_Left:Button_48selected_Rest_Center:Button_48selected_Rest_Right:"
    "Button_48selected_Pressed_Left:Button_48selected_Pressed_Center:Button_48selected_Pressed_Right:"
    "Button_48selected_Disabled_Left:Button_48selected_Disabled_Center:Button_48selected_Disabled_Right";
