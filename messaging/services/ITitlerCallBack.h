// What a caller of ITitler is told.
#pragma once

#include "messaging/services/TitlerDefine.h"

class ITitlerCallBack
{
public:
    virtual ~ITitlerCallBack() = default;

    // The titles made in a create session. The record's data is valid during the call only.
    virtual void finishTitlerCreateCallback(_CALLBACK_TITLER_PARAMTER param) = 0;
};
