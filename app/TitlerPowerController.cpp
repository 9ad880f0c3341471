#include "app/TitlerPowerController.h"

#include "support/LogManager.h"

#include <mutex>
#include <unistd.h>

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
    if (!m_link || !m_link.isConnected())
        return;
    m_link->closeClient(m_link.clientId());
    ::sleep(DROP_CLIENT_SECONDS);
}

void TitlerPowerController::setFactory(TitlerToolFactory* factory)
{
    m_link.connectTo(factory, this);
}

void TitlerPowerController::getClientID(int id)
{
    m_link.clientIdCame(id, this);
}

void TitlerPowerController::powerOff()
{
    Q_EMIT signalPowerOff();
}

void TitlerPowerController::powerOn()
{
    Q_EMIT signalPowerOn();
}
