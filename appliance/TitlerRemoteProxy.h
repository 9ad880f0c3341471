// Calls the titler.
#pragma once

#include "messaging/ptc/Proxy.h"
#include "messaging/services/ITitler.h"

class TitlerRemoteProxy : public ITitler, public PTC::Proxy
{
public:
    explicit TitlerRemoteProxy(long id);

    // The callback stays the caller's.
    void registerCallBack(ITitlerCallBack* callBack) override;
    void showTitlerCreate(_CALL_TITLER_TYPE type) override;
    void showTitlerEdit(_SHOW_TITLER_PARAMTER param) override;
    void showDialogMaskWidget(bool show) override;
    void showMessageMaskWidget(bool show) override;
};
