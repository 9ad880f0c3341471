#pragma once

// The X11 input focus. Every call opens a display connection of its own and closes it again, so that nothing
// is shared with other threads. Without an X server both do nothing.
class KSInputFocusManager
{
public:
    // The window that has the input focus; 0 when there is none or no X server.
    static unsigned long getInputFocusWindow();
    // Gives a window the input focus, unless it has it already. A window that does not exist or is not shown
    // is ignored.
    static void setInputFocusWindow(unsigned long window);
};
