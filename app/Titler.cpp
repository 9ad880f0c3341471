#include "app/Titler.h"

#include "app/EarlyRequests.h"
#include "app/EditContextController.h"
#include "app/ShowMessageController.h"

Titler::Titler()
    : m_editContext(EditContextController::getInstance()), m_showMessage(ShowMessageController::getInstance())
{
}

void Titler::registerCallBack(ITitlerCallBack* callBack)
{
    m_editContext->resultCallBack(callBack);
}

void Titler::showTitlerCreate(_CALL_TITLER_TYPE type)
{
    EarlyRequests::getInstance()->carryOut([this, type] { m_editContext->showTitlerCreate(type); });
}

void Titler::showTitlerEdit(_SHOW_TITLER_PARAMTER param)
{
    EarlyRequests::getInstance()->carryOut([this, param] { m_editContext->showTitlerEdit(param); });
}

void Titler::showDialogMaskWidget(bool show)
{
    EarlyRequests::getInstance()->carryOut([this, show] {
        if (show)
            m_showMessage->showDialogOpacityWidget();
        else
            m_showMessage->hideDialogOpacityWidget();
    });
}

void Titler::showMessageMaskWidget(bool show)
{
    EarlyRequests::getInstance()->carryOut([this, show] {
        if (show)
            m_showMessage->showMessageOpacityWidget();
        else
            m_showMessage->hideMessageOpacityWidget();
    });
}
