// Tells the rest of the appliance that a title changed. The storage code below the controllers reports
// through this, so that it need not know the service behind it.
#pragma once

#include "messaging/services/FileManagerDefine.h"

#include <QString>

class ITitleChangeReporter
{
public:
    virtual ~ITitleChangeReporter() = default;

    // path: full path of the title file. Called from any thread, worker threads included.
    virtual void changeTitlerStatus(FileManagerDefine::emTITLECHANGE_TYPE type, QString path) = 0;

    // The reporter in use, or null while no one listens. The caller of setInstance keeps the ownership, and
    // takes its reporter back with setInstance(nullptr) before it goes, when no worker saves titles any more.
    static ITitleChangeReporter* instance();
    static void setInstance(ITitleChangeReporter* reporter);
};
