#include "app/ShowMessageController.h"

#include "app/EarlyRequests.h"
#include "app/TitlerToolFactory.h"
#include "support/LogManager.h"

#include <mutex>

namespace
{
constexpr long SERVICE_ID = 65;
}

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

ShowMessageController::~ShowMessageController()
{
    if (mProxy && mConnected) {
        mProxy->unregisterCallBack(mClientId);
        mProxy->unregisterNotify(mClientId);
    }
}

void ShowMessageController::setFactory(TitlerToolFactory* factory)
{
    if (mConnected)
        return;
    LOG_DEBUG_OPERATE(L"ShowMessageController", 200, L"ShowMessageController::setFactory");
    mProxy = factory->createService<IMessageCenter>(SERVICE_ID);
    if (!mProxy)
        return;
    EarlyRequests::getInstance()->expectClientId(SERVICE_ID);
    mProxy->registerCallBack(this);
}

void ShowMessageController::setClientID(int id)
{
    mClientId = id;
    if (mProxy)
        mProxy->registerNotify({this, id});
    mConnected = true;
    EarlyRequests::getInstance()->clientIdCame(SERVICE_ID);
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
    if (!mProxy)
        return;
    MessageDefine::_tagMessageParam param;
    param.clientId = mClientId;
    param.boxType = boxType;
    param.text = text.toStdWString();
    param.messageId = id;
    mProxy->postMessage(param);
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
    if (mProxy)
        mProxy->closeMessage({mClientId, type, mLastMessageId});
}

void ShowMessageController::changeTopWindow(MessageDefine::_emTopWindow top)
{
    if (mProxy)
        mProxy->setTopWindow({mClientId, top});
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
