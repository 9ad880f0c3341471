#pragma once

#include <QCoreApplication>
#include <QEvent>
#include <QInputMethodEvent>
#include <QList>
#include <QPointer>
#include <QString>
#include <qpa/qplatforminputcontext.h>

// An input method with uncommitted input, for tests.
class FakeInputMethod : public QPlatformInputContext
{
public:
    bool isValid() const override { return true; }
    void commit() override
    {
        ++commits;
        if (focus != nullptr && !composed.isEmpty()) {
            QInputMethodEvent event;
            event.setCommitString(composed);
            composed.clear();
            QCoreApplication::sendEvent(focus, &event);
        }
    }
    void reset() override { ++resets; }
    bool filterEvent(const QEvent* event) override
    {
        events.append(event->type());
        return takesKeys;
    }
    void setFocusObject(QObject* object) override { focus = object; }

    QPointer<QObject> focus;
    QString composed;
    QList<int> events;
    int commits = 0;
    int resets = 0;
    bool takesKeys = false;
};
