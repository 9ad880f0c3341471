#pragma once

class QWidget;

// Reads and sets the X11 input focus. Each call opens and closes its own display connection, so that nothing
// is shared between threads. Without an X server the functions do nothing.
class KSInputFocusManager
{
public:
    // Returns the window that has the input focus; 0 if there is none or no X server.
    static unsigned long getInputFocusWindow();
    // Gives a window the input focus unless it has it already. Ignores a window that does not exist or is not
    // visible.
    static void setInputFocusWindow(unsigned long window);
    // As setInputFocusWindow, only on X11. Needed because windows of the keyboard service may have taken the
    // focus.
    static void giveFocus(unsigned long window);
    // Gives the focus to the window of the widget if that is visible and not behind a modal dialog. Null is
    // ignored.
    static void giveFocus(const QWidget* widget);
};
