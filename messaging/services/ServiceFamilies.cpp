#include "messaging/services/ServiceFamilies.h"

#include "messaging/services/APPEventFilterCallBackAdapter.h"
#include "messaging/services/APPEventFilterNotifyAdapter.h"
#include "messaging/services/APPEventFilterRemoteProxy.h"
#include "messaging/services/FileManagerControllerCallBackAdapter.h"
#include "messaging/services/FileManagerControllerNotifyAdapter.h"
#include "messaging/services/FileManagerControllerRemoteProxy.h"
#include "messaging/services/MessageCenterCallBackAdapter.h"
#include "messaging/services/MessageCenterNotifyAdapter.h"
#include "messaging/services/MessageCenterRemoteProxy.h"
#include "messaging/services/PowerManagerCallBackAdapter.h"
#include "messaging/services/PowerManagerNotifyAdapter.h"
#include "messaging/services/PowerManagerRemoteProxy.h"
#include "messaging/services/ProjectDataManagerCallBackAdapter.h"
#include "messaging/services/ProjectDataManagerNotifyAdapter.h"
#include "messaging/services/ProjectDataManagerRemoteProxy.h"
#include "messaging/services/ShowTitlerControllerCallBackAdapter.h"
#include "messaging/services/ShowTitlerControllerRemoteProxy.h"
#include "messaging/services/SoftKeyBoardControllerCallBackAdapter.h"
#include "messaging/services/SoftKeyBoardControllerRemoteProxy.h"
#include "messaging/services/SystemSetupManagerCallBackAdapter.h"
#include "messaging/services/SystemSetupManagerNotifyAdapter.h"
#include "messaging/services/SystemSetupManagerRemoteProxy.h"

namespace ServiceFamilies
{

namespace
{

template <typename RemoteProxy, typename Interface>
PTC::Proxy* make(long interfaceId, void** instance)
{
    auto* proxy = new RemoteProxy(interfaceId);
    *instance = static_cast<Interface*>(proxy);
    return proxy;
}

} // namespace

PTC::Proxy* createProxy(long interfaceId, void** instance)
{
    switch (interfaceId) {
    case APPEventFilterRemoteProxy::INTERFACE_ID:
        return make<APPEventFilterRemoteProxy, IAPPEventFilter>(interfaceId, instance);
    case FileManagerControllerRemoteProxy::INTERFACE_ID:
        return make<FileManagerControllerRemoteProxy, IFileManagerController>(interfaceId, instance);
    case MessageCenterRemoteProxy::INTERFACE_ID:
        return make<MessageCenterRemoteProxy, IMessageCenter>(interfaceId, instance);
    case PowerManagerRemoteProxy::INTERFACE_ID:
        return make<PowerManagerRemoteProxy, IPowerManager>(interfaceId, instance);
    case ProjectDataManagerRemoteProxy::INTERFACE_ID:
        return make<ProjectDataManagerRemoteProxy, IProjectDataManager>(interfaceId, instance);
    case ShowTitlerControllerRemoteProxy::INTERFACE_ID:
        return make<ShowTitlerControllerRemoteProxy, IShowTitlerController>(interfaceId, instance);
    case SoftKeyBoardControllerRemoteProxy::INTERFACE_ID:
        return make<SoftKeyBoardControllerRemoteProxy, ISoftKeyBoardController>(interfaceId, instance);
    case SystemSetupManagerRemoteProxy::INTERFACE_ID:
        return make<SystemSetupManagerRemoteProxy, ISystemSetupManager>(interfaceId, instance);
    default:
        return nullptr;
    }
}

PTC::IAdapterBase* createAdapter(long adapterType, long id)
{
    switch (adapterType) {
    case APPEventFilterRemoteProxy::CALLBACK_ADAPTER_TYPE:
        return new APPEventFilterCallBackAdapter(id);
    case APPEventFilterRemoteProxy::NOTIFY_ADAPTER_TYPE:
        return new APPEventFilterNotifyAdapter(id);
    case FileManagerControllerRemoteProxy::CALLBACK_ADAPTER_TYPE:
        return new FileManagerControllerCallBackAdapter(id);
    case FileManagerControllerRemoteProxy::NOTIFY_ADAPTER_TYPE:
        return new FileManagerControllerNotifyAdapter(id);
    case MessageCenterRemoteProxy::CALLBACK_ADAPTER_TYPE:
        return new MessageCenterCallBackAdapter(id);
    case MessageCenterRemoteProxy::NOTIFY_ADAPTER_TYPE:
        return new MessageCenterNotifyAdapter(id);
    case PowerManagerRemoteProxy::CALLBACK_ADAPTER_TYPE:
        return new PowerManagerCallBackAdapter(id);
    case PowerManagerRemoteProxy::NOTIFY_ADAPTER_TYPE:
        return new PowerManagerNotifyAdapter(id);
    case ProjectDataManagerRemoteProxy::CALLBACK_ADAPTER_TYPE:
        return new ProjectDataManagerCallBackAdapter(id);
    case ProjectDataManagerRemoteProxy::NOTIFY_ADAPTER_TYPE:
        return new ProjectDataManagerNotifyAdapter(id);
    case ShowTitlerControllerRemoteProxy::CALLBACK_ADAPTER_TYPE:
        return new ShowTitlerControllerCallBackAdapter(id);
    case SoftKeyBoardControllerRemoteProxy::CALLBACK_ADAPTER_TYPE:
        return new SoftKeyBoardControllerCallBackAdapter(id);
    case SystemSetupManagerRemoteProxy::CALLBACK_ADAPTER_TYPE:
        return new SystemSetupManagerCallBackAdapter(id);
    case SystemSetupManagerRemoteProxy::NOTIFY_ADAPTER_TYPE:
        return new SystemSetupManagerNotifyAdapter(id);
    default:
        return nullptr;
    }
}

} // namespace ServiceFamilies
