#include "touchui/WindowPlaceKeeper.h"

#include <QEvent>
#include <QWidget>
#include <QWindow>

namespace
{

// How often a window manager that refuses the position is asked again after each show.
constexpr int MAX_TRIES = 3;

} // namespace

WindowPlaceKeeper::WindowPlaceKeeper(QWidget* window)
    : QObject(window), m_window(window), m_place(window->pos())
{
    window->installEventFilter(this);
}

bool WindowPlaceKeeper::eventFilter(QObject* object, QEvent* event)
{
    if (object != m_window)
        return false;
    switch (event->type()) {
    case QEvent::Show:
        m_tries = MAX_TRIES;
        break;
    case QEvent::Move:
        // The window system moves a window spontaneously, the program does not.
        if (event->spontaneous())
            QMetaObject::invokeMethod(this, &WindowPlaceKeeper::check, Qt::QueuedConnection);
        else
            m_place = m_window->pos();
        break;
    case QEvent::WindowActivate: // the window manager has placed the window by now
        check();
        break;
    default:
        break;
    }
    return false;
}

void WindowPlaceKeeper::check()
{
    QWindow* window = m_window->windowHandle();
    if (!window || !m_window->isVisible() || m_tries == 0 || window->position() == m_place)
        return;
    --m_tries;
    // Set it even if the window is already there: the window manager replies with the true position.
    window->setPosition(m_place);
}
