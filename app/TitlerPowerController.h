#pragma once

#include <QObject>

#include "app/ServiceLink.h"
#include "messaging/services/IPowerManager.h"

// The link to the power service. GUI thread.
class TitlerPowerController : public QObject, public IPowerManagerCallBack, public IPowerManagerNotify
{
    Q_OBJECT

public:
    static TitlerPowerController* getInstance();
    // Takes 5 seconds when connected, which is the time that the service needs to drop this client.
    static void clearInstance();

    void setFactory(TitlerToolFactory* factory);

    void getClientID(int id) override;
    void powerOff() override;
    void powerOn() override;

Q_SIGNALS:
    void signalPowerOn();
    void signalPowerOff();

private:
    TitlerPowerController() = default;
    ~TitlerPowerController() override;

    static TitlerPowerController* mInstance;

    ServiceLink<IPowerManager> m_link;
};
