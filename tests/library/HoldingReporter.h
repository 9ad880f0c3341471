// Stands in for the file manager's link, and holds the picture thread at the end of each job.
#pragma once

#include "document/ITitleChangeReporter.h"

#include <QSemaphore>
#include <QString>

class HoldingReporter : public ITitleChangeReporter
{
public:
    HoldingReporter() { setInstance(this); }
    ~HoldingReporter() override { setInstance(nullptr); }

    void changeTitlerStatus(FileManagerDefine::emTITLECHANGE_TYPE type, QString) override
    {
        if (type != FileManagerDefine::TITLE_PICTURES_CHANGED)
            return; // of the GUI thread
        reached.release();
        goOn.acquire();
    }

    QSemaphore reached; // the files of a job are written
    QSemaphore goOn;    // released by the test, once a job
};
