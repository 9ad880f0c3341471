#include "messaging/services/FileManagerControllerCallBackAdapter.h"

#include "messaging/ptc/Event.h"
#include "messaging/services/FileManagerControllerParams.h"
#include "messaging/services/IFileManagerControllerCallBack.h"

FileManagerControllerCallBackAdapter::FileManagerControllerCallBackAdapter(long id) : PTC::CallbackAdapter(id)
{
}

void FileManagerControllerCallBackAdapter::setTarget(void* target)
{
    m_target = static_cast<IFileManagerControllerCallBack*>(target);
}

void FileManagerControllerCallBackAdapter::receive(PTC::Event* event)
{
    if (m_target == nullptr) {
        return;
    }
    switch (event->getMethodId()) {
    case METHOD_getClientID: {
        int param = 0;
        FileManagerControllerParams::deserialize_getClientID_param(param, event->getData(), event->getSize());
        m_target->getClientID(param);
        break;
    }
    default:
        break;
    }
}
