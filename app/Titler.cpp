#include "app/Titler.h"

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
    mEditContext->showTitlerCreate(type);
}

void Titler::showTitlerEdit(_SHOW_TITLER_PARAMTER param)
{
    mEditContext->showTitlerEdit(param);
}

void Titler::showDialogMaskWidget(bool show)
{
    if (show)
        mShowMessage->showDialogOpacityWidget();
    else
        mShowMessage->hideDialogOpacityWidget();
}

void Titler::showMessageMaskWidget(bool show)
{
    if (show)
        mShowMessage->showMessageOpacityWidget();
    else
        mShowMessage->hideMessageOpacityWidget();
}
