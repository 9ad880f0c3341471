#include "app/TitlerProjectDataController.h"

#include "app/EarlyRequests.h"
#include "app/SystemSetupInfoController.h"
#include "app/TitlerToolFactory.h"

#include <mutex>

namespace
{
constexpr long SERVICE_ID = 76;
}

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

TitlerProjectDataController::~TitlerProjectDataController()
{
    if (mProxy && mConnected) {
        mProxy->unregisterCallBack(mClientId);
        mProxy->unregisterNotifyCallBack(mClientId);
    }
}

void TitlerProjectDataController::setFactory(TitlerToolFactory* factory)
{
    if (mConnected)
        return;
    mProxy = factory->createService<IProjectDataManager>(SERVICE_ID);
    if (!mProxy)
        return;
    EarlyRequests::getInstance()->expectClientId(SERVICE_ID);
    mProxy->registerCallBack(this);
}

void TitlerProjectDataController::getClientID(int id)
{
    mClientId = id;
    if (mProxy)
        mProxy->registerNotifyCallBack({this, id});
    mConnected = true;
    EarlyRequests::getInstance()->clientIdCame(SERVICE_ID);
}

void TitlerProjectDataController::loadNotify(int state)
{
    if (state == 1 || state == 2)
        SystemSetupInfoController::getInstance()->getLanguageInfo();
}
