// The link to the system set-up service: learns languages and model of the appliance right after connecting,
// and tells of each change. GUI thread.
#pragma once

#include "app/ServiceLink.h"
#include "canvas/IInputLanguageSource.h"
#include "messaging/services/ISystemSetupManager.h"
#include "messaging/services/SystemSetupDef.h"

class SystemSetupInfoController : public IInputLanguageSource,
                                  public ISystemSetupManagerCallBack,
                                  public ISystemSetupManagerNotify
{
    Q_OBJECT

public:
    static const int DEFAULT_CLIENTID;

    static SystemSetupInfoController* getInstance();
    static void clearInstance();

    // Blocks until the main process listens. Does nothing once the client id has arrived.
    void setFactory(TitlerToolFactory* factory);

    // Tells the last known input language again, by signalsInputLanguageInfo.
    void getInputLanguage();
    void getModuleInfo();
    // Asks for the languages; the answer arrives as getLanguageInfoCallBack.
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

    ServiceLink<ISystemSetupManager> mLink;
    SystemSetupDef::tagSystemLanguageParam mLanguage;
};
