#pragma once

#include "messaging/services/ITitler.h"

class EditContextController;
class ShowMessageController;

// Implements the service that this program offers: passes each call of a sibling process to the controller
// responsible, through EarlyRequests if the call shows something. GUI thread.
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
    EditContextController* m_editContext;
    ShowMessageController* m_showMessage;
};
