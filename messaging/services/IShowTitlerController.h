// The service that of the sub panel process asks for the titler.
//
// Calls are one-way and run in the caller's thread; answers come as calls on IShowTitlerControllerCallBack.
// Targets stay the caller's.
#pragma once

#include "messaging/services/SubCommonDefine.h"

class IShowTitlerControllerCallBack;

class IShowTitlerController
{
public:
    virtual ~IShowTitlerController() = default;

    virtual void setFolderStatus(SubCommonDefine::tagFOLDER_TYPE folder) = 0;
    virtual void registerCallBack(IShowTitlerControllerCallBack* target) = 0;
};
