#include "touchui/KSInputContext.h"

#include "support/LogManager.h"
#include "touchui/CanvasTextField.h"
#include "touchui/KSInputContextPlugin.h"
#include "touchui/KSInputFocusManager.h"
#include "touchui/ServiceKey.h"
#include "touchui/TypedTextLog.h"

#include <QApplication>
#include <QGraphicsView>
#include <QInputMethodEvent>
#include <QKeyEvent>
#include <QLineEdit>
#include <QScopedValueRollback>
#include <QtPlugin>

Q_IMPORT_PLUGIN(KSInputContextPlugin)

using SubCommonDefine::tagSoftKeyBoardInitData;
using SubCommonDefine::tagSoftKeyBoardKeyData;
using SubCommonDefine::tagSoftKeyBoardKeyTextSelectionPos;
using SubCommonDefine::taLimitInfo;

bool KSInputContext::m_bClosed = true;
QPointer<QWidget> KSInputContext::m_pFocusWidget;
QString KSInputContext::m_strLimitCondition;
QEvent KSInputContext::m_eKeyBoardClosed(static_cast<QEvent::Type>(KSInputContext::SoftKeyBoardCloseType));
KSInputContext* KSInputContext::s_instance = nullptr;

namespace
{

QString applicationName()
{
    const QCoreApplication* application = QCoreApplication::instance();
    return application == nullptr ? QString() : application->objectName();
}

// Returns whether the keyboard service alone decides if its window counts as open. True for this application.
bool serviceOwnsState()
{
    return applicationName() == QLatin1String("Titler");
}

// Describes the field of a widget, and keeps the pattern of its validator.
tagSoftKeyBoardInitData describe(QWidget* widget)
{
    const auto field = InputField::of(widget);
    const tagSoftKeyBoardInitData data = field == nullptr ? tagSoftKeyBoardInitData() : field->describe();
    KSInputContext::m_strLimitCondition = QString::fromStdWString(data.limitCondition);
    return data;
}

} // namespace

void KSInputContext::install()
{
    const QByteArray chosen = qgetenv("QT_IM_MODULE");
    if (chosen == KSInputContextPlugin::KEY)
        return;
    KSInputContextPlugin::setInnerMethod(QString::fromLocal8Bit(chosen));
    qputenv("QT_IM_MODULE", KSInputContextPlugin::KEY);
}

KSInputContext::KSInputContext(std::unique_ptr<QPlatformInputContext> inner)
    : m_inner(inner != nullptr ? std::move(inner) : std::make_unique<QPlatformInputContext>())
{
    if (s_instance == nullptr)
        s_instance = this;
    // The X11 platform finds the composing input method by this name and passes it the keyboard's context.
    setObjectName(m_inner->objectName());
    INIT_LOGGING(L"KS2Titler");
}

KSInputContext::~KSInputContext()
{
    if (s_instance == this) {
        s_instance = nullptr;
        m_bClosed = true;
        m_pFocusWidget.clear();
    }
    UNINIT_LOGGING();
}

void KSInputContext::setKeyBoardController(ISoftKeyBoardController* controller)
{
    m_controller = controller;
    if (m_controller == nullptr) {
        setClosed(true);
        resetFocusWidget();
    }
}

void KSInputContext::setClosed(bool closed)
{
    if (m_bClosed != closed) {
        m_bClosed = closed;
        emitInputPanelVisibleChanged();
    }
}

// --- Keys and requests of fields ----------------------------------------------------------------------

bool KSInputContext::filterEvent(const QEvent* event)
{
    switch (event->type()) {
    case QEvent::KeyPress:
        if (filterKeyPressEvent(event))
            return true;
        break;
    case QEvent::RequestSoftwareInputPanel:
        return filterRequestSoftwareInputPanel();
    case QEvent::CloseSoftwareInputPanel:
        return filterCloseSoftwareInputPanel();
    default:
        break;
    }
    return !isOpenAtService() && m_inner->filterEvent(event);
}

bool KSInputContext::forwardKeyPress(const QEvent* event)
{
    const auto key = ServiceKey::ofPress(event);
    if (m_controller == nullptr || !key)
        return false;
    if (!m_controller->isReachable()) {
        setClosed(true); // the service would not send the key back, so the field handles it
        return false;
    }
    m_controller->sendKey(*key);
    return true;
}

bool KSInputContext::filterSpecialKeyEvent(const QEvent* event) const
{
    return !m_bClosed && ServiceKey::isSpecial(event);
}

bool KSInputContext::filterRequestSoftwareInputPanel()
{
    if (getFocusWidget() == nullptr) {
        KSInputFocusManager::giveFocus(m_windowId);
        return false;
    }
    commit(); // keys go to the service from now on, so composed text would be lost
    return showForFocusWidget(getSendData());
}

bool KSInputContext::showForFocusWidget(const tagSoftKeyBoardInitData& data)
{
    if (m_controller == nullptr || !m_controller->isReachable())
        return false;
    if (m_bClosed)
        m_controller->registerCallBack(this);
    showAtService(data);
    return true;
}

bool KSInputContext::filterCloseSoftwareInputPanel()
{
    if (m_controller == nullptr)
        return false;
    const auto field = InputField::of(getFocusWidget());
    if (field == nullptr || !field->keepsKeyboard())
        closeSoftKeyBoardWindow();
    return true;
}

// --- Focus --------------------------------------------------------------------------------------------

void KSInputContext::setFocusWidget(QWidget* widget)
{
    if (!m_bClosed && !serviceOwnsState())
        return;
    KSInputFocusManager::giveFocus(widget);
    m_keyReleases.watch(widget);
    m_baseFocusWidget = widget;
}

QWidget* KSInputContext::getFocusWidget()
{
    if (m_bClosed || m_pFocusWidget == nullptr)
        m_pFocusWidget = m_baseFocusWidget;
    return m_pFocusWidget;
}

QGraphicsTextItem* KSInputContext::getFocusTextItem(QGraphicsView* view)
{
    return CanvasTextField::editedText(*view);
}

bool KSInputContext::isErrorForGettingFocusWidget()
{
    if (getFocusWidget() != nullptr)
        return false;
    LOG_DEBUG_OPERATE(L"KSInputContext", 200, L"no field has the focus");
    return true;
}

tagSoftKeyBoardInitData KSInputContext::getSendData()
{
    return describe(getFocusWidget());
}

tagSoftKeyBoardInitData KSInputContext::getSendData(QLineEdit* edit)
{
    return describe(edit);
}

// --- Keyboard window ----------------------------------------------------------------------------------

void KSInputContext::showSoftKeyBoardWindow(tagSoftKeyBoardInitData data)
{
    if (m_controller == nullptr)
        return;
    m_strLimitCondition = QString::fromStdWString(data.limitCondition);
    m_controller->registerCallBack(this);
    showAtService(data);
}

void KSInputContext::showAtService(const tagSoftKeyBoardInitData& data)
{
    m_controller->show(data);
    m_controller->closeLimitBalloon();
    setClosed(false);
}

void KSInputContext::closeSoftKeyBoardWindow()
{
    if (m_controller == nullptr)
        return;
    m_controller->close();
    resetFocusWidget();
    if (!serviceOwnsState())
        setClosed(true);
}

void KSInputContext::dummyCloseSoftKeyBoardWindow()
{
    closeAtOnce(&ISoftKeyBoardController::dummyClose);
}

void KSInputContext::simpleCloseSoftKeyBoardWindow()
{
    closeAtOnce(&ISoftKeyBoardController::simpleClose);
}

void KSInputContext::closeAtOnce(void (ISoftKeyBoardController::*close)())
{
    if (m_controller != nullptr)
        (m_controller->*close)();
    setClosed(true);
    resetFocusWidget();
}

void KSInputContext::showLimitInfo(taLimitInfo info)
{
    if (isOpenAtService())
        m_controller->sendLimitInfo(info);
}

void KSInputContext::cancelLimitInfo()
{
    if (isOpenAtService())
        m_controller->closeLimitBalloon();
}

void KSInputContext::showMaskOnSoftKeyboard()
{
    if (isOpenAtService())
        m_controller->showMask();
}

void KSInputContext::hideMaskOnSoftKeyboard()
{
    if (isOpenAtService())
        m_controller->hideMask();
}

void KSInputContext::setWindowID(unsigned long id)
{
    m_windowId = id;
    const QString text = QStringLiteral("App Name:%1***WID:%2").arg(applicationName()).arg(id);
    LOG_DEBUG_OPERATE(L"KSInputContext", 200, text.toStdWString());
}

// --- Calls of the service -----------------------------------------------------------------------------

void KSInputContext::handleInputString(const std::wstring& text, bool onEnter)
{
    const auto field = isErrorForGettingFocusWidget() ? nullptr : InputField::of(getFocusWidget());
    if (field == nullptr)
        return;
    if (onEnter || field->keepsKeyboard())
        field->enter(QString::fromStdWString(text));
    else
        checkInputString(*field, text);
}

void KSInputContext::sendInputStringOnTextChanged(std::wstring text)
{
    const auto field = isErrorForGettingFocusWidget() ? nullptr : InputField::of(getFocusWidget());
    if (field != nullptr)
        checkInputString(*field, text);
}

void KSInputContext::checkInputString(InputField& field, const std::wstring& text)
{
    if (!field.judge(QString::fromStdWString(text)))
        showLimitInfo(taLimitInfo());
}

void KSInputContext::sendKey(tagSoftKeyBoardKeyData data)
{
    if (isErrorForGettingFocusWidget()) {
        setClosed(true);
        return;
    }
    if (data.eventType == SoftKeyBoardCloseType) {
        sendSoftKeyBoardClosedEventToFocusWidget();
        return;
    }
    if (!ServiceKey::isKey(data))
        return;
    const QPointer<QWidget> widget = getFocusWidget();
    const auto entered = InputField::of(widget);
    const bool endsField = entered == nullptr || !entered->keepsKeyboard();
    if (data.key == Qt::Key_Enter && endsField && m_controller != nullptr && m_strLimitCondition.isEmpty()) {
        m_controller->close();
        setClosed(true);
    }
    const auto field = InputField::of(widget); // closing may have destroyed the field
    QObject* target = field == nullptr ? widget.data() : field->keyReceiver();
    if (target == nullptr)
        return;
    QKeyEvent key = ServiceKey::toEvent(data);
    if (key.type() == QEvent::KeyPress)
        TypedTextLog::write(key.text());
    const QScopedValueRollback<bool> sending(m_sendingKeyEvent, true);
    QCoreApplication::sendEvent(target, &key);
}

void KSInputContext::sendSoftKeyBoardClosedEventToFocusWidget()
{
    const auto field = InputField::of(getFocusWidget());
    QObject* target = field == nullptr ? nullptr : field->closeReceiver();
    setClosed(true);
    if (target != nullptr) {
        m_eKeyBoardClosed.setAccepted(true);
        QCoreApplication::sendEvent(target, &m_eKeyBoardClosed);
    }
}

void KSInputContext::sendInputStringSelectionPos(tagSoftKeyBoardKeyTextSelectionPos pos)
{
    if (m_bClosed)
        return;
    if (const auto field = InputField::of(getFocusWidget()))
        field->select(pos);
}

void KSInputContext::sendEvent(const QInputMethodEvent& event)
{
    commit();
    if (m_baseFocusWidget != nullptr) {
        const std::unique_ptr<QEvent> copy(event.clone());
        QCoreApplication::sendEvent(m_baseFocusWidget, copy.get());
    }
}

// --- Calls of Qt --------------------------------------------------------------------------------------

void KSInputContext::setXkbContext(struct xkb_context* context)
{
    QMetaObject::invokeMethod(m_inner.get(), "setXkbContext", Qt::DirectConnection,
                              Q_ARG(struct xkb_context*, context));
}

// Qt calls this after each click in a field and also after each key release. A key must not reopen a keyboard
// that the operator has closed.
void KSInputContext::showInputPanel()
{
    if (m_sendingKeyEvent || m_keyReleases.isReleasing())
        return;
    const QEvent request(QEvent::RequestSoftwareInputPanel);
    filterEvent(&request);
}

// Qt calls this when a field loses the focus, and also when Enter is pressed in it, which is handled where
// the key is delivered. The field is not ended if a window of another process, such as the keyboard, takes
// the focus.
void KSInputContext::hideInputPanel()
{
    const bool stillInField = m_pFocusWidget != nullptr && m_pFocusWidget->hasFocus();
    if (m_bClosed || stillInField || QGuiApplication::focusWindow() == nullptr)
        return;
    const QEvent request(QEvent::CloseSoftwareInputPanel);
    filterEvent(&request);
}

void KSInputContext::setFocusObject(QObject* object)
{
    m_inner->setFocusObject(object);
    setFocusWidget(InputField::takerOfText(object));
}

bool KSInputContext::event(QEvent* event)
{
    switch (event->type()) {
    case QEvent::RequestSoftwareInputPanel:
    case QEvent::CloseSoftwareInputPanel:
        return filterEvent(event);
    case QEvent::InputMethod:
        sendEvent(*static_cast<QInputMethodEvent*>(event));
        return true;
    default:
        return QPlatformInputContext::event(event);
    }
}
