// The two sibling processes as this program needs them: they accept connections, take every call and remember
// which methods of which services were called. They never answer.
#pragma once

#include "messaging/ptc/Event.h"
#include "messaging/ptc/Receiver.h"
#include "messaging/ptc/SocketRemoteReceiver.h"

#include <QByteArray>
#include <QList>
#include <mutex>

struct SiblingCall {
    long service = 0;
    long method = 0;
    QByteArray data;
};

class Siblings
{
public:
    bool listen()
    {
        if (!mMain.initialize(1000) || !mSubPanel.initialize(1002))
            return false;
        mMain.addReceiver(new Recorder(1, *this));
        mSubPanel.addReceiver(new Recorder(3, *this));
        return true;
    }

    // The method ids called of the service, in their order.
    QList<long> methodsOf(long service) const
    {
        const std::lock_guard lock(mMutex);
        QList<long> methods;
        for (const SiblingCall& call : mCalls) {
            if (call.service == service)
                methods << call.method;
        }
        return methods;
    }

    // Packed arguments of the last call of the method; empty when it was not called.
    QByteArray lastArguments(long service, long method) const
    {
        const std::lock_guard lock(mMutex);
        for (auto call = mCalls.crbegin(); call != mCalls.crend(); ++call) {
            if (call->service == service && call->method == method)
                return call->data;
        }
        return {};
    }

    void forget()
    {
        const std::lock_guard lock(mMutex);
        mCalls.clear();
    }

private:
    class Recorder : public PTC::Receiver
    {
    public:
        Recorder(long id, Siblings& siblings) : Receiver(id), mSiblings(siblings) {}
        void recv(PTC::Event* event) override
        {
            {
                const std::lock_guard lock(mSiblings.mMutex);
                mSiblings.mCalls << SiblingCall{event->getObjectId(), event->getMethodId(),
                                                QByteArray(static_cast<const char*>(event->getData()),
                                                           static_cast<qsizetype>(event->getSize()))};
            }
            delete[] static_cast<char*>(event->getData());
            delete event;
        }

    private:
        Siblings& mSiblings;
    };

    mutable std::mutex mMutex;
    QList<SiblingCall> mCalls;
    SocketRemoteReceiver mMain{0};
    SocketRemoteReceiver mSubPanel{0};
};
