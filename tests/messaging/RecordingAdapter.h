#pragma once

#include "messaging/ptc/Adapter.h"
#include "messaging/ptc/Event.h"

#include <QByteArray>
#include <QList>
#include <QThread>

// Records the calls it receives.
class RecordingAdapter : public PTC::Adapter
{
public:
    struct Call {
        long object;
        long method;
        QByteArray payload;
        bool callback;
        bool remote;
        QThread* thread;
    };

    explicit RecordingAdapter(long id) : PTC::Adapter(id) {}
    ~RecordingAdapter() override
    {
        if (destroyed != nullptr)
            *destroyed = true;
    }

    void receive(PTC::Event* event) override
    {
        calls.append({event->getObjectId(), event->getMethodId(),
                      QByteArray(static_cast<const char*>(event->getData()), event->getSize()),
                      event->isCallback(), event->isRemote(), QThread::currentThread()});
    }
    void setTarget(void* newTarget) override { target = newTarget; }

    QList<Call> calls;
    void* target = nullptr;
    bool* destroyed = nullptr;
};
