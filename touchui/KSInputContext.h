#pragma once

#include "messaging/services/ISoftKeyBoardController.h"
#include "messaging/services/SubCommonDefine.h"
#include "touchui/KeyReleaseWatch.h"

#include <QEvent>
#include <QPointer>
#include <QString>
#include <QWidget>
#include <qpa/qplatforminputcontext.h>

#include <memory>
#include <string>

class InputField;
class QGraphicsTextItem;
class QGraphicsView;
class QInputMethodEvent;
class QLineEdit;
struct xkb_context;

// The input context of the application: connects the fields of this program to the soft keyboard, which runs
// in another process. Describes the focused field to the soft keyboard service, and applies the strings, keys
// and cursor positions that the service sends. The field is a QLineEdit, an editable QComboBox or a text item
// of a QGraphicsView. It is described by its object name, see FieldName.
//
// Qt creates and owns the only instance: call install() before QApplication is constructed and instance()
// afterwards; never delete it. GUI thread only. Without a controller, nothing is sent to the service, and the
// physical keyboard works as usual through the input method that the environment selects.
class KSInputContext : public QPlatformInputContext, public ISoftKeyBoardControllerCallBack
{
    Q_OBJECT
public:
    // Selects this class as the input context of the next QApplication.
    static void install();
    // Returns null before QApplication is constructed, and if install() was not called.
    static KSInputContext* instance() { return s_instance; }

    // Called by the plug-in. inner is the input method for the physical keyboard; may be null.
    explicit KSInputContext(std::unique_ptr<QPlatformInputContext> inner = nullptr);
    ~KSInputContext() override;

    QString identifierName() const { return QStringLiteral("KSInputContext"); }
    QString language() const { return QString(); }

    // Sets the service, which is not owned. Null disconnects from the service and marks the keyboard as
    // closed.
    void setKeyBoardController(ISoftKeyBoardController* controller);
    ISoftKeyBoardController* getKeyBoardController() const { return m_controller; }

    // Returns true while a key of the service is being delivered, so that it is not sent back.
    bool isSendingKeyEvent() const { return m_sendingKeyEvent; }
    static bool isSoftKeyboardClosed() { return m_bClosed; }

    // Sends a key press to the service. Returns false without a controller.
    bool forwardKeyPress(const QEvent* event);
    // Opens the keyboard for the focus widget on events of type 199 and closes it on those of type 200; sends
    // key presses to the service while the keyboard is open. Returns whether the event was handled.
    bool filterEvent(const QEvent* event) override;
    // Returns true for keys that the open keyboard handles itself: Tab, Space, Home, End, page keys and F1 to
    // F12.
    bool filterSpecialKeyEvent(const QEvent* event) const;

    void setFocusWidget(QWidget* widget);
    QWidget* focusWidget() const { return m_baseFocusWidget; }
    // Makes the next request use the widget that has the focus then, instead of the one for which the
    // keyboard was opened.
    static void resetFocusWidget() { m_pFocusWidget.clear(); }
    // Returns the widget for which the keyboard is open, even if the focus has changed since.
    QWidget* getFocusWidget();
    // Returns the text item of the view that is being edited, or null.
    static QGraphicsTextItem* getFocusTextItem(QGraphicsView* view);

    SubCommonDefine::tagSoftKeyBoardInitData getSendData();
    SubCommonDefine::tagSoftKeyBoardInitData getSendData(QLineEdit* edit);

    // Opens the keyboard with a record that the caller provides.
    void showSoftKeyBoardWindow(SubCommonDefine::tagSoftKeyBoardInitData data);
    // Closes the keyboard at the service. The state is updated at once only in applications other than
    // "Titler"; there the service reports it.
    void closeSoftKeyBoardWindow();
    // Close the keyboard without the usual steps; the state is updated at once.
    void dummyCloseSoftKeyBoardWindow();
    void simpleCloseSoftKeyBoardWindow();
    // These four have an effect only while the keyboard is open.
    void showLimitInfo(SubCommonDefine::taLimitInfo info);
    void cancelLimitInfo();
    void showMaskOnSoftKeyboard();
    void hideMaskOnSoftKeyboard();

    // Sets the native window that gets the X11 input focus when no field has it.
    void setWindowID(unsigned long id);

    // Commits text that an input method is composing, then passes the event to the focus widget.
    void sendEvent(const QInputMethodEvent& event);

    // Calls of the service.
    void sendInputString(std::wstring text) override { handleInputString(text, false); }
    void sendInputStringOnEnterPressing(std::wstring text) override { handleInputString(text, true); }
    void sendInputStringOnTextChanged(std::wstring text) override;
    void sendKey(SubCommonDefine::tagSoftKeyBoardKeyData data) override;
    void sendInputStringSelectionPos(SubCommonDefine::tagSoftKeyBoardKeyTextSelectionPos pos) override;
    // shown is true if the keyboard is open.
    void sendSoftKeyboardState(bool shown) override { setClosed(!shown); }

    // The part of an input context that Qt calls.
    bool isValid() const override { return true; }
    bool hasCapability(Capability capability) const override { return m_inner->hasCapability(capability); }
    void reset() override { m_inner->reset(); }
    void commit() override { m_inner->commit(); }
    void update(Qt::InputMethodQueries queries) override { m_inner->update(queries); }
    void invokeAction(QInputMethod::Action action, int cursorPosition) override
    {
        m_inner->invokeAction(action, cursorPosition);
    }
    void showInputPanel() override;
    void hideInputPanel() override;
    bool isInputPanelVisible() const override { return !m_bClosed; }
    void setFocusObject(QObject* object) override;
    // Called by name when the X11 platform starts, for an inner method that composes.
    Q_INVOKABLE void setXkbContext(struct xkb_context* context);
    bool event(QEvent* event) override;

    static bool m_bClosed;
    static QPointer<QWidget> m_pFocusWidget;
    static QString m_strLimitCondition; // pattern of the field's validator
    static constexpr int SoftKeyBoardCloseType = 1100;
    static QEvent m_eKeyBoardClosed; // sent to a field when the keyboard was closed

private:
    bool filterKeyPressEvent(const QEvent* event) { return !m_bClosed && forwardKeyPress(event); }
    bool filterRequestSoftwareInputPanel();
    bool filterCloseSoftwareInputPanel();
    bool isErrorForGettingFocusWidget();
    bool showForFocusWidget(const SubCommonDefine::tagSoftKeyBoardInitData& data);
    void handleInputString(const std::wstring& text, bool onEnter);
    void checkInputString(InputField& field, const std::wstring& text);
    void sendSoftKeyBoardClosedEventToFocusWidget();
    bool isOpenAtService() const { return m_controller != nullptr && !m_bClosed; }
    void showAtService(const SubCommonDefine::tagSoftKeyBoardInitData& data);
    void closeAtOnce(void (ISoftKeyBoardController::*close)());
    void setClosed(bool closed);

    static KSInputContext* s_instance;
    std::unique_ptr<QPlatformInputContext> m_inner; // never null; a dummy without an input method
    ISoftKeyBoardController* m_controller = nullptr;
    bool m_sendingKeyEvent = false;
    unsigned long m_windowId = 0;
    QPointer<QWidget> m_baseFocusWidget;
    KeyReleaseWatch m_keyReleases;
};
