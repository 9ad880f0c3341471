#include "app/Titler.h"

#include "app/EarlyRequests.h"
#include "app/EditContextController.h"
#include "app/ShowMessageController.h"

Titler::Titler()
    : mEditContext(EditContextController::getInstance()), mShowMessage(ShowMessageController::getInstance())
{
}

void Titler::registerCallBack(ITitlerCallBack* callBack)
{
    mEditContext->resultCallBack(callBack);
}

void Titler::showTitlerCreate(_CALL_TITLER_TYPE type)
{
    EarlyRequests::getInstance()->carryOut([this, type] { mEditContext->showTitlerCreate(type); });
}

void Titler::showTitlerEdit(_SHOW_TITLER_PARAMTER param)
{
    EarlyRequests::getInstance()->carryOut([this, param] { mEditContext->showTitlerEdit(param); });
}

void Titler::showDialogMaskWidget(bool show)
{
    EarlyRequests::getInstance()->carryOut([this, show] {
        if (show)
            mShowMessage->showDialogOpacityWidget();
        else
            mShowMessage->hideDialogOpacityWidget();
    });
}

void Titler::showMessageMaskWidget(bool show)
{
    EarlyRequests::getInstance()->carryOut([this, show] {
        if (show)
            mShowMessage->showMessageOpacityWidget();
        else
            mShowMessage->hideMessageOpacityWidget();
    });
}
