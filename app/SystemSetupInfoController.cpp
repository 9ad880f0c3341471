#include "app/SystemSetupInfoController.h"

#include "app/EarlyRequests.h"
#include "app/TitlerToolFactory.h"

#include <mutex>

namespace
{
constexpr long SERVICE_ID = 114;
}

namespace
{
std::mutex instanceMutex;
}

const int SystemSetupInfoController::DEFAULT_CLIENTID = -1;
SystemSetupInfoController* SystemSetupInfoController::mpInstance = nullptr;

SystemSetupInfoController* SystemSetupInfoController::getInstance()
{
    const std::lock_guard lock(instanceMutex);
    if (!mpInstance) {
        mpInstance = new SystemSetupInfoController;
        IInputLanguageSource::setInstance(mpInstance);
    }
    return mpInstance;
}

void SystemSetupInfoController::clearInstance()
{
    IInputLanguageSource::setInstance(nullptr);
    delete mpInstance;
    mpInstance = nullptr;
}

SystemSetupInfoController::~SystemSetupInfoController()
{
    if (mProxy && mConnected) {
        mProxy->unregisterCallBack(mClientId);
        mProxy->unregisterNotifyCallBack(mClientId);
    }
}

void SystemSetupInfoController::setFactory(TitlerToolFactory* factory)
{
    if (mConnected)
        return;
    mProxy = factory->createService<ISystemSetupManager>(SERVICE_ID);
    if (!mProxy)
        return;
    EarlyRequests::getInstance()->expectClientId(SERVICE_ID);
    mProxy->registerCallBack(this);
}

void SystemSetupInfoController::getClientID(int id)
{
    mClientId = id;
    if (mProxy)
        mProxy->registerNotifyCallBack({this, id});
    mConnected = true;
    getModuleInfo();
    getLanguageInfo();
    EarlyRequests::getInstance()->clientIdCame(SERVICE_ID);
}

void SystemSetupInfoController::getInputLanguage()
{
    Q_EMIT signalsInputLanguageInfo(
        static_cast<SystemSetupDef::emInputLanguageType>(mLanguage.inputLanguage));
}

void SystemSetupInfoController::getModuleInfo()
{
    if (mProxy)
        mProxy->getInformation(mClientId);
}

void SystemSetupInfoController::getLanguageInfo()
{
    if (mProxy)
        mProxy->getLanguageInfo(mClientId);
}

void SystemSetupInfoController::getLanguageInfoCallBack(SystemSetupDef::tagSystemLanguageParam param)
{
    mLanguage = param;
    getInputLanguage();
    Q_EMIT signalsSystemLanguageInfo(static_cast<SystemSetupDef::emSystemLanguageType>(param.systemLanguage));
}

void SystemSetupInfoController::getInformationCallBack(SystemSetupDef::tagSystemInformation information)
{
    Q_EMIT signalsSystemInfo(static_cast<SystemSetupDef::emInformationModel>(information.model));
}

void SystemSetupInfoController::setSystemLanguageNotify(int language)
{
    mLanguage.systemLanguage = language;
    Q_EMIT signalsSystemLanguageInfo(static_cast<SystemSetupDef::emSystemLanguageType>(language));
}

void SystemSetupInfoController::setInputLanguageNotify(int language)
{
    mLanguage.inputLanguage = language;
    getInputLanguage();
}
