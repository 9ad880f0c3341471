#include "app/ShowMessageController.h"

#include "support/LogManager.h"

#include <mutex>

namespace Titler_ShowMessage
{
std::mutex g_boostMutex;
}

ShowMessageController* ShowMessageController::mInstance = nullptr;

ShowMessageController* ShowMessageController::getInstance()
{
    const std::lock_guard lock(Titler_ShowMessage::g_boostMutex);
    if (!mInstance)
        mInstance = new ShowMessageController;
    return mInstance;
}

void ShowMessageController::clearInstance()
{
    delete mInstance;
    mInstance = nullptr;
}

ShowMessageController::ShowMessageController() = default;

ShowMessageController::~ShowMessageController() = default;

void ShowMessageController::setFactory(TitlerToolFactory* factory)
{
    if (!mLink.isConnected())
        LOG_DEBUG_OPERATE(L"ShowMessageController", 200, L"ShowMessageController::setFactory");
    mLink.connectTo(factory, this);
}

void ShowMessageController::setClientID(int id)
{
    mLink.clientIdCame(id, this);
}

void ShowMessageController::postMessage(MessageDef::Message_ID id)
{
    postMessage(id, -1, {});
}

void ShowMessageController::postMessage(MessageDef::Message_ID id, QString text)
{
    postMessage(id, -1, std::move(text));
}

void ShowMessageController::postMessage(MessageDef::Message_ID id, MessageDefine::_emBoxType boxType,
                                        QString text)
{
    if (!mLink)
        return;
    MessageDefine::_tagMessageParam param;
    param.clientId = mLink.clientId();
    param.boxType = boxType;
    param.text = text.toStdWString();
    param.messageId = id;
    mLink->postMessage(param);
}

void ShowMessageController::setMessageMainWindow(QWidget* window)
{
    if (window)
        mMainWindow = window;
}

bool ShowMessageController::GetTitlerIsTop()
{
    return mTitlerIsTop;
}

QMap<QString, QString> ShowMessageController::getMapData()
{
    return mMapData;
}

void ShowMessageController::closeMessage(MessageDefine::_emCloseType type)
{
    if (mLink)
        mLink->closeMessage({mLink.clientId(), type, mLastMessageId});
}

void ShowMessageController::changeTopWindow(MessageDefine::_emTopWindow top)
{
    if (mLink)
        mLink->setTopWindow({mLink.clientId(), top});
}

bool ShowMessageController::mainWindowIsShown() const
{
    return mMainWindow && !mMainWindow->isHidden();
}

void ShowMessageController::showDialogOpacityWidget()
{
    if (mainWindowIsShown())
        Q_EMIT signalsShowDialogMaskWidget(true);
}

void ShowMessageController::hideDialogOpacityWidget()
{
    Q_EMIT signalsShowDialogMaskWidget(false);
}

void ShowMessageController::showMessageOpacityWidget()
{
    if (mainWindowIsShown())
        Q_EMIT signalsShowMessageMaskWidget(true);
}

void ShowMessageController::hideMessageOpacityWidget()
{
    Q_EMIT signalsShowMessageMaskWidget(false);
}

void ShowMessageController::getTopWindowNotify(int top)
{
    mTitlerIsTop = top == MessageDefine::TOP_WINDOW_TITLER;
}

void ShowMessageController::postMessageNotify(MessageDefine::_tagMessageParam param)
{
    if (mTitlerIsTop)
        mLastMessageId = param.messageId;
}

void ShowMessageController::closeMessageNotify(MessageDefine::_tagCloseParam param)
{
    Q_EMIT signalCloseMessage(param);
}
