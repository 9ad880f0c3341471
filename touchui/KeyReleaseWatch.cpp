#include "touchui/KeyReleaseWatch.h"

#include <QEvent>
#include <QWidget>

void KeyReleaseWatch::watch(QWidget* widget)
{
    if (m_widget == widget)
        return;
    if (m_widget != nullptr)
        m_widget->removeEventFilter(this);
    if (widget != nullptr)
        widget->installEventFilter(this);
    m_widget = widget;
}

bool KeyReleaseWatch::eventFilter(QObject* object, QEvent* event)
{
    switch (event->type()) {
    case QEvent::KeyRelease:
        m_releasing = true;
        QMetaObject::invokeMethod(
            this, [this] { m_releasing = false; }, Qt::QueuedConnection);
        break;
    case QEvent::KeyPress:
    case QEvent::MouseButtonPress:
    case QEvent::MouseButtonRelease:
    case QEvent::TouchBegin:
    case QEvent::TouchEnd:
        m_releasing = false;
        break;
    default:
        break;
    }
    return QObject::eventFilter(object, event);
}
