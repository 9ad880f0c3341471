#pragma once

class QWidget;

// The X11 input focus. Every call opens a display connection of its own and closes it again, so that nothing
// is shared with other threads. Without an X server all do nothing.
class KSInputFocusManager
{
public:
    // The window that has the input focus; 0 when there is none or no X server.
    static unsigned long getInputFocusWindow();
    // Gives a window the input focus, unless it has it already. A window that does not exist or is not shown
    // is ignored.
    static void setInputFocusWindow(unsigned long window);
    // The same, on X11 only: windows of the keyboard service may have taken the keyboard.
    static void giveFocus(unsigned long window);
    // Gives it to the window of the widget, when that shows and no modal dialog is before it. Null is
    // ignored.
    static void giveFocus(const QWidget* widget);
};
