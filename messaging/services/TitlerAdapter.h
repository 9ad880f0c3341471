// Takes the calls of ITitler off the wire, in the receiver's thread.
#pragma once

#include "messaging/ptc/Adapter.h"

class ITitler;

class TitlerAdapter : public PTC::Adapter
{
public:
    static constexpr long INTERFACE_ID = 117;
    // Type asked of the proxy factory for ITitlerCallBack. The factory's proxy must implement that interface.
    static constexpr long CALLBACK_INTERFACE_ID = 118;

    // Method ids of the wire.
    enum Method : long {
        METHOD_showTitlerCreate = 1,
        METHOD_showTitlerEdit = 2,
        METHOD_showDialogMaskWidget = 3,
        METHOD_showMessageMaskWidget = 4,
        METHOD_registerCallBack = 5,
    };

    explicit TitlerAdapter(long id);

    void receive(PTC::Event* event) override;
    // target is an ITitler*; not owned.
    void setTarget(void* target) override;

private:
    void receiveRegisterCallBack(PTC::Event* event);

    ITitler* m_target = nullptr;
};
