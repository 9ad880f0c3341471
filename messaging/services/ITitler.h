// The service that this program offers to its siblings. Called in the GUI thread.
#pragma once

#include "messaging/services/TitlerDefine.h"

class ITitlerCallBack;

class ITitler
{
public:
    virtual ~ITitler() = default;

    // Where results go from now on; the callback is handed over.
    virtual void registerCallBack(ITitlerCallBack* callBack) = 0;
    virtual void showTitlerCreate(_CALL_TITLER_TYPE type) = 0;
    virtual void showTitlerEdit(_SHOW_TITLER_PARAMTER param) = 0;
    virtual void showDialogMaskWidget(bool show) = 0;
    virtual void showMessageMaskWidget(bool show) = 0;
};
