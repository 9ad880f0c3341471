#pragma once

#include "touchui/ITitlerAPPEventFilterController.h"

#include <QList>
#include <QPair>
#include <utility>

// Replaces the link to the locks of the other processes as long as it exists: keeps what is sent.
class FakeTitlerAPPEventFilterController : public ITitlerAPPEventFilterController
{
public:
    FakeTitlerAPPEventFilterController() { setInstance(this); }

    void initialize(TitlerToolFactory*) override {}
    void sendAPPEvent(APPEventDefine::LOCKTYPE type, bool on) override { sent.append({int(type), on}); }
    void informRestoreOriginal(APPEventDefine::EventRevicer receiver) override
    {
        informed.append(int(receiver));
    }

    // Returns the lock events since the last call.
    QList<QPair<int, bool>> take() { return std::exchange(sent, {}); }

    QList<QPair<int, bool>> sent;
    QList<int> informed; // who was asked to release their locks
};
