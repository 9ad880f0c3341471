#include "app/TitlerPowerController.h"

#include "app/EarlyRequests.h"
#include "app/TitlerToolFactory.h"
#include "support/LogManager.h"

#include <mutex>
#include <unistd.h>

namespace
{
constexpr long SERVICE_ID = 71;
}

namespace
{
std::mutex instanceMutex;
constexpr unsigned DROP_CLIENT_SECONDS = 5;
} // namespace

TitlerPowerController* TitlerPowerController::mInstance = nullptr;

TitlerPowerController* TitlerPowerController::getInstance()
{
    const std::lock_guard lock(instanceMutex);
    if (!mInstance)
        mInstance = new TitlerPowerController;
    return mInstance;
}

void TitlerPowerController::clearInstance()
{
    delete mInstance;
    mInstance = nullptr;
}

TitlerPowerController::~TitlerPowerController()
{
    LOG_EVENT(L"[TitlerPowerController][~TitlerPowerController]", 200, L" Titler closeClient", 6);
    if (!mProxy || !mConnected)
        return;
    mProxy->closeClient(mClientId);
    ::sleep(DROP_CLIENT_SECONDS);
    mProxy->unregisterCallBack(mClientId);
    mProxy->unregisterNotify(mClientId);
}

void TitlerPowerController::setFactory(TitlerToolFactory* factory)
{
    if (mConnected)
        return;
    mProxy = factory->createService<IPowerManager>(SERVICE_ID);
    if (!mProxy)
        return;
    EarlyRequests::getInstance()->expectClientId(SERVICE_ID);
    mProxy->registerCallBack(this);
}

void TitlerPowerController::getClientID(int id)
{
    mClientId = id;
    if (mProxy)
        mProxy->registerNotify({this, id});
    mConnected = true;
    EarlyRequests::getInstance()->clientIdCame(SERVICE_ID);
}

void TitlerPowerController::powerOff()
{
    Q_EMIT signalPowerOff();
}

void TitlerPowerController::powerOn()
{
    Q_EMIT signalPowerOn();
}
