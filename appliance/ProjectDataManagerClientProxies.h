// The service side of ProjectDataManager: calls to what its clients have registered.
#pragma once

#include "messaging/ptc/CallbackProxy.h"
#include "messaging/services/IProjectDataManagerCallBack.h"
#include "messaging/services/IProjectDataManagerNotify.h"

class ProjectDataManagerCallBackRemoteProxy : public IProjectDataManagerCallBack, public PTC::CallbackProxy
{
public:
    // id is the client's adapter id.
    explicit ProjectDataManagerCallBackRemoteProxy(long id);

    void getClientID(int clientId) override;
};

class ProjectDataManagerNotifyRemoteProxy : public IProjectDataManagerNotify, public PTC::CallbackProxy
{
public:
    // id is the client's adapter id.
    explicit ProjectDataManagerNotifyRemoteProxy(long id);

    void loadNotify(int state) override;
};
