#include "appliance/TitlerRemoteProxy.h"

#include "messaging/services/ServiceCall.h"
#include "messaging/services/TitlerAdapter.h"
#include "messaging/services/TitlerParams.h"

TitlerRemoteProxy::TitlerRemoteProxy(long id) : PTC::Proxy(static_cast<int>(id), true)
{
}

void TitlerRemoteProxy::registerCallBack(ITitlerCallBack* callBack)
{
    ServiceCall::registerCallBack(*this, TitlerAdapter::METHOD_registerCallBack,
                                  TitlerAdapter::CALLBACK_INTERFACE_ID, callBack);
}

void TitlerRemoteProxy::showTitlerCreate(_CALL_TITLER_TYPE type)
{
    ServiceCall::invoke(*this, TitlerAdapter::METHOD_showTitlerCreate,
                        TitlerParams::serialize_showTitlerCreate_param(type));
}

void TitlerRemoteProxy::showTitlerEdit(_SHOW_TITLER_PARAMTER param)
{
    ServiceCall::invoke(*this, TitlerAdapter::METHOD_showTitlerEdit,
                        TitlerParams::serialize_showTitlerEdit_param(param));
}

void TitlerRemoteProxy::showDialogMaskWidget(bool show)
{
    ServiceCall::invoke(*this, TitlerAdapter::METHOD_showDialogMaskWidget,
                        TitlerParams::serialize_showDialogMaskWidget_param(show));
}

void TitlerRemoteProxy::showMessageMaskWidget(bool show)
{
    ServiceCall::invoke(*this, TitlerAdapter::METHOD_showMessageMaskWidget,
                        TitlerParams::serialize_showMessageMaskWidget_param(show));
}
