// The object behind the service that this program offers: hands each call of a sibling to the controller that
// answers for it, those that show something through EarlyRequests. GUI thread.
#pragma once

#include "messaging/services/ITitler.h"

class EditContextController;
class ShowMessageController;

class Titler : public ITitler
{
public:
    Titler();

    void registerCallBack(ITitlerCallBack* callBack) override;
    void showTitlerCreate(_CALL_TITLER_TYPE type) override;
    void showTitlerEdit(_SHOW_TITLER_PARAMTER param) override;
    void showDialogMaskWidget(bool show) override;
    void showMessageMaskWidget(bool show) override;

private:
    EditContextController* mEditContext;
    ShowMessageController* mShowMessage;
};
