#pragma once

#include "messaging/ptc/Event.h"
#include "messaging/ptc/ISender.h"
#include "messaging/ptc/Receiver.h"

#include <cstring>
#include <memory>

// Passes sent events directly to a receiver, as the socket would.
class LoopSender : public PTC::ISender
{
public:
    LoopSender(long id, PTC::Receiver& receiver) : m_id(id), m_receiver(receiver) {}

    long getId() override { return m_id; }
    void send(PTC::Event* event) override
    {
        const std::unique_ptr<PTC::Event> owner(event);
        lastSize = event->getSize();
        if (event->getSize() <= 0)
            return; // the socket would drop it
        char* data = new char[static_cast<std::size_t>(event->getSize())];
        std::memcpy(data, event->getData(), static_cast<std::size_t>(event->getSize()));
        m_receiver.recv(new PTC::Event(event->getObjectId(), event->getMethodId(), data, event->getSize(),
                                       event->isRemote(), event->isCallback()));
    }

    long lastSize = -1;

private:
    long m_id;
    PTC::Receiver& m_receiver;
};
