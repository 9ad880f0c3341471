#pragma once

#include "messaging/services/FileManagerDefine.h"

#include <QString>

// Reports to the rest of the appliance that a title has changed. The storage code uses this interface so that
// it does not depend on the service behind it.
class ITitleChangeReporter
{
public:
    virtual ~ITitleChangeReporter() = default;

    // path is the full path of the title file. Called from any thread, including worker threads.
    virtual void changeTitlerStatus(FileManagerDefine::emTITLECHANGE_TYPE type, QString path) = 0;

    // Returns the current reporter, or null if there is none. The caller of setInstance keeps ownership; it
    // must call setInstance(nullptr) before it deletes the reporter, when no worker saves titles any more.
    static ITitleChangeReporter* instance();
    static void setInstance(ITitleChangeReporter* reporter);
};
