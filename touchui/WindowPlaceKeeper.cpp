#include "touchui/WindowPlaceKeeper.h"

#include <QEvent>
#include <QWidget>
#include <QWindow>

namespace
{

// A window manager that will not have the window there is not asked again until the window is shown again.
constexpr int MAX_TRIES = 3;

} // namespace

WindowPlaceKeeper::WindowPlaceKeeper(QWidget* window)
    : QObject(window), mWindow(window), mPlace(window->pos())
{
    window->installEventFilter(this);
}

bool WindowPlaceKeeper::eventFilter(QObject* object, QEvent* event)
{
    if (object != mWindow)
        return false;
    switch (event->type()) {
    case QEvent::Show:
        mTries = MAX_TRIES;
        break;
    case QEvent::Move:
        // The window system's word is spontaneous, the program's own is not.
        if (event->spontaneous())
            QMetaObject::invokeMethod(this, &WindowPlaceKeeper::check, Qt::QueuedConnection);
        else
            mPlace = mWindow->pos();
        break;
    case QEvent::WindowActivate: // the window manager is done with it
        check();
        break;
    default:
        break;
    }
    return false;
}

void WindowPlaceKeeper::check()
{
    QWindow* window = mWindow->windowHandle();
    if (!window || !mWindow->isVisible() || mTries == 0 || window->position() == mPlace)
        return;
    --mTries;
    // Also when it is there already: the window manager answers with the true place.
    window->setPosition(mPlace);
}
