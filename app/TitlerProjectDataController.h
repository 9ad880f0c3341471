// The link to the project data service: loading a project may change the language. GUI thread.
#pragma once

#include <QObject>

#include "app/ServiceLink.h"
#include "messaging/services/IProjectDataManager.h"

class TitlerProjectDataController : public QObject,
                                    public IProjectDataManagerCallBack,
                                    public IProjectDataManagerNotify
{
    Q_OBJECT

public:
    static TitlerProjectDataController* getInstance();
    static void clearInstance();

    void setFactory(TitlerToolFactory* factory);

    void getClientID(int id) override;
    // Asks for the languages in the states 1 and 2, does nothing in any other.
    void loadNotify(int state) override;

private:
    TitlerProjectDataController() = default;
    ~TitlerProjectDataController() override;

    static TitlerProjectDataController* mInstance;

    ServiceLink<IProjectDataManager> mLink;
};
