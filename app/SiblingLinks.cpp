#include "app/SiblingLinks.h"

#include "app/EarlyRequests.h"
#include "app/EditContextController.h"
#include "app/EditTitlerController.h"
#include "app/ShowMessageController.h"
#include "app/ShowTitlerController.h"
#include "app/SystemSetupInfoController.h"
#include "app/TitlerAPPEventFilterController.h"
#include "app/TitlerPowerController.h"
#include "app/TitlerProjectDataController.h"
#include "app/TitlerToolFactory.h"
#include "messaging/services/ISoftKeyBoardController.h"
#include "touchui/KSInputContext.h"

#include <QCoreApplication>
#include <QEvent>
#include <new>

SiblingLinks::SiblingLinks()
{
    MessageBoxController::setProvider(
        []() -> MessageBoxController* { return ShowMessageController::getInstance(); },
        &ShowMessageController::clearInstance);
}

SiblingLinks::~SiblingLinks()
{
    EarlyRequests::clearInstance();
    ShowTitlerController::clearInstance();
    SystemSetupInfoController::clearInstance();
    ShowMessageController::clearInstance();
    TitlerPowerController::clearInstance();
    EditContextController::clearInstance();
    TitlerProjectDataController::clearInstance();
    TitlerAPPEventFilterController::clearInstance();
    if (m_inputContext)
        m_inputContext->setKeyBoardController(nullptr);
    MessageBoxController::setProvider(nullptr, nullptr);
}

void SiblingLinks::initProcessFactory()
{
    m_factory.reset(new (std::nothrow) TitlerToolFactory);
    // If the port cannot be bound, no request reaches the window, but the services of the siblings still
    // work.
    if (m_factory)
        m_factory->initialize();
}

void SiblingLinks::initProcessCommunications(WId window)
{
    if (!m_factory)
        return;
    linkSoftKeyboard(window);
    m_areMade = true;
    ShowTitlerController::getInstance()->setFactory(m_factory.get());
    SystemSetupInfoController::getInstance()->setFactory(m_factory.get());
    EditTitlerController::getInstance()->setFactory(m_factory.get());
    ShowMessageController::getInstance()->setFactory(m_factory.get());
    TitlerPowerController::getInstance()->setFactory(m_factory.get());
    TitlerProjectDataController::getInstance()->setFactory(m_factory.get());
    TitlerAPPEventFilterController::getInstance()->initialize(m_factory.get());
    sendAPPEvent(APPEventDefine::LOCKTYPE_OBJECT, false);
}

void SiblingLinks::linkSoftKeyboard(WId window)
{
    m_inputContext = KSInputContext::instance();
    auto* keyboard = m_factory->createService<ISoftKeyBoardController>();
    if (!m_inputContext)
        return;
    m_inputContext->setWindowID(window);
    if (keyboard)
        keyboard->registerCallBack(m_inputContext);
    m_inputContext->setKeyBoardController(keyboard);
}

bool SiblingLinks::postMessage(MessageDef::Message_ID id)
{
    if (m_areMade)
        ShowMessageController::getInstance()->postMessage(id);
    return m_areMade;
}

bool SiblingLinks::postMessage(MessageDef::Message_ID id, const QString& text)
{
    if (m_areMade)
        ShowMessageController::getInstance()->postMessage(id, text);
    return m_areMade;
}

void SiblingLinks::changeTopWindow(MessageDefine::_emTopWindow top)
{
    if (m_areMade)
        ShowMessageController::getInstance()->changeTopWindow(top);
}

void SiblingLinks::setMessageMainWindow(QWidget* window)
{
    if (m_areMade)
        ShowMessageController::getInstance()->setMessageMainWindow(window);
}

void SiblingLinks::editFolderStarts(const QString& folder)
{
    if (m_areMade && !folder.isEmpty())
        EditTitlerController::getInstance()->editFolderStartStatus(folder);
}

void SiblingLinks::editFolderEnds(const QString& folder)
{
    if (m_areMade && !folder.isEmpty())
        EditTitlerController::getInstance()->editFolderEndStatus(folder);
}

void SiblingLinks::sendTitleReports()
{
    if (m_areMade)
        QCoreApplication::sendPostedEvents(EditTitlerController::getInstance(), QEvent::MetaCall);
}

void SiblingLinks::sendAPPEvent(APPEventDefine::LOCKTYPE type, bool on)
{
    if (m_areMade)
        TitlerAPPEventFilterController::getInstance()->sendAPPEvent(type, on);
}

void SiblingLinks::getInputLanguage()
{
    if (m_areMade)
        SystemSetupInfoController::getInstance()->getInputLanguage();
}

void SiblingLinks::simpleCloseSoftKeyboard()
{
    if (m_inputContext)
        m_inputContext->simpleCloseSoftKeyBoardWindow();
}

void SiblingLinks::dummyCloseSoftKeyboard()
{
    if (m_inputContext)
        m_inputContext->dummyCloseSoftKeyBoardWindow();
}
