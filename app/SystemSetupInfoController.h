#pragma once

#include "app/ServiceLink.h"
#include "canvas/IInputLanguageSource.h"
#include "messaging/services/ISystemSetupManager.h"
#include "messaging/services/SystemSetupDef.h"

// The link to the system set-up service: requests the languages and the model of the appliance after
// connecting, and reports each change. GUI thread.
class SystemSetupInfoController : public IInputLanguageSource,
                                  public ISystemSetupManagerCallBack,
                                  public ISystemSetupManagerNotify
{
    Q_OBJECT

public:
    static const int DEFAULT_CLIENTID;

    static SystemSetupInfoController* getInstance();
    static void clearInstance();

    // Blocks until the main process listens. Does nothing if the client id was received before.
    void setFactory(TitlerToolFactory* factory);

    // Reports the last known input language again with signalsInputLanguageInfo().
    void getInputLanguage();
    void getModuleInfo();
    // Requests the languages; the answer arrives in getLanguageInfoCallBack().
    void getLanguageInfo();

    void getClientID(int id) override;
    void getLanguageInfoCallBack(SystemSetupDef::tagSystemLanguageParam param) override;
    void getInformationCallBack(SystemSetupDef::tagSystemInformation information) override;
    void setSystemLanguageNotify(int language) override;
    void setInputLanguageNotify(int language) override;

Q_SIGNALS:
    void signalsSystemLanguageInfo(SystemSetupDef::emSystemLanguageType language);
    void signalsSystemInfo(SystemSetupDef::emInformationModel model);

private:
    SystemSetupInfoController() = default;
    ~SystemSetupInfoController() override;

    static SystemSetupInfoController* mpInstance;

    ServiceLink<ISystemSetupManager> m_link;
    SystemSetupDef::tagSystemLanguageParam m_language;
};
