#include "appliance/ClientProxyFactory.h"

#include "appliance/APPEventFilterClientProxies.h"
#include "appliance/FileManagerControllerClientProxies.h"
#include "appliance/MessageCenterClientProxies.h"
#include "appliance/PowerManagerClientProxies.h"
#include "appliance/ProjectDataManagerClientProxies.h"
#include "appliance/ShowTitlerControllerClientProxies.h"
#include "appliance/SoftKeyBoardControllerClientProxies.h"
#include "appliance/SystemSetupManagerClientProxies.h"
#include "messaging/services/APPEventFilterRemoteProxy.h"
#include "messaging/services/FileManagerControllerRemoteProxy.h"
#include "messaging/services/MessageCenterRemoteProxy.h"
#include "messaging/services/PowerManagerRemoteProxy.h"
#include "messaging/services/ProjectDataManagerRemoteProxy.h"
#include "messaging/services/ShowTitlerControllerRemoteProxy.h"
#include "messaging/services/SoftKeyBoardControllerRemoteProxy.h"
#include "messaging/services/SystemSetupManagerRemoteProxy.h"

PTC::CallbackProxy* createClientProxy(long adapterType, long id)
{
    switch (adapterType) {
    case APPEventFilterRemoteProxy::CALLBACK_ADAPTER_TYPE:
        return new APPEventFilterCallBackRemoteProxy(id);
    case APPEventFilterRemoteProxy::NOTIFY_ADAPTER_TYPE:
        return new APPEventFilterNotifyRemoteProxy(id);
    case FileManagerControllerRemoteProxy::CALLBACK_ADAPTER_TYPE:
        return new FileManagerControllerCallBackRemoteProxy(id);
    case FileManagerControllerRemoteProxy::NOTIFY_ADAPTER_TYPE:
        return new FileManagerControllerNotifyRemoteProxy(id);
    case MessageCenterRemoteProxy::CALLBACK_ADAPTER_TYPE:
        return new MessageCenterCallBackRemoteProxy(id);
    case MessageCenterRemoteProxy::NOTIFY_ADAPTER_TYPE:
        return new MessageCenterNotifyRemoteProxy(id);
    case PowerManagerRemoteProxy::CALLBACK_ADAPTER_TYPE:
        return new PowerManagerCallBackRemoteProxy(id);
    case PowerManagerRemoteProxy::NOTIFY_ADAPTER_TYPE:
        return new PowerManagerNotifyRemoteProxy(id);
    case ProjectDataManagerRemoteProxy::CALLBACK_ADAPTER_TYPE:
        return new ProjectDataManagerCallBackRemoteProxy(id);
    case ProjectDataManagerRemoteProxy::NOTIFY_ADAPTER_TYPE:
        return new ProjectDataManagerNotifyRemoteProxy(id);
    case ShowTitlerControllerRemoteProxy::CALLBACK_ADAPTER_TYPE:
        return new ShowTitlerControllerCallBackRemoteProxy(id);
    case SoftKeyBoardControllerRemoteProxy::CALLBACK_ADAPTER_TYPE:
        return new SoftKeyBoardControllerCallBackRemoteProxy(id);
    case SystemSetupManagerRemoteProxy::CALLBACK_ADAPTER_TYPE:
        return new SystemSetupManagerCallBackRemoteProxy(id);
    case SystemSetupManagerRemoteProxy::NOTIFY_ADAPTER_TYPE:
        return new SystemSetupManagerNotifyRemoteProxy(id);
    default:
        return nullptr;
    }
}
