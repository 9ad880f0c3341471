#pragma once

#include <QObject>

#include "app/ServiceLink.h"
#include "messaging/services/IProjectDataManager.h"

// The link to the project data service: the language may change when a project is loaded. GUI thread.
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
    // Requests the languages in the states 1 and 2; does nothing in any other state.
    void loadNotify(int state) override;

private:
    TitlerProjectDataController() = default;
    ~TitlerProjectDataController() override;

    static TitlerProjectDataController* mInstance;

    ServiceLink<IProjectDataManager> m_link;
};
