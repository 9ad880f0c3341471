#pragma once

#include "messaging/services/APPEventDefine.h"

#include <QObject>

class TitlerToolFactory;

// Exchanges touch lock events with the appliance's other processes. The application installs its controller
// with setInstance; before that, and after the controller was deleted, getInstance() is null and locks are
// local to this process. Signals are emitted in the GUI thread.
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
    // Announces a touch lock of this process (LOCKTYPE_TOUCH) or the use of a transient control
    // (LOCKTYPE_OBJECT).
    virtual void sendAPPEvent(APPEventDefine::LOCKTYPE type, bool on) = 0;
    // Asks the other processes to release their locks.
    virtual void informRestoreOriginal(APPEventDefine::EventRevicer receiver) = 0;

Q_SIGNALS:
    // Emitted when another process has locked or unlocked.
    void signalSendAPPEvent(APPEventDefine::_tagAPPEvent event);
    // Emitted when another process asks this one to close its transient controls.
    void signalRestoreOriginal();
    void signalRestoreFocus();
};
