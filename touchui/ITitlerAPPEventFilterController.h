#pragma once

#include "messaging/services/APPEventDefine.h"

#include <QObject>

class TitlerToolFactory;

// The way of the touch locks to the appliance's other processes. The application installs its controller with
// setInstance; until then, and after it was deleted, getInstance() is null and locks stay inside this
// process. Signals are emitted in the GUI thread.
class ITitlerAPPEventFilterController : public QObject
{
    Q_OBJECT
public:
    explicit ITitlerAPPEventFilterController(QObject* parent = nullptr);
    ~ITitlerAPPEventFilterController() override;

    static ITitlerAPPEventFilterController* getInstance();
    // Not owned.
    static void setInstance(ITitlerAPPEventFilterController* instance);

    virtual void initialize(TitlerToolFactory* factory) = 0;
    // Announces a lock of this process (LOCKTYPE_TOUCH) or the use of a transient control (LOCKTYPE_OBJECT).
    virtual void sendAPPEvent(APPEventDefine::LOCKTYPE type, bool on) = 0;
    // Asks the other processes to give way.
    virtual void informRestoreOriginal(APPEventDefine::EventRevicer receiver) = 0;

Q_SIGNALS:
    // Another process has locked or unlocked.
    void signalSendAPPEvent(APPEventDefine::_tagAPPEvent event);
    // Another process asks this one to give way: close what is open.
    void signalRestoreOriginal();
    void signalRestoreFocus();
};
