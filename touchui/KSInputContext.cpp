#include "touchui/KSInputContext.h"

#include "support/LogManager.h"
#include "touchui/KSInputContextPlugin.h"
#include "touchui/KSInputFocusManager.h"
#include "touchui/KSSoftKeyboardCursorSettingEvent.h"

#include <QApplication>
#include <QComboBox>
#include <QGraphicsItem>
#include <QGraphicsTextItem>
#include <QGraphicsView>
#include <QInputMethodEvent>
#include <QKeyEvent>
#include <QLineEdit>
#include <QRegularExpressionValidator>
#include <QScopedValueRollback>
#include <QtPlugin>

#include <algorithm>

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

constexpr int CANVAS_TEXT_ITEM_TYPE = QGraphicsItem::UserType + 10;
constexpr int UNLIMITED_LENGTH = 32767; // what QLineEdit starts with
constexpr int LINE_EDIT_FIELD = 1;

// In this application the keyboard service alone says whether its window is up.
bool serviceOwnsState()
{
    return QCoreApplication::instance() != nullptr &&
           QCoreApplication::instance()->objectName() == QLatin1String("Titler");
}

void setNumber(int& field, const QString& text)
{
    bool ok = false;
    const int number = text.toInt(&ok);
    if (ok) {
        field = number;
    }
}

// "<keyboard type>#<title>#<selection mode>#<last value>"; two, three, four or more parts.
void readFieldName(const QString& name, tagSoftKeyBoardInitData& data)
{
    const QStringList parts = name.split(QLatin1Char('#'));
    if (parts.size() < 2) {
        return;
    }
    setNumber(data.keyboardType, parts.at(0));
    data.title = parts.at(1).toStdWString();
    if (parts.size() == 3) {
        data.selectionMode = 2;
    } else if (parts.size() >= 4) {
        setNumber(data.selectionMode, parts.at(2));
        setNumber(data.lastValue, parts.at(3));
    }
}

// The eleven fields of the record; the text in their middle may hold the separator itself.
bool readRecordName(const QString& name, tagSoftKeyBoardInitData& data)
{
    constexpr int FIELDS = 11;
    constexpr int BEFORE_TEXT = 4;
    constexpr int AFTER_TEXT = FIELDS - BEFORE_TEXT - 1;
    const QStringList parts = name.split(QLatin1Char('#'));
    if (parts.size() < FIELDS) {
        return false;
    }
    const qsizetype after = parts.size() - AFTER_TEXT;
    setNumber(data.fieldKind, parts.at(0));
    data.title = parts.at(1).toStdWString();
    setNumber(data.keyboardType, parts.at(2));
    setNumber(data.maxLength, parts.at(3));
    data.text = parts.mid(BEFORE_TEXT, after - BEFORE_TEXT).join(QLatin1Char('#')).toStdWString();
    setNumber(data.textLength, parts.at(after));
    setNumber(data.selectionStart, parts.at(after + 1));
    setNumber(data.selectionEnd, parts.at(after + 2));
    setNumber(data.selectionMode, parts.at(after + 3));
    data.limitCondition = parts.at(after + 4).toStdWString();
    setNumber(data.lastValue, parts.at(after + 5));
    return true;
}

QString patternOf(const QLineEdit* edit)
{
    const auto* validator = qobject_cast<const QRegularExpressionValidator*>(edit->validator());
    return validator == nullptr ? QString() : validator->regularExpression().pattern();
}

tagSoftKeyBoardInitData describe(const QLineEdit* edit)
{
    tagSoftKeyBoardInitData data;
    data.fieldKind = LINE_EDIT_FIELD;
    readFieldName(edit->objectName(), data);
    if (edit->maxLength() < UNLIMITED_LENGTH) {
        data.maxLength = edit->maxLength();
    }
    data.text = edit->text().toStdWString();
    data.textLength = static_cast<int>(edit->text().size());
    data.selectionStart = edit->selectionStart();
    data.selectionEnd = data.selectionStart + static_cast<int>(edit->selectedText().size());
    data.limitCondition = patternOf(edit).toStdWString();
    return data;
}

tagSoftKeyBoardInitData describe(const QGraphicsTextItem* item)
{
    tagSoftKeyBoardInitData data;
    if (!readRecordName(item->objectName(), data)) {
        readFieldName(item->objectName(), data);
    }
    return data;
}

QLineEdit* lineEditOf(QWidget* widget)
{
    if (auto* box = qobject_cast<QComboBox*>(widget)) {
        return box->lineEdit();
    }
    return qobject_cast<QLineEdit*>(widget);
}

// An entry is one line, and keys such as Enter and Backspace bring signs that are no text.
void logTypedText(QString text)
{
    const auto isControl = [](QChar sign) { return sign.category() == QChar::Other_Control; };
    if (!std::all_of(text.cbegin(), text.cend(), isControl)) {
        std::replace_if(text.begin(), text.end(), isControl, QLatin1Char(' '));
        LOG_USER_OPERATE(L"Text Input", 200, text.toStdWString());
    }
}

} // namespace

void KSInputContext::install()
{
    const QByteArray chosen = qgetenv("QT_IM_MODULE");
    if (chosen == KSInputContextPlugin::KEY) {
        return;
    }
    KSInputContextPlugin::setInnerMethod(QString::fromLocal8Bit(chosen));
    qputenv("QT_IM_MODULE", KSInputContextPlugin::KEY);
}

KSInputContext* KSInputContext::instance()
{
    return s_instance;
}

KSInputContext::KSInputContext(std::unique_ptr<QPlatformInputContext> inner) : m_inner(std::move(inner))
{
    if (s_instance == nullptr) {
        s_instance = this;
    }
    if (m_inner != nullptr) {
        // The X11 platform looks for the method that composes by its name, to hand it the keyboard's context.
        setObjectName(m_inner->objectName());
    }
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

QString KSInputContext::identifierName() const
{
    return QStringLiteral("KSInputContext");
}

QString KSInputContext::language() const
{
    return QString();
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

// The keys and the requests of fields.

bool KSInputContext::filterEvent(const QEvent* event)
{
    switch (event->type()) {
    case QEvent::KeyPress:
        if (filterKeyPressEvent(event)) {
            return true;
        }
        break;
    case QEvent::RequestSoftwareInputPanel:
        return filterRequestSoftwareInputPanel();
    case QEvent::CloseSoftwareInputPanel:
        return filterCloseSoftwareInputPanel();
    default:
        break;
    }
    const bool serviceTakesKeys = m_controller != nullptr && !m_bClosed;
    return m_inner != nullptr && !serviceTakesKeys && m_inner->filterEvent(event);
}

bool KSInputContext::filterKeyPressEvent(const QEvent* event)
{
    return !m_bClosed && forwardKeyPress(event);
}

bool KSInputContext::forwardKeyPress(const QEvent* event)
{
    if (m_controller == nullptr || event->type() != QEvent::KeyPress) {
        return false;
    }
    if (!m_controller->isReachable()) {
        setClosed(true); // nobody would send the key back: the field takes it as it is
        return false;
    }
    const auto* key = static_cast<const QKeyEvent*>(event);
    tagSoftKeyBoardKeyData data;
    data.eventType = key->type();
    data.key = key->key();
    data.modifiers = static_cast<int>(key->modifiers());
    data.text = key->text().toStdWString();
    data.autoRepeat = key->isAutoRepeat();
    data.nativeVirtualKey = static_cast<int>(key->nativeVirtualKey());
    m_controller->sendKey(data);
    return true;
}

bool KSInputContext::filterSpecialKeyEvent(const QEvent* event) const
{
    if (m_bClosed || (event->type() != QEvent::KeyPress && event->type() != QEvent::KeyRelease)) {
        return false;
    }
    const int key = static_cast<const QKeyEvent*>(event)->key();
    switch (key) {
    case Qt::Key_Tab:
    case Qt::Key_Space:
    case Qt::Key_Home:
    case Qt::Key_End:
    case Qt::Key_PageUp:
    case Qt::Key_PageDown:
        return true;
    default:
        return key >= Qt::Key_F1 && key <= Qt::Key_F12;
    }
}

bool KSInputContext::filterRequestSoftwareInputPanel()
{
    if (getFocusWidget() == nullptr) {
        KSInputFocusManager::giveFocus(m_windowId);
        return false;
    }
    commit(); // keys go to the service from now on; what was being composed must not be lost
    return showForFocusWidget(getSendData());
}

bool KSInputContext::showForFocusWidget(const tagSoftKeyBoardInitData& data)
{
    if (m_controller == nullptr || !m_controller->isReachable()) {
        return false;
    }
    if (m_bClosed) {
        m_controller->registerCallBack(this);
    }
    m_controller->show(data);
    m_controller->closeLimitBalloon();
    setClosed(false);
    return true;
}

bool KSInputContext::filterCloseSoftwareInputPanel()
{
    if (m_controller == nullptr) {
        return false;
    }
    // The text editor of the canvas keeps the keyboard through changes of focus.
    if (qobject_cast<QGraphicsView*>(getFocusWidget()) == nullptr) {
        closeSoftKeyBoardWindow();
    }
    return true;
}

// The focus.

void KSInputContext::setFocusWidget(QWidget* widget)
{
    if (!m_bClosed && !serviceOwnsState()) {
        return;
    }
    KSInputFocusManager::giveFocus(widget);
    if (m_baseFocusWidget != widget) {
        if (m_baseFocusWidget != nullptr) {
            m_baseFocusWidget->removeEventFilter(this);
        }
        if (widget != nullptr) {
            widget->installEventFilter(this);
        }
        m_baseFocusWidget = widget;
    }
}

void KSInputContext::resetFocusWidget()
{
    m_pFocusWidget.clear();
}

QWidget* KSInputContext::getFocusWidget()
{
    if (m_bClosed || m_pFocusWidget == nullptr) {
        m_pFocusWidget = m_baseFocusWidget;
    }
    return m_pFocusWidget;
}

QGraphicsTextItem* KSInputContext::getFocusTextItem(QGraphicsView* view)
{
    const QList<QGraphicsItem*> items = view->items();
    for (QGraphicsItem* item : items) {
        if (item->type() != CANVAS_TEXT_ITEM_TYPE || item->parentItem() == nullptr || !item->isEnabled()) {
            continue;
        }
        auto* text = qobject_cast<QGraphicsTextItem*>(item->toGraphicsObject());
        if (text != nullptr && text->textInteractionFlags() == Qt::TextEditorInteraction) {
            return text;
        }
    }
    return nullptr;
}

bool KSInputContext::isErrorForGettingFocusWidget()
{
    if (getFocusWidget() != nullptr) {
        return false;
    }
    LOG_DEBUG_OPERATE(L"KSInputContext", 200, L"no field has the focus");
    return true;
}

tagSoftKeyBoardInitData KSInputContext::getSendData()
{
    QWidget* widget = getFocusWidget();
    if (auto* view = qobject_cast<QGraphicsView*>(widget)) {
        return getSendData(getFocusTextItem(view));
    }
    return getSendData(lineEditOf(widget));
}

tagSoftKeyBoardInitData KSInputContext::getSendData(QLineEdit* edit)
{
    if (edit == nullptr) {
        m_strLimitCondition.clear();
        return {};
    }
    m_strLimitCondition = patternOf(edit);
    return describe(edit);
}

tagSoftKeyBoardInitData KSInputContext::getSendData(QGraphicsTextItem* item)
{
    const tagSoftKeyBoardInitData data = item == nullptr ? tagSoftKeyBoardInitData() : describe(item);
    m_strLimitCondition = QString::fromStdWString(data.limitCondition);
    return data;
}

// The keyboard window.

void KSInputContext::showSoftKeyBoardWindow(tagSoftKeyBoardInitData data)
{
    if (m_controller == nullptr) {
        return;
    }
    m_strLimitCondition = QString::fromStdWString(data.limitCondition);
    m_controller->registerCallBack(this);
    m_controller->show(data);
    m_controller->closeLimitBalloon();
    setClosed(false);
}

void KSInputContext::closeSoftKeyBoardWindow()
{
    if (m_controller == nullptr) {
        return;
    }
    m_controller->close();
    resetFocusWidget();
    if (!serviceOwnsState()) {
        setClosed(true);
    }
}

void KSInputContext::dummyCloseSoftKeyBoardWindow()
{
    if (m_controller != nullptr) {
        m_controller->dummyClose();
    }
    setClosed(true);
    resetFocusWidget();
}

void KSInputContext::simpleCloseSoftKeyBoardWindow()
{
    if (m_controller != nullptr) {
        m_controller->simpleClose();
    }
    setClosed(true);
    resetFocusWidget();
}

void KSInputContext::showLimitInfo(taLimitInfo info)
{
    if (m_controller != nullptr && !m_bClosed) {
        m_controller->sendLimitInfo(info);
    }
}

void KSInputContext::cancelLimitInfo()
{
    if (m_controller != nullptr && !m_bClosed) {
        m_controller->closeLimitBalloon();
    }
}

void KSInputContext::showMaskOnSoftKeyboard()
{
    if (m_controller != nullptr && !m_bClosed) {
        m_controller->showMask();
    }
}

void KSInputContext::hideMaskOnSoftKeyboard()
{
    if (m_controller != nullptr && !m_bClosed) {
        m_controller->hideMask();
    }
}

void KSInputContext::setWindowID(unsigned long id)
{
    m_windowId = id;
    const QString name =
        QCoreApplication::instance() == nullptr ? QString() : QCoreApplication::instance()->objectName();
    const QString text = QStringLiteral("App Name:%1***WID:%2").arg(name).arg(id);
    LOG_DEBUG_OPERATE(L"KSInputContext", 200, text.toStdWString());
}

// What the service sends.

void KSInputContext::sendInputString(std::wstring text)
{
    handleInputString(text, false);
}

void KSInputContext::sendInputStringOnEnterPressing(std::wstring text)
{
    handleInputString(text, true);
}

void KSInputContext::handleInputString(const std::wstring& text, bool onEnter)
{
    if (isErrorForGettingFocusWidget()) {
        return;
    }
    const QString string = QString::fromStdWString(text);
    if (auto* view = qobject_cast<QGraphicsView*>(getFocusWidget())) {
        handleInputStringOfQGraphicsView(view, string);
    }
    if (auto* edit = qobject_cast<QLineEdit*>(getFocusWidget())) {
        handleInputStringOfQLineEdit(edit, string, onEnter);
    }
    if (auto* box = qobject_cast<QComboBox*>(getFocusWidget())) {
        handleInputStringOfQCombobox(box, string, onEnter);
    }
}

void KSInputContext::handleInputStringOfQGraphicsView(QGraphicsView* view, const QString& text)
{
    if (QGraphicsTextItem* item = getFocusTextItem(view)) {
        logTypedText(text);
        QTextCursor cursor = item->textCursor();
        cursor.insertText(text);
    }
}

void KSInputContext::handleInputStringOfQLineEdit(QLineEdit* edit, const QString& text, bool onEnter)
{
    if (!onEnter) {
        checkInputString(edit, text);
        return;
    }
    logTypedText(text);
    edit->selectAll();
    edit->insert(text);
    edit->end(false);
}

void KSInputContext::handleInputStringOfQCombobox(QComboBox* box, const QString& text, bool onEnter)
{
    if (box->lineEdit() != nullptr) {
        handleInputStringOfQLineEdit(box->lineEdit(), text, onEnter);
    }
}

// Lets the field's validator, and whoever listens to it, judge a text that is still being typed. The field
// itself is not touched before Enter.
void KSInputContext::checkInputString(QLineEdit* edit, const QString& text)
{
    if (edit->validator() == nullptr) {
        showLimitInfo(taLimitInfo());
        return;
    }
    QLineEdit scratch;
    scratch.setValidator(edit->validator());
    scratch.insert(text);
}

void KSInputContext::sendInputStringOnTextChanged(std::wstring text)
{
    if (isErrorForGettingFocusWidget()) {
        return;
    }
    if (QLineEdit* edit = lineEditOf(getFocusWidget())) {
        checkInputString(edit, QString::fromStdWString(text));
    }
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
    if (data.eventType != QEvent::KeyPress && data.eventType != QEvent::KeyRelease) {
        return; // no other event may be made into a key event
    }
    QPointer<QWidget> widget = getFocusWidget();
    if (data.key == Qt::Key_Enter && qobject_cast<QGraphicsView*>(widget) == nullptr &&
        m_controller != nullptr && m_strLimitCondition.isEmpty()) {
        m_controller->close();
        setClosed(true);
    }
    QLineEdit* edit = lineEditOf(widget);
    QWidget* target = edit != nullptr ? edit : widget.data();
    if (target == nullptr) {
        return;
    }
    QKeyEvent key(static_cast<QEvent::Type>(data.eventType), data.key,
                  Qt::KeyboardModifiers::fromInt(data.modifiers), QString::fromStdWString(data.text), false,
                  1);
    if (key.type() == QEvent::KeyPress) {
        logTypedText(key.text());
    }
    {
        const QScopedValueRollback<bool> sending(m_sendingKeyEvent, true);
        QCoreApplication::sendEvent(target, &key);
    }
}

void KSInputContext::sendSoftKeyBoardClosedEventToFocusWidget()
{
    QWidget* widget = getFocusWidget();
    QObject* target = nullptr;
    if (auto* view = qobject_cast<QGraphicsView*>(widget)) {
        target = getFocusTextItem(view);
    } else if (auto* edit = qobject_cast<QLineEdit*>(widget)) {
        target = edit;
    } else if (auto* box = qobject_cast<QComboBox*>(widget)) {
        target = box->lineEdit() == nullptr ? nullptr : box->lineEdit()->parent();
    }
    setClosed(true);
    if (target != nullptr) {
        m_eKeyBoardClosed.setAccepted(true);
        QCoreApplication::sendEvent(target, &m_eKeyBoardClosed);
    }
}

void KSInputContext::sendInputStringSelectionPos(tagSoftKeyBoardKeyTextSelectionPos pos)
{
    if (m_bClosed || getFocusWidget() == nullptr) {
        return;
    }
    if (auto* view = qobject_cast<QGraphicsView*>(getFocusWidget())) {
        if (QGraphicsTextItem* item = getFocusTextItem(view)) {
            KSSoftKeyboardCursorSettingEvent event(pos.begin, pos.end, pos.current, pos.mode);
            QCoreApplication::sendEvent(item, &event);
        }
    } else if (QLineEdit* edit = lineEditOf(getFocusWidget())) {
        setCursorSelection(pos, edit);
    }
}

void KSInputContext::setCursorSelection(const tagSoftKeyBoardKeyTextSelectionPos& pos, QLineEdit* edit)
{
    const int length = static_cast<int>(edit->text().size());
    const int begin = std::clamp(pos.begin, 0, length);
    const int end = std::clamp(pos.end, 0, length);
    switch (pos.mode) {
    case 0:
        edit->deselect();
        edit->setCursorPosition(std::clamp(pos.current, 0, length));
        break;
    case 1:
        edit->setSelection(begin, end - begin);
        break;
    case 2:
        edit->selectAll();
        break;
    default:
        break;
    }
}

void KSInputContext::sendSoftKeyboardState(bool shown)
{
    setClosed(!shown);
}

void KSInputContext::sendEvent(const QInputMethodEvent& event)
{
    commit();
    if (m_baseFocusWidget != nullptr) {
        const std::unique_ptr<QEvent> copy(event.clone());
        QCoreApplication::sendEvent(m_baseFocusWidget, copy.get());
    }
}

// What Qt calls.

bool KSInputContext::isValid() const
{
    return true;
}

bool KSInputContext::hasCapability(Capability capability) const
{
    return m_inner == nullptr || m_inner->hasCapability(capability);
}

void KSInputContext::reset()
{
    if (m_inner != nullptr) {
        m_inner->reset();
    }
}

void KSInputContext::commit()
{
    if (m_inner != nullptr) {
        m_inner->commit();
    }
}

void KSInputContext::update(Qt::InputMethodQueries queries)
{
    if (m_inner != nullptr) {
        m_inner->update(queries);
    }
}

void KSInputContext::setXkbContext(struct xkb_context* context)
{
    if (m_inner != nullptr) {
        QMetaObject::invokeMethod(m_inner.get(), "setXkbContext", Qt::DirectConnection,
                                  Q_ARG(struct xkb_context*, context));
    }
}

void KSInputContext::invokeAction(QInputMethod::Action action, int cursorPosition)
{
    if (m_inner != nullptr) {
        m_inner->invokeAction(action, cursorPosition);
    }
}

// Qt asks after each click, and also after each key release, in a field. Keys must not bring back a keyboard
// that the operator has put away, and need not show one that is up.
void KSInputContext::showInputPanel()
{
    if (m_sendingKeyEvent || m_keyReleased) {
        return;
    }
    const QEvent request(QEvent::RequestSoftwareInputPanel);
    filterEvent(&request);
}

// Qt asks when a field loses the focus, and also when Enter is pressed in it, which is decided where the key
// is delivered. A window of another process that takes the focus, such as the keyboard itself, does not end
// the field.
void KSInputContext::hideInputPanel()
{
    const bool stillInField = m_pFocusWidget != nullptr && m_pFocusWidget->hasFocus();
    if (m_bClosed || stillInField || QGuiApplication::focusWindow() == nullptr) {
        return;
    }
    const QEvent request(QEvent::CloseSoftwareInputPanel);
    filterEvent(&request);
}

// Watches the field for what its requests come from.
bool KSInputContext::eventFilter(QObject* object, QEvent* event)
{
    switch (event->type()) {
    case QEvent::KeyRelease:
        m_keyReleased = true;
        QMetaObject::invokeMethod(
            this, [this] { m_keyReleased = false; }, Qt::QueuedConnection);
        break;
    case QEvent::KeyPress:
    case QEvent::MouseButtonPress:
    case QEvent::MouseButtonRelease:
    case QEvent::TouchBegin:
    case QEvent::TouchEnd:
        m_keyReleased = false;
        break;
    default:
        break;
    }
    return QPlatformInputContext::eventFilter(object, event);
}

bool KSInputContext::isInputPanelVisible() const
{
    return !m_bClosed;
}

void KSInputContext::setFocusObject(QObject* object)
{
    if (m_inner != nullptr) {
        m_inner->setFocusObject(object);
    }
    auto* widget = qobject_cast<QWidget*>(object);
    const bool takesText = widget != nullptr && (widget->testAttribute(Qt::WA_InputMethodEnabled) ||
                                                 qobject_cast<QGraphicsView*>(widget) != nullptr);
    setFocusWidget(takesText ? widget : nullptr);
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
