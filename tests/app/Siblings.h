#pragma once

#include "messaging/ptc/Event.h"
#include "messaging/ptc/Receiver.h"
#include "messaging/ptc/SocketRemoteReceiver.h"

#include <QByteArray>
#include <QList>
#include <memory>
#include <mutex>
#include <unistd.h>

struct SiblingCall {
    long service = 0;
    long method = 0;
    QByteArray data;
};

// The two sibling processes as far as this program needs them: they accept connections and calls, and record
// which methods of which services were called. They never answer.
class Siblings
{
public:
    // Sets the port offset of this process to one whose ports are free, and listens there.
    bool listenOnFreePorts()
    {
        for (int i = 0; i < OFFSETS_TRIED; ++i) {
            const int offset = FIRST_OFFSET + OFFSET_STEP * ((::getpid() + i) % OFFSETS);
            qputenv("K2SYS_PORT_OFFSET", QByteArray::number(offset));
            auto main = std::make_unique<SocketRemoteReceiver>(0);
            auto subPanel = std::make_unique<SocketRemoteReceiver>(0);
            main->addReceiver(new Recorder(1, *this));
            subPanel->addReceiver(new Recorder(3, *this));
            if (!main->initialize(1000) || !subPanel->initialize(1002))
                continue;
            m_main = std::move(main);
            m_subPanel = std::move(subPanel);
            return true;
        }
        return false;
    }

    // Returns the method ids called on the service, in their order.
    QList<long> methodsOf(long service) const
    {
        const std::lock_guard lock(m_mutex);
        QList<long> methods;
        for (const SiblingCall& call : m_calls)
            if (call.service == service)
                methods << call.method;
        return methods;
    }

    qsizetype countOf(long service, long method) const { return methodsOf(service).count(method); }

    // Returns the packed arguments of the last call of the method; empty when it was not called.
    QByteArray lastArguments(long service, long method) const
    {
        const std::lock_guard lock(m_mutex);
        for (auto call = m_calls.crbegin(); call != m_calls.crend(); ++call)
            if (call->service == service && call->method == method)
                return call->data;
        return {};
    }

    // Returns the packed arguments of every call of the method, in their order.
    QList<QByteArray> argumentsOf(long service, long method) const
    {
        const std::lock_guard lock(m_mutex);
        QList<QByteArray> arguments;
        for (const SiblingCall& call : m_calls)
            if (call.service == service && call.method == method)
                arguments << call.data;
        return arguments;
    }

    void forget()
    {
        const std::lock_guard lock(m_mutex);
        m_calls.clear();
    }

private:
    static constexpr int FIRST_OFFSET = 10000; // below the ports that the system assigns to clients
    static constexpr int OFFSET_STEP = 10;
    static constexpr int OFFSETS = 1900;
    static constexpr int OFFSETS_TRIED = 20;

    class Recorder : public PTC::Receiver
    {
    public:
        Recorder(long id, Siblings& siblings) : Receiver(id), m_siblings(siblings) {}
        void recv(PTC::Event* event) override
        {
            {
                const std::lock_guard lock(m_siblings.m_mutex);
                m_siblings.m_calls << SiblingCall{event->getObjectId(), event->getMethodId(),
                                                  QByteArray(static_cast<const char*>(event->getData()),
                                                             static_cast<qsizetype>(event->getSize()))};
            }
            delete[] static_cast<char*>(event->getData());
            delete event;
        }

    private:
        Siblings& m_siblings;
    };

    mutable std::mutex m_mutex;
    QList<SiblingCall> m_calls;
    std::unique_ptr<SocketRemoteReceiver> m_main;
    std::unique_ptr<SocketRemoteReceiver> m_subPanel;
};
