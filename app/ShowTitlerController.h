#pragma once

#include <QObject>

#include "app/TitlerParamter.h"
#include "messaging/services/IShowTitlerController.h"
#include "messaging/services/SubCommonDefine.h"

class TitlerToolFactory;

// Handles requests of the sub panel to show the window, which expect no result. GUI thread.
class ShowTitlerController : public QObject, public IShowTitlerControllerCallBack
{
    Q_OBJECT

public:
    static ShowTitlerController* getInstance();
    static void clearInstance();

    // Blocks until the sub panel process listens.
    void setFactory(TitlerToolFactory* factory);

    void changeFolderStatus(SubCommonDefine::tagFOLDER_TYPE folder);

    void showTitler() override;

Q_SIGNALS:
    void signalShowTitlerParameter(titler_paramter paramter);

private:
    ShowTitlerController();

    static ShowTitlerController* mInstance;

    IShowTitlerController* m_proxy = nullptr;
};
