#include "messaging/services/TitlerAdapter.h"

#include "messaging/ptc/Event.h"
#include "messaging/ptc/IProxyBase.h"

#include <cstring>
#include <memory>

void TitlerAdapter::receive(PTC::Event* event)
{
    if (target() != nullptr && event->getMethodId() == METHOD_registerCallBack)
        receiveRegisterCallBack(event);
    else
        TargetAdapter::receive(event);
}

// A call from within this process carries the plain id instead of a packed record, in memory that is freed
// here.
void TitlerAdapter::receiveRegisterCallBack(PTC::Event* event)
{
    _tagCallBackInfo info;
    if (event->isRemote()) {
        RecordPacking::deserialize(info, event->getData(), event->getSize());
    } else {
        int id = 0;
        if (event->getData() != nullptr && event->getSize() >= static_cast<long>(sizeof id))
            std::memcpy(&id, event->getData(), sizeof id);
        delete[] static_cast<char*>(event->getData());
        event->setData(nullptr);
        info.adapterId = id;
        info.receiverIdentity = 0;
    }
    std::unique_ptr<PTC::IProxyBase> proxy(
        createProxy(CALLBACK_INTERFACE_ID, info.adapterId, info.receiverIdentity));
    auto* callBack = dynamic_cast<ITitlerCallBack*>(proxy.get());
    if (callBack == nullptr)
        return;                         // the previous registration stays in effect
    static_cast<void>(proxy.release()); // the target owns it now
    target()->registerCallBack(callBack);
}
