// The input context of the application: the fields of this program are filled by a soft keyboard that lives
// in another process of the appliance.
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

// Describes the focused field to the soft keyboard service, and applies the strings, keys and cursor
// positions that the service sends back. The field is a QLineEdit, an editable QComboBox or a text item of a
// QGraphicsView.
//
// Qt makes and owns the one instance: install() before QApplication, instance() after it; never delete it.
// GUI thread only. Without a controller every operation that would talk to the service does nothing and the
// physical keyboard works as usual, through the input method that the environment asks for.
//
// A field describes itself by its object name, see FieldName.
class KSInputContext : public QPlatformInputContext, public ISoftKeyBoardControllerCallBack
{
    Q_OBJECT
public:
    // Chooses this class as the input context of the QApplication that is made next.
    static void install();
    // Null before QApplication, and when install() was not called.
    static KSInputContext* instance() { return s_instance; }

    // Made by the plug-in. inner is the input method that serves the physical keyboard; may be null.
    explicit KSInputContext(std::unique_ptr<QPlatformInputContext> inner = nullptr);
    ~KSInputContext() override;

    QString identifierName() const { return QStringLiteral("KSInputContext"); }
    QString language() const { return QString(); }

    // The service; not owned, null takes it away and leaves the keyboard closed.
    void setKeyBoardController(ISoftKeyBoardController* controller);
    ISoftKeyBoardController* getKeyBoardController() const { return m_controller; }

    // True while a key of the service is being delivered, so that it is not sent back.
    bool isSendingKeyEvent() const { return m_sendingKeyEvent; }
    static bool isSoftKeyboardClosed() { return m_bClosed; }

    // Sends a key press to the service; false without a controller.
    bool forwardKeyPress(const QEvent* event);
    // Events of type 199 open the keyboard for the focus widget and those of type 200 close it; key presses
    // go to the service while the keyboard is open. True when the event was used up.
    bool filterEvent(const QEvent* event) override;
    // True for keys that the open keyboard keeps to itself: Tab, Space, Home, End, page keys and F1 to F12.
    bool filterSpecialKeyEvent(const QEvent* event) const;

    void setFocusWidget(QWidget* widget);
    QWidget* focusWidget() const { return m_baseFocusWidget; }
    // Lets the next request look at the widget that has the focus now, instead of the one the keyboard was
    // opened for.
    static void resetFocusWidget() { m_pFocusWidget.clear(); }
    // The widget that the keyboard works for: it outlives a change of focus while the keyboard is open.
    QWidget* getFocusWidget();
    // The text item of the view that is being edited, null when there is none.
    static QGraphicsTextItem* getFocusTextItem(QGraphicsView* view);

    SubCommonDefine::tagSoftKeyBoardInitData getSendData();
    SubCommonDefine::tagSoftKeyBoardInitData getSendData(QLineEdit* edit);

    // Opens the keyboard with a record of the caller's.
    void showSoftKeyBoardWindow(SubCommonDefine::tagSoftKeyBoardInitData data);
    // Ends a field: the state changes at once only in applications other than "Titler"; here the service
    // reports it.
    void closeSoftKeyBoardWindow();
    // Put the keyboard away without its closing ceremony; closed at once.
    void dummyCloseSoftKeyBoardWindow();
    void simpleCloseSoftKeyBoardWindow();
    // These four act only while the keyboard is open.
    void showLimitInfo(SubCommonDefine::taLimitInfo info);
    void cancelLimitInfo();
    void showMaskOnSoftKeyboard();
    void hideMaskOnSoftKeyboard();

    // The native window that takes the X11 input focus when no field has it.
    void setWindowID(unsigned long id);

    // Commits what an input method is composing, then passes the event to the focus widget.
    void sendEvent(const QInputMethodEvent& event);

    // What the service sends.
    void sendInputString(std::wstring text) override { handleInputString(text, false); }
    void sendInputStringOnEnterPressing(std::wstring text) override { handleInputString(text, true); }
    void sendInputStringOnTextChanged(std::wstring text) override;
    void sendKey(SubCommonDefine::tagSoftKeyBoardKeyData data) override;
    void sendInputStringSelectionPos(SubCommonDefine::tagSoftKeyBoardKeyTextSelectionPos pos) override;
    // True tells that the keyboard is up.
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
    // Called by name while the X11 platform starts, for an inner method that composes.
    Q_INVOKABLE void setXkbContext(struct xkb_context* context);
    bool event(QEvent* event) override;

    static bool m_bClosed;
    static QPointer<QWidget> m_pFocusWidget;
    static QString m_strLimitCondition; // pattern of the field's validator
    static constexpr int SoftKeyBoardCloseType = 1100;
    static QEvent m_eKeyBoardClosed; // what a field gets when the keyboard was closed under it

private:
    bool filterKeyPressEvent(const QEvent* event) { return !m_bClosed && forwardKeyPress(event); }
    bool filterRequestSoftwareInputPanel();
    bool filterCloseSoftwareInputPanel();
    bool isErrorForGettingFocusWidget();
    static SubCommonDefine::tagSoftKeyBoardInitData sendDataOf(const InputField* field);
    bool showForFocusWidget(const SubCommonDefine::tagSoftKeyBoardInitData& data);
    void handleInputString(const std::wstring& text, bool onEnter);
    void checkInputString(InputField& field, const std::wstring& text);
    void sendSoftKeyBoardClosedEventToFocusWidget();
    bool isOpenAtService() const { return m_controller != nullptr && !m_bClosed; }
    void showAtService(const SubCommonDefine::tagSoftKeyBoardInitData& data);
    void closeAtOnce(void (ISoftKeyBoardController::*close)());
    void setClosed(bool closed);

    static KSInputContext* s_instance;
    std::unique_ptr<QPlatformInputContext> m_inner; // without an input method one that does nothing
    ISoftKeyBoardController* m_controller = nullptr;
    bool m_sendingKeyEvent = false;
    unsigned long m_windowId = 0;
    QPointer<QWidget> m_baseFocusWidget;
    KeyReleaseWatch m_keyReleases;
};
