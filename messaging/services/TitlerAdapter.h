#pragma once

#include "messaging/ptc/Adapter.h"
#include "messaging/services/ITitler.h"
#include "messaging/services/ServiceFamily.h"

// Unpacks the calls of ITitler, in the receiver's thread.
class TitlerAdapter : public TargetAdapter<ITitler, PTC::Adapter>
{
public:
    using enum ITitler::Method;
    static constexpr long INTERFACE_ID = ITitler::INTERFACE_ID;
    // The type that the proxy factory is asked for. Its proxy must implement ITitlerCallBack.
    static constexpr long CALLBACK_INTERFACE_ID = ITitlerCallBack::ADAPTER_TYPE;

    using TargetAdapter::TargetAdapter;

    void receive(PTC::Event* event) override;

private:
    void receiveRegisterCallBack(PTC::Event* event);
};
