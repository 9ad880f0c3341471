#include "app/ShowTitlerController.h"

#include "app/EarlyRequests.h"
#include "app/TitlerToolFactory.h"
#include "support/LogManager.h"

ShowTitlerController* ShowTitlerController::mInstance = nullptr;

ShowTitlerController* ShowTitlerController::getInstance()
{
    if (!mInstance)
        mInstance = new ShowTitlerController;
    return mInstance;
}

void ShowTitlerController::clearInstance()
{
    delete mInstance;
    mInstance = nullptr;
}

ShowTitlerController::ShowTitlerController()
{
    qRegisterMetaType<titler_paramter>("titler_paramter");
}

void ShowTitlerController::setFactory(TitlerToolFactory* factory)
{
    m_proxy = factory->createService<IShowTitlerController>();
    if (m_proxy)
        m_proxy->registerCallBack(this);
}

void ShowTitlerController::changeFolderStatus(SubCommonDefine::tagFOLDER_TYPE folder)
{
    LOG_DEBUG_OPERATE(L"ShowTitlerController", 200,
                      L"ShowTitlerController_changeFolderStatus() [setFolderStatus()] Path:" + folder.path);
    if (m_proxy)
        m_proxy->setFolderStatus(std::move(folder));
}

void ShowTitlerController::showTitler()
{
    EarlyRequests::getInstance()->carryOut([this] {
        Q_EMIT signalShowTitlerParameter({_titler_paramter::SUB_PANEL, {}});
    });
}
