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
    m_link.connectTo(factory, this);
}

void SystemSetupInfoController::getClientID(int id)
{
    m_link.clientIdCame(id, this, [this] {
        getModuleInfo();
        getLanguageInfo();
    });
}

void SystemSetupInfoController::getInputLanguage()
{
    Q_EMIT signalsInputLanguageInfo(
        static_cast<SystemSetupDef::emInputLanguageType>(m_language.inputLanguage));
}

void SystemSetupInfoController::getModuleInfo()
{
    if (m_link)
        m_link->getInformation(m_link.clientId());
}

void SystemSetupInfoController::getLanguageInfo()
{
    if (m_link)
        m_link->getLanguageInfo(m_link.clientId());
}

void SystemSetupInfoController::getLanguageInfoCallBack(SystemSetupDef::tagSystemLanguageParam param)
{
    m_language = param;
    getInputLanguage();
    Q_EMIT signalsSystemLanguageInfo(static_cast<SystemSetupDef::emSystemLanguageType>(param.systemLanguage));
}

void SystemSetupInfoController::getInformationCallBack(SystemSetupDef::tagSystemInformation information)
{
    Q_EMIT signalsSystemInfo(static_cast<SystemSetupDef::emInformationModel>(information.model));
}

void SystemSetupInfoController::setSystemLanguageNotify(int language)
{
    m_language.systemLanguage = language;
    Q_EMIT signalsSystemLanguageInfo(static_cast<SystemSetupDef::emSystemLanguageType>(language));
}

void SystemSetupInfoController::setInputLanguageNotify(int language)
{
    m_language.inputLanguage = language;
    getInputLanguage();
}
