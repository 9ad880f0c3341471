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
    if (!m_link.isConnected())
        LOG_DEBUG_OPERATE(L"ShowMessageController", 200, L"ShowMessageController::setFactory");
    m_link.connectTo(factory, this);
}

void ShowMessageController::setClientID(int id)
{
    m_link.clientIdCame(id, this);
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
    if (!m_link)
        return;
    MessageDefine::_tagMessageParam param;
    param.clientId = m_link.clientId();
    param.boxType = boxType;
    param.text = text.toStdWString();
    param.messageId = id;
    m_link->postMessage(param);
}

void ShowMessageController::setMessageMainWindow(QWidget* window)
{
    if (window)
        m_mainWindow = window;
}

bool ShowMessageController::GetTitlerIsTop()
{
    return m_titlerIsTop;
}

QMap<QString, QString> ShowMessageController::getMapData()
{
    return m_mapData;
}

void ShowMessageController::closeMessage(MessageDefine::_emCloseType type)
{
    if (m_link)
        m_link->closeMessage({m_link.clientId(), type, m_lastMessageId});
}

void ShowMessageController::changeTopWindow(MessageDefine::_emTopWindow top)
{
    if (m_link)
        m_link->setTopWindow({m_link.clientId(), top});
}

bool ShowMessageController::mainWindowIsShown() const
{
    return m_mainWindow && !m_mainWindow->isHidden();
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
    m_titlerIsTop = top == MessageDefine::TOP_WINDOW_TITLER;
}

void ShowMessageController::postMessageNotify(MessageDefine::_tagMessageParam param)
{
    if (m_titlerIsTop)
        m_lastMessageId = param.messageId;
}

void ShowMessageController::closeMessageNotify(MessageDefine::_tagCloseParam param)
{
    Q_EMIT signalCloseMessage(param);
}
