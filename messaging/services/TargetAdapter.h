// Takes the calls of an interface off the wire and makes them to a target, in the receiver's thread. Base is
// PTC::Adapter for a service and PTC::CallbackAdapter for what clients register.
#pragma once

#include "messaging/services/ServiceCall.h"

template <typename Interface, typename Base>
class TargetAdapter : public Base
{
public:
    explicit TargetAdapter(long id) : Base(id) {}

    // target is an Interface*; not owned.
    void setTarget(void* target) override { m_target = static_cast<Interface*>(target); }

    // Does nothing without a target.
    void receive(PTC::Event* event) override
    {
        if (m_target == nullptr) {
            return;
        }
        const long received = event->getMethodId();
        Interface::forEachMethod([&](long id, const char*, auto method, const char*) {
            if (id == received) {
                ServiceCall::deliver(*event, *m_target, method);
            }
        });
    }

protected:
    Interface* target() const { return m_target; }

private:
    Interface* m_target = nullptr;
};
