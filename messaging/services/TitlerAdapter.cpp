#include "messaging/services/TitlerAdapter.h"

#include "messaging/ptc/Event.h"
#include "messaging/ptc/IProxyBase.h"
#include "messaging/services/ITitler.h"
#include "messaging/services/ITitlerCallBack.h"
#include "messaging/services/TitlerParams.h"

#include <cstring>
#include <memory>

TitlerAdapter::TitlerAdapter(long id) : PTC::Adapter(id)
{
}

void TitlerAdapter::setTarget(void* target)
{
    m_target = static_cast<ITitler*>(target);
}

void TitlerAdapter::receive(PTC::Event* event)
{
    if (m_target == nullptr) {
        return;
    }
    switch (event->getMethodId()) {
    case METHOD_showTitlerCreate: {
        _CALL_TITLER_TYPE param = 0;
        TitlerParams::deserialize_showTitlerCreate_param(param, event->getData(), event->getSize());
        m_target->showTitlerCreate(param);
        break;
    }
    case METHOD_showTitlerEdit: {
        _SHOW_TITLER_PARAMTER param;
        TitlerParams::deserialize_showTitlerEdit_param(param, event->getData(), event->getSize());
        m_target->showTitlerEdit(param);
        break;
    }
    case METHOD_showDialogMaskWidget: {
        bool param = false;
        TitlerParams::deserialize_showDialogMaskWidget_param(param, event->getData(), event->getSize());
        m_target->showDialogMaskWidget(param);
        break;
    }
    case METHOD_showMessageMaskWidget: {
        bool param = false;
        TitlerParams::deserialize_showMessageMaskWidget_param(param, event->getData(), event->getSize());
        m_target->showMessageMaskWidget(param);
        break;
    }
    case METHOD_registerCallBack:
        receiveRegisterCallBack(event);
        break;
    default:
        break;
    }
}

// A call from within this process carries the plain id instead of a packed record, in memory that is freed
// here.
void TitlerAdapter::receiveRegisterCallBack(PTC::Event* event)
{
    _tagCallBackInfo info;
    if (event->isRemote()) {
        TitlerParams::deserialize_registerCallBack_param(info, event->getData(), event->getSize());
    } else {
        int id = 0;
        if (event->getData() != nullptr && event->getSize() >= static_cast<long>(sizeof id)) {
            std::memcpy(&id, event->getData(), sizeof id);
        }
        delete[] static_cast<char*>(event->getData());
        event->setData(nullptr);
        info.adapterId = id;
        info.receiverIdentity = 0;
    }
    std::unique_ptr<PTC::IProxyBase> proxy(
        createProxy(CALLBACK_INTERFACE_ID, info.adapterId, info.receiverIdentity));
    auto* callBack = dynamic_cast<ITitlerCallBack*>(proxy.get());
    if (callBack == nullptr) {
        return; // whoever registered before keeps the result
    }
    static_cast<void>(proxy.release()); // the target's from here on
    m_target->registerCallBack(callBack);
}
