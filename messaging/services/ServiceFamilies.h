// The proxies and adapters of all services that this program calls or offers, and the making of them by the
// numbers of the service table.
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
SERVICE_CALL_FAMILY(Titler); // see TitlerAdapter and TitlerParams too

namespace ServiceFamilies
{

// Returns a new proxy, owned by the caller, without sender, receiver and factory. Its interface pointer is
// written to instance as void*. Null, with instance untouched, for services without a family here.
PTC::Proxy* createProxy(long interfaceId, void** instance);

// Returns a new callback or notify adapter of that type, owned by the caller, without a target. Null for
// types that no client of the services here has.
PTC::IAdapterBase* createAdapter(long adapterType, long id);

// Returns a new proxy, owned by the caller, with which a service calls the adapter of a client, of that type
// and with that id. Null for types that no client of the services here has.
PTC::CallbackProxy* createClientProxy(long adapterType, long id);

} // namespace ServiceFamilies
