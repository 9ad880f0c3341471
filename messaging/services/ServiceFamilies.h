#pragma once

#include "messaging/services/IAPPEventFilter.h"
#include "messaging/services/IFileManagerController.h"
#include "messaging/services/IMessageCenter.h"
#include "messaging/services/IPowerManager.h"
#include "messaging/services/IProjectDataManager.h"
#include "messaging/services/IShowTitlerController.h"
#include "messaging/services/ISoftKeyBoardController.h"
#include "messaging/services/ISystemSetupManager.h"
#include "messaging/services/ITitler.h"
#include "messaging/services/ServiceFamily.h"

SERVICE_FAMILY_WITH_EVENTS(APPEventFilter);
SERVICE_FAMILY_WITH_EVENTS(FileManagerController);
SERVICE_FAMILY_WITH_EVENTS(MessageCenter);
SERVICE_FAMILY_WITH_EVENTS(PowerManager);
SERVICE_FAMILY_WITH_EVENTS(ProjectDataManager);
SERVICE_FAMILY(ShowTitlerController);
SERVICE_FAMILY(SoftKeyBoardController);
SERVICE_FAMILY_WITH_EVENTS(SystemSetupManager);
SERVICE_CALL_FAMILY(Titler); // see also TitlerAdapter and TitlerParams

// Declares the proxies and adapters of all services that this program calls or offers, and creates them by
// the numbers of the service table.
namespace ServiceFamilies
{

// Creates a proxy, owned by the caller, without sender, receiver and factory, and stores its interface
// pointer in instance as void*. Returns null and leaves instance unchanged for services that are not declared
// here.
PTC::Proxy* createProxy(long interfaceId, void** instance);

// Creates a callback or notify adapter of that type, owned by the caller, without a target. Returns null if
// no service declared here has that adapter type.
PTC::IAdapterBase* createAdapter(long adapterType, long id);

// Creates a proxy, owned by the caller, with which a service calls the client's adapter of that type and id.
// Returns null if no service declared here has that adapter type.
PTC::CallbackProxy* createClientProxy(long adapterType, long id);

} // namespace ServiceFamilies
