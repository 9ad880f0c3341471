#include "touchui/KSInputFocusManager.h"

#include <QApplication>
#include <QWidget>

#include <X11/Xlib.h>

namespace
{

int ignoreError(Display*, XErrorEvent*)
{
    return 0;
}

// Opens a display connection. While it is open, X11 errors, for example for a window that was just closed, do
// not end the process.
class DisplayConnection
{
public:
    DisplayConnection() : m_display(XOpenDisplay(nullptr))
    {
        if (m_display != nullptr)
            m_previousHandler = XSetErrorHandler(ignoreError);
    }
    ~DisplayConnection()
    {
        if (m_display != nullptr) {
            XCloseDisplay(m_display); // waits for all replies, so the error handler must still be installed
            XSetErrorHandler(m_previousHandler);
        }
    }
    DisplayConnection(const DisplayConnection&) = delete;
    DisplayConnection& operator=(const DisplayConnection&) = delete;

    Display* get() const { return m_display; }

private:
    Display* m_display;
    XErrorHandler m_previousHandler = nullptr;
};

Window focusWindow(Display* display)
{
    Window window = None;
    int revertTo = RevertToNone;
    XGetInputFocus(display, &window, &revertTo);
    return window;
}

} // namespace

unsigned long KSInputFocusManager::getInputFocusWindow()
{
    const DisplayConnection connection;
    return connection.get() == nullptr ? 0 : focusWindow(connection.get());
}

void KSInputFocusManager::setInputFocusWindow(unsigned long window)
{
    const DisplayConnection connection;
    if (connection.get() == nullptr || window == None)
        return;
    if (focusWindow(connection.get()) != window) {
        XSetInputFocus(connection.get(), window, RevertToPointerRoot, CurrentTime);
        XFlush(connection.get());
    }
}

void KSInputFocusManager::giveFocus(unsigned long window)
{
    if (QGuiApplication::platformName() == QLatin1String("xcb"))
        setInputFocusWindow(window);
}

// Does nothing while a modal dialog is open: a window may be activated after a dialog has opened before it,
// and both would take the focus from each other without end.
void KSInputFocusManager::giveFocus(const QWidget* widget)
{
    if (widget == nullptr || !widget->window()->isVisible() || widget->window()->internalWinId() == 0)
        return;
    const QWidget* dialog = QApplication::activeModalWidget();
    if (dialog == nullptr || dialog == widget->window())
        giveFocus(static_cast<unsigned long>(widget->window()->internalWinId()));
}
