#pragma once

#include "messaging/services/ServiceCall.h"

// Unpacks the calls of an interface and makes them to a target, in the receiver's thread. Base is
// PTC::Adapter for a service and PTC::CallbackAdapter for callbacks that clients register.
template <typename Interface, typename Base>
class TargetAdapter : public Base
{
public:
    explicit TargetAdapter(long id) : Base(id) {}

    // target is an Interface*; not owned.
    void setTarget(void* target) override { m_target = static_cast<Interface*>(target); }

    // Does nothing if no target is set.
    void receive(PTC::Event* event) override
    {
        if (m_target == nullptr)
            return;
        const long received = event->getMethodId();
        Interface::forEachMethod([&](long id, const char*, auto method, const char*) {
            if (id == received)
                ServiceCall::deliver(*event, *m_target, method);
        });
    }

protected:
    Interface* target() const { return m_target; }

private:
    Interface* m_target = nullptr;
};
