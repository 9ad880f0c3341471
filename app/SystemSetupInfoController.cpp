#include "app/SystemSetupInfoController.h"

#include <mutex>

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

SystemSetupInfoController::~SystemSetupInfoController() = default;

void SystemSetupInfoController::setFactory(TitlerToolFactory* factory)
{
    mLink.connectTo(factory, this);
}

void SystemSetupInfoController::getClientID(int id)
{
    mLink.clientIdCame(id, this, [this] {
        getModuleInfo();
        getLanguageInfo();
    });
}

void SystemSetupInfoController::getInputLanguage()
{
    Q_EMIT signalsInputLanguageInfo(
        static_cast<SystemSetupDef::emInputLanguageType>(mLanguage.inputLanguage));
}

void SystemSetupInfoController::getModuleInfo()
{
    if (mLink)
        mLink->getInformation(mLink.clientId());
}

void SystemSetupInfoController::getLanguageInfo()
{
    if (mLink)
        mLink->getLanguageInfo(mLink.clientId());
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
