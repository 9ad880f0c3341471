// Takes the calls of ITitler off the wire, in the receiver's thread.
#pragma once

#include "messaging/ptc/Adapter.h"
#include "messaging/services/ITitler.h"
#include "messaging/services/ServiceFamily.h"

class TitlerAdapter : public TargetAdapter<ITitler, PTC::Adapter>
{
public:
    using enum ITitler::Method;
    static constexpr long INTERFACE_ID = ITitler::INTERFACE_ID;
    // Type asked of the proxy factory for ITitlerCallBack. The factory's proxy must implement that interface.
    static constexpr long CALLBACK_INTERFACE_ID = ITitlerCallBack::ADAPTER_TYPE;

    using TargetAdapter::TargetAdapter;

    void receive(PTC::Event* event) override;

private:
    void receiveRegisterCallBack(PTC::Event* event);
};
