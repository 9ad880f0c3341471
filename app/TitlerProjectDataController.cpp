#include "app/TitlerProjectDataController.h"

#include "app/SystemSetupInfoController.h"

#include <mutex>

namespace
{
std::mutex instanceMutex;
}

TitlerProjectDataController* TitlerProjectDataController::mInstance = nullptr;

TitlerProjectDataController* TitlerProjectDataController::getInstance()
{
    const std::lock_guard lock(instanceMutex);
    if (!mInstance)
        mInstance = new TitlerProjectDataController;
    return mInstance;
}

void TitlerProjectDataController::clearInstance()
{
    delete mInstance;
    mInstance = nullptr;
}

TitlerProjectDataController::~TitlerProjectDataController() = default;

void TitlerProjectDataController::setFactory(TitlerToolFactory* factory)
{
    m_link.connectTo(factory, this);
}

void TitlerProjectDataController::getClientID(int id)
{
    m_link.clientIdCame(id, this);
}

void TitlerProjectDataController::loadNotify(int state)
{
    if (state == 1 || state == 2)
        SystemSetupInfoController::getInstance()->getLanguageInfo();
}
