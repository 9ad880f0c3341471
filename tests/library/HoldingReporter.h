#pragma once

#include "document/ITitleChangeReporter.h"

#include <QSemaphore>
#include <QString>

// Replaces the link to the file manager and blocks the picture thread at the end of each job.
class HoldingReporter : public ITitleChangeReporter
{
public:
    HoldingReporter() { setInstance(this); }
    ~HoldingReporter() override { setInstance(nullptr); }

    void changeTitlerStatus(FileManagerDefine::emTITLECHANGE_TYPE type, QString) override
    {
        if (type != FileManagerDefine::TITLE_PICTURES_CHANGED)
            return; // sent by the GUI thread, which must not be blocked
        reached.release();
        goOn.acquire();
    }

    QSemaphore reached; // released when the files of a job are written
    QSemaphore goOn;    // released by the test, once per job
};
