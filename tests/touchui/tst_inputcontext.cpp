// Fields and the soft keyboard service, with a service of our own that records what it is told.
#include "messaging/services/ISoftKeyBoardController.h"
#include "messaging/services/SubCommonDefine.h"
#include "touchui/KSAppEventFilter.h"
#include "touchui/KSInputContext.h"
#include "touchui/KSInputFocusManager.h"
#include "touchui/KSSoftKeyboardCursorSettingEvent.h"

#include <QApplication>
#include <QComboBox>
#include <QGraphicsScene>
#include <QGraphicsTextItem>
#include <QGraphicsView>
#include <QInputMethodEvent>
#include <QLineEdit>
#include <QPushButton>
#include <QRegularExpressionValidator>
#include <QSignalSpy>
#include <QTest>
#include <QVBoxLayout>

using namespace SubCommonDefine;

namespace
{

class FakeService : public ISoftKeyBoardController
{
public:
    void show(tagSoftKeyBoardInitData data) override
    {
        calls.append(QStringLiteral("show"));
        shown.append(data);
    }
    void close() override { calls.append(QStringLiteral("close")); }
    void dummyClose() override { calls.append(QStringLiteral("dummyClose")); }
    void simpleClose() override { calls.append(QStringLiteral("simpleClose")); }
    void sendKey(tagSoftKeyBoardKeyData key) override { keys.append(key); }
    void sendLimitInfo(taLimitInfo info) override
    {
        calls.append(QStringLiteral("sendLimitInfo"));
        limits.append(info);
    }
    void closeLimitBalloon() override { calls.append(QStringLiteral("closeLimitBalloon")); }
    void showMask() override { calls.append(QStringLiteral("showMask")); }
    void hideMask() override { calls.append(QStringLiteral("hideMask")); }
    void registerCallBack(ISoftKeyBoardControllerCallBack*) override
    {
        calls.append(QStringLiteral("registerCallBack"));
    }

    QStringList calls;
    QList<tagSoftKeyBoardInitData> shown;
    QList<tagSoftKeyBoardKeyData> keys;
    QList<taLimitInfo> limits;
};

// A text item as the canvas has them.
class FakeTextItem : public QGraphicsTextItem
{
public:
    using QGraphicsTextItem::QGraphicsTextItem;
    int type() const override { return 65546; }
    bool event(QEvent* event) override
    {
        if (event->type() == KSSoftKeyboardCursorSettingEvent::myType) {
            const auto* setting = static_cast<KSSoftKeyboardCursorSettingEvent*>(event);
            positions = {setting->getCursorBeginPos(), setting->getCursorEndPos(),
                         setting->getCursorCurrentPos(), setting->getCursorSelectionMode()};
            return true;
        }
        closed += event->type() == KSInputContext::SoftKeyBoardCloseType ? 1 : 0;
        return QGraphicsTextItem::event(event);
    }
    QList<int> positions;
    int closed = 0;
};

class ClosingEdit : public QLineEdit
{
public:
    using QLineEdit::QLineEdit;
    bool event(QEvent* event) override
    {
        if (event->type() == KSInputContext::SoftKeyBoardCloseType) {
            ++closed;
            closedWasSeen = KSInputContext::isSoftKeyboardClosed();
        }
        return QLineEdit::event(event);
    }
    int closed = 0;
    bool closedWasSeen = false;
};

class RecordingValidator : public QRegularExpressionValidator
{
public:
    using QRegularExpressionValidator::QRegularExpressionValidator;
    State validate(QString& text, int& position) const override
    {
        asked.append(text);
        return QRegularExpressionValidator::validate(text, position);
    }
    mutable QStringList asked;
};

// Stands for an input method that composes.
class FakeInputMethod : public QPlatformInputContext
{
public:
    bool isValid() const override { return true; }
    void commit() override
    {
        ++commits;
        if (focus != nullptr && !composed.isEmpty()) {
            QInputMethodEvent event;
            event.setCommitString(composed);
            composed.clear();
            QCoreApplication::sendEvent(focus, &event);
        }
    }
    void reset() override { ++resets; }
    bool filterEvent(const QEvent* event) override
    {
        events.append(event->type());
        return takesKeys;
    }
    void setFocusObject(QObject* object) override { focus = object; }

    QPointer<QObject> focus;
    QString composed;
    QList<int> events;
    int commits = 0;
    int resets = 0;
    bool takesKeys = false;
};

tagSoftKeyBoardKeyData keyRecord(int type, int key, const std::wstring& text = {})
{
    tagSoftKeyBoardKeyData data;
    data.eventType = type;
    data.key = key;
    data.text = text;
    return data;
}

} // namespace

class TestInputContext : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();

    void isTheContextOfTheApplication();
    void describesALineEdit_data();
    void describesALineEdit();
    void describesTheRestOfALineEdit();
    void describesATextItem();
    void findsTheEditedItem();
    void clickOpensForAField();
    void keysDoNotShowAgain();
    void leavingAFieldCloses();
    void serviceOwnsTheStateInTheTitler();
    void closeKeepsTheKeyboardOfTheCanvas();
    void dummyAndSimpleClose();
    void focusStaysWhileOpen();
    void otherApplicationsKeepTheirFocusWidget();
    void physicalKeyGoesToTheServiceOnce();
    void keyOfTheServiceIsNotSentBack();
    void physicalKeysWorkWithoutAService();
    void stringsIntoALineEdit();
    void stringsIntoAComboBox();
    void stringsIntoATextItem();
    void stringsWithoutAFocusAreDropped();
    void enterClosesAPlainField();
    void keysOfOtherTypesAreDropped();
    void closedByTheService();
    void cursorPositions();
    void cursorPositionsOutOfRange();
    void limitsAndMasksOnlyWhileOpen();
    void explicitOpening();
    void specialKeys();
    void eventsSentToTheContext();
    void compositionIsKept();
    void innerMethodGetsTheKeysWhileClosed();
    void fieldDeletedUnderTheKeyboard();
    void focusManagerWithoutAServer();

private:
    KSInputContext* m_context = nullptr;
    std::unique_ptr<KSAppEventFilter> m_filter;
    std::unique_ptr<FakeService> m_service;
    std::unique_ptr<QWidget> m_window;
    ClosingEdit* m_edit = nullptr;
    QLineEdit* m_other = nullptr;
    QComboBox* m_box = nullptr;
    QPushButton* m_button = nullptr;
    QGraphicsScene* m_scene = nullptr;
    QGraphicsView* m_view = nullptr;
    FakeTextItem* m_parentItem = nullptr;
    FakeTextItem* m_item = nullptr;
    void open(QWidget* widget);
    void type(const char* letters);
};

void TestInputContext::init()
{
    qApp->setObjectName(QStringLiteral("Titler"));
    m_context = KSInputContext::instance();
    QVERIFY(m_context != nullptr);
    m_filter = std::make_unique<KSAppEventFilter>();
    qApp->installEventFilter(m_filter.get());
    m_service = std::make_unique<FakeService>();
    m_context->setKeyBoardController(m_service.get());
    m_window = std::make_unique<QWidget>();
    auto* layout = new QVBoxLayout(m_window.get());
    m_button = new QPushButton(QStringLiteral("button"));
    m_edit = new ClosingEdit;
    m_other = new QLineEdit;
    m_box = new QComboBox;
    m_box->setEditable(true);
    m_scene = new QGraphicsScene(m_window.get());
    m_parentItem = new FakeTextItem;
    m_scene->addItem(m_parentItem);
    m_item = new FakeTextItem(m_parentItem);
    m_item->setTextInteractionFlags(Qt::TextEditorInteraction);
    m_view = new QGraphicsView(m_scene);
    for (QWidget* widget : QList<QWidget*>{m_button, m_edit, m_other, m_box, m_view}) {
        layout->addWidget(widget);
    }
    m_window->show();
    m_window->activateWindow();
    QVERIFY(QTest::qWaitForWindowActive(m_window.get()));
    m_button->setFocus();
    m_service->calls.clear();
}

void TestInputContext::cleanup()
{
    m_window.reset();
    m_context->setKeyBoardController(nullptr);
    KSInputContext::m_bClosed = true;
    KSInputContext::resetFocusWidget();
    KSInputContext::m_strLimitCondition.clear();
    m_filter.reset();
}

void TestInputContext::open(QWidget* widget)
{
    widget->setFocus();
    m_context->setFocusWidget(widget);
    KSInputContext::resetFocusWidget();
    const QEvent request(QEvent::RequestSoftwareInputPanel);
    QVERIFY(m_context->filterEvent(&request));
    QVERIFY(!KSInputContext::isSoftKeyboardClosed());
}

// On the physical keyboard.
void TestInputContext::type(const char* letters)
{
    for (; *letters != '\0'; ++letters) {
        QTest::keyClick(m_window->windowHandle(), *letters);
    }
}

void TestInputContext::isTheContextOfTheApplication()
{
    QVERIFY(m_context->isValid());
    QCOMPARE(m_context->identifierName(), QStringLiteral("KSInputContext"));
    QCOMPARE(m_context->language(), QString());
    QVERIFY(KSInputContext::isSoftKeyboardClosed());
    m_edit->setFocus();
    QCOMPARE(m_context->focusWidget(), m_edit);
    m_button->setFocus();
    QVERIFY(m_context->focusWidget() == nullptr);
    m_box->setFocus();
    QCOMPARE(m_context->focusWidget(), m_box);
    QCOMPARE(static_cast<int>(QEvent::RequestSoftwareInputPanel), 199);
    QCOMPARE(static_cast<int>(QEvent::CloseSoftwareInputPanel), 200);
    QVERIFY(KSSoftKeyboardCursorSettingEvent::myType >= QEvent::User);
}

void TestInputContext::describesALineEdit_data()
{
    QTest::addColumn<QString>("name");
    QTest::addColumn<int>("keyboard");
    QTest::addColumn<QString>("title");
    QTest::addColumn<int>("mode");
    QTest::addColumn<int>("last");
    QTest::newRow("four") << "2#Folder Name#0#2" << 2 << "Folder Name" << 0 << 2;
    QTest::newRow("four, mode 1") << "1#Size#1#999" << 1 << "Size" << 1 << 999;
    QTest::newRow("more") << "1#Size#1#999#and#more" << 1 << "Size" << 1 << 999;
    QTest::newRow("three") << "3#Name#anything" << 3 << "Name" << 2 << 300;
    QTest::newRow("two") << "4#文件夹" << 4 << "文件夹" << 0 << 300;
    QTest::newRow("one") << "plain name" << 0 << "" << 0 << 300;
    QTest::newRow("none") << "" << 0 << "" << 0 << 300;
    QTest::newRow("no numbers") << "x#T#y#z" << 0 << "T" << 0 << 300;
    QTest::newRow("out of range") << "99999999999#T#1#5" << 0 << "T" << 1 << 5;
}

void TestInputContext::describesALineEdit()
{
    QFETCH(QString, name);
    m_edit->setObjectName(name);
    const tagSoftKeyBoardInitData data = m_context->getSendData(m_edit);
    QTEST(data.keyboardType, "keyboard");
    QTEST(QString::fromStdWString(data.title), "title");
    QTEST(data.selectionMode, "mode");
    QTEST(data.lastValue, "last");
    QCOMPARE(data.fieldKind, 1);
}

void TestInputContext::describesTheRestOfALineEdit()
{
    m_edit->setText(QStringLiteral("快讯 title"));
    m_edit->setSelection(3, 5);
    tagSoftKeyBoardInitData data = m_context->getSendData(m_edit);
    QCOMPARE(QString::fromStdWString(data.text), QStringLiteral("快讯 title"));
    QCOMPARE(data.textLength, 8);
    QCOMPARE(data.selectionStart, 3);
    QCOMPARE(data.selectionEnd, 8);
    QCOMPARE(data.maxLength, 100);
    QCOMPARE(data.limitCondition, std::wstring());
    QVERIFY(KSInputContext::m_strLimitCondition.isEmpty());
    m_edit->setMaxLength(20);
    m_edit->setValidator(
        new QRegularExpressionValidator(QRegularExpression(QStringLiteral("^[2-9]$")), m_edit));
    data = m_context->getSendData(m_edit);
    QCOMPARE(data.maxLength, 20);
    QCOMPARE(data.limitCondition, std::wstring(L"^[2-9]$"));
    QCOMPARE(KSInputContext::m_strLimitCondition, QStringLiteral("^[2-9]$"));
    QCOMPARE(m_context->getSendData(m_other).limitCondition, std::wstring());
    QVERIFY(KSInputContext::m_strLimitCondition.isEmpty());
}

void TestInputContext::describesATextItem()
{
    m_item->setObjectName(QStringLiteral("0#Text Input#1#300#a#b#4#2#4#1##299"));
    tagSoftKeyBoardInitData data = m_context->getSendData(m_item);
    QCOMPARE(data.fieldKind, 0);
    QCOMPARE(data.title, std::wstring(L"Text Input"));
    QCOMPARE(data.keyboardType, 1);
    QCOMPARE(data.maxLength, 300);
    QCOMPARE(data.text, std::wstring(L"a#b")); // the text itself may hold the separator
    QCOMPARE(data.textLength, 4);
    QCOMPARE(data.selectionStart, 2);
    QCOMPARE(data.selectionEnd, 4);
    QCOMPARE(data.selectionMode, 1);
    QCOMPARE(data.limitCondition, std::wstring());
    QCOMPARE(data.lastValue, 299);
    m_item->setObjectName(QStringLiteral("0#Text Input#0#300##-1#-1#-1#2##300"));
    data = m_context->getSendData(m_item);
    QCOMPARE(data.text, std::wstring());
    QCOMPARE(data.textLength, -1);
    QCOMPARE(data.selectionStart, -1);
    QCOMPARE(data.selectionEnd, -1);
    QCOMPARE(data.selectionMode, 2);
    QCOMPARE(data.lastValue, 300);
}

void TestInputContext::findsTheEditedItem()
{
    QCOMPARE(KSInputContext::getFocusTextItem(m_view), m_item);
    m_item->setTextInteractionFlags(Qt::NoTextInteraction);
    QVERIFY(KSInputContext::getFocusTextItem(m_view) == nullptr);
    m_parentItem->setTextInteractionFlags(Qt::TextEditorInteraction);
    QVERIFY(KSInputContext::getFocusTextItem(m_view) == nullptr); // has no parent
    m_item->setTextInteractionFlags(Qt::TextEditorInteraction);
    m_item->setEnabled(false);
    QVERIFY(KSInputContext::getFocusTextItem(m_view) == nullptr);
    auto* plain = new QGraphicsTextItem(m_parentItem);
    plain->setTextInteractionFlags(Qt::TextEditorInteraction);
    QVERIFY(KSInputContext::getFocusTextItem(m_view) == nullptr); // of another type
}

void TestInputContext::clickOpensForAField()
{
    m_edit->setObjectName(QStringLiteral("2#Folder Name#0#2"));
    m_edit->setText(QStringLiteral("abc"));
    QTest::mouseClick(m_edit, Qt::LeftButton);
    QCOMPARE(m_service->calls, (QStringList{QStringLiteral("registerCallBack"), QStringLiteral("show"),
                                            QStringLiteral("closeLimitBalloon")}));
    QCOMPARE(m_service->shown.at(0).title, std::wstring(L"Folder Name"));
    QVERIFY(!KSInputContext::isSoftKeyboardClosed());
    QVERIFY(QGuiApplication::inputMethod()->isVisible());
    // Without a focus widget a request is refused.
    m_button->setFocus();
    m_service->calls.clear();
    KSInputContext::resetFocusWidget();
    const QEvent request(QEvent::RequestSoftwareInputPanel);
    QVERIFY(!m_context->filterEvent(&request));
    QVERIFY(!m_service->calls.contains(QStringLiteral("show")));
}

void TestInputContext::keysDoNotShowAgain()
{
    QTest::mouseClick(m_edit, Qt::LeftButton);
    QCOMPARE(m_service->shown.size(), 1);
    // Qt asks again after each key release, of the service's keys as of physical ones.
    m_context->sendKey(keyRecord(QEvent::KeyPress, Qt::Key_A, L"a"));
    m_context->sendKey(keyRecord(QEvent::KeyRelease, Qt::Key_A, L"a"));
    QCOMPARE(m_edit->text(), QStringLiteral("a"));
    type("b");
    QCOMPARE(m_service->shown.size(), 1);
    // A click tells where the cursor is now.
    QTest::mouseClick(m_edit, Qt::LeftButton);
    QCOMPARE(m_service->shown.size(), 2);
    QCOMPARE(m_service->shown.at(1).text, std::wstring(L"a"));
    QCOMPARE(m_service->calls.count(QStringLiteral("registerCallBack")), 1);
    // A keyboard that was put away stays away while somebody types on the physical one.
    m_context->sendSoftKeyboardState(false);
    type("cd");
    QCOMPARE(m_edit->text(), QStringLiteral("acd"));
    QCOMPARE(m_service->shown.size(), 2);
    QVERIFY(KSInputContext::isSoftKeyboardClosed());
    QTest::mouseClick(m_edit, Qt::LeftButton);
    QCOMPARE(m_service->shown.size(), 3);
    // The same for the line edit of a combo box.
    m_context->sendSoftKeyboardState(false);
    m_box->setFocus();
    type("12");
    QCOMPARE(m_box->currentText(), QStringLiteral("12"));
    QVERIFY(KSInputContext::isSoftKeyboardClosed());
}

void TestInputContext::leavingAFieldCloses()
{
    qApp->setObjectName(QStringLiteral("another"));
    open(m_edit);
    m_service->calls.clear();
    const QEvent request(QEvent::CloseSoftwareInputPanel);
    QVERIFY(m_context->filterEvent(&request));
    QCOMPARE(m_service->calls, QStringList{QStringLiteral("close")});
    QVERIFY(KSInputContext::isSoftKeyboardClosed());
    QVERIFY(KSInputContext::m_pFocusWidget == nullptr);
}

void TestInputContext::serviceOwnsTheStateInTheTitler()
{
    QTest::mouseClick(m_edit, Qt::LeftButton);
    m_service->calls.clear();
    m_button->setFocus();
    QCOMPARE(m_service->calls, QStringList{QStringLiteral("close")});
    QVERIFY(!KSInputContext::isSoftKeyboardClosed());
    m_context->sendSoftKeyboardState(false);
    QVERIFY(KSInputContext::isSoftKeyboardClosed());
    m_context->sendSoftKeyboardState(true);
    QVERIFY(!KSInputContext::isSoftKeyboardClosed());
    m_context->closeSoftKeyBoardWindow();
    QVERIFY(!KSInputContext::isSoftKeyboardClosed());
}

void TestInputContext::closeKeepsTheKeyboardOfTheCanvas()
{
    m_item->setFocus();
    open(m_view);
    m_service->calls.clear();
    const QEvent request(QEvent::CloseSoftwareInputPanel);
    QVERIFY(m_context->filterEvent(&request));
    QVERIFY(m_service->calls.isEmpty());
    QCOMPARE(KSInputContext::m_pFocusWidget.data(), m_view);
    m_button->setFocus();
    QVERIFY(!m_service->calls.contains(QStringLiteral("close")));
    QVERIFY(!KSInputContext::isSoftKeyboardClosed());
}

void TestInputContext::dummyAndSimpleClose()
{
    open(m_edit);
    m_service->calls.clear();
    m_context->dummyCloseSoftKeyBoardWindow();
    QCOMPARE(m_service->calls, QStringList{QStringLiteral("dummyClose")});
    QVERIFY(KSInputContext::isSoftKeyboardClosed());
    QVERIFY(KSInputContext::m_pFocusWidget == nullptr);
    open(m_edit);
    m_service->calls.clear();
    m_context->simpleCloseSoftKeyBoardWindow();
    QCOMPARE(m_service->calls, QStringList{QStringLiteral("simpleClose")});
    QVERIFY(KSInputContext::isSoftKeyboardClosed());
}

void TestInputContext::focusStaysWhileOpen()
{
    m_item->setFocus();
    open(m_view);
    m_context->setFocusWidget(m_edit);
    QCOMPARE(m_context->focusWidget(), m_edit);
    QCOMPARE(m_context->getFocusWidget(), m_view);
    KSInputContext::resetFocusWidget();
    QCOMPARE(m_context->getFocusWidget(), m_edit);
    m_context->setFocusWidget(m_other);
    KSInputContext::m_bClosed = true;
    QCOMPARE(m_context->getFocusWidget(), m_other);
}

void TestInputContext::otherApplicationsKeepTheirFocusWidget()
{
    qApp->setObjectName(QStringLiteral("another"));
    open(m_edit);
    m_context->setFocusWidget(m_other);
    QCOMPARE(m_context->focusWidget(), m_edit);
}

void TestInputContext::physicalKeyGoesToTheServiceOnce()
{
    open(m_edit);
    // By the window, as the window system delivers it: window and widget both see it.
    QTest::keyClick(m_window->windowHandle(), Qt::Key_A);
    QCOMPARE(m_service->keys.size(), 1);
    QCOMPARE(m_service->keys.at(0).eventType, static_cast<int>(QEvent::KeyPress));
    QCOMPARE(m_service->keys.at(0).key, static_cast<int>(Qt::Key_A));
    QCOMPARE(m_edit->text(), QString());
    // By the road that the window system's plug-in takes first.
    const QKeyEvent key(QEvent::KeyPress, Qt::Key_B, Qt::ShiftModifier, 30, 0x62, 0, QStringLiteral("速"),
                        true);
    QVERIFY(m_context->filterEvent(&key));
    QCOMPARE(m_service->keys.size(), 2);
    QCOMPARE(m_service->keys.at(1).text, std::wstring(L"速"));
    QCOMPARE(m_service->keys.at(1).nativeVirtualKey, 0x62);
    QCOMPARE(m_service->keys.at(1).modifiers, static_cast<int>(Qt::ShiftModifier));
    QVERIFY(m_service->keys.at(1).autoRepeat);
    // Straight to the widget.
    QTest::keyClick(m_edit, Qt::Key_C);
    QCOMPARE(m_service->keys.size(), 3);
    QCOMPARE(m_edit->text(), QString());
}

void TestInputContext::keyOfTheServiceIsNotSentBack()
{
    open(m_edit);
    QTest::keyClick(m_window->windowHandle(), Qt::Key_A);
    QCOMPARE(m_service->keys.size(), 1);
    m_context->sendKey(m_service->keys.at(0));
    QCOMPARE(m_service->keys.size(), 1);
    m_context->sendKey(keyRecord(QEvent::KeyPress, 0, L"é"));
    QVERIFY(m_edit->text().endsWith(QStringLiteral("é")));
    QCOMPARE(m_service->keys.size(), 1);
    QVERIFY(!m_context->isSendingKeyEvent());
    m_context->sendKey(keyRecord(QEvent::KeyPress, Qt::Key_Backspace));
    QVERIFY(!m_edit->text().contains(QStringLiteral("é")));
}

void TestInputContext::physicalKeysWorkWithoutAService()
{
    m_edit->setFocus();
    type("ab");
    QCOMPARE(m_edit->text(), QStringLiteral("ab")); // closed
    QVERIFY(m_service->keys.isEmpty());
    open(m_edit);
    m_context->setKeyBoardController(nullptr); // the service is gone
    QVERIFY(KSInputContext::isSoftKeyboardClosed());
    type("cd");
    QCOMPARE(m_edit->text(), QStringLiteral("abcd"));
    KSInputContext::m_bClosed = false;
    type("ef");
    QCOMPARE(m_edit->text(), QStringLiteral("abcdef"));
    QTest::mouseClick(m_edit, Qt::LeftButton);
    m_context->dummyCloseSoftKeyBoardWindow();
    m_context->closeSoftKeyBoardWindow();
    m_context->showSoftKeyBoardWindow({});
    m_context->showLimitInfo({});
    QVERIFY(KSInputContext::isSoftKeyboardClosed());
    QVERIFY(m_service->keys.isEmpty());
}

void TestInputContext::stringsIntoALineEdit()
{
    auto* validator = new RecordingValidator(QRegularExpression(QStringLiteral("[a-z]{0,4}")), m_edit);
    open(m_edit);
    m_edit->setText(QStringLiteral("old"));
    // While typing, the field stays as it is; without a validator the limit is told to be nothing.
    m_context->sendInputString(L"abc");
    QCOMPARE(m_edit->text(), QStringLiteral("old"));
    QCOMPARE(m_service->limits.size(), 1);
    QCOMPARE(m_service->limits.at(0).code, 0);
    m_context->sendInputStringOnTextChanged(L"abcd");
    QCOMPARE(m_edit->text(), QStringLiteral("old"));
    QCOMPARE(m_service->limits.size(), 2);
    m_context->sendInputStringOnEnterPressing(L"快讯");
    QCOMPARE(m_edit->text(), QStringLiteral("快讯"));
    QCOMPARE(m_edit->cursorPosition(), 2);
    QVERIFY(!m_edit->hasSelectedText());

    m_edit->setText(QStringLiteral("old"));
    m_edit->setValidator(validator);
    validator->asked.clear();
    m_context->sendInputString(L"ABC");
    QCOMPARE(validator->asked, QStringList{QStringLiteral("ABC")});
    m_context->sendInputStringOnTextChanged(L"xyz12");
    QCOMPARE(validator->asked.constLast(), QStringLiteral("xyz12"));
    QCOMPARE(m_service->limits.size(), 2); // the validator tells its owner, and the owner the service
    QCOMPARE(m_edit->text(), QStringLiteral("old"));
    m_context->sendInputStringOnEnterPressing(L"new");
    QCOMPARE(m_edit->text(), QStringLiteral("new"));
}

void TestInputContext::stringsIntoAComboBox()
{
    open(m_box);
    m_box->setEditText(QStringLiteral("64"));
    m_context->sendInputString(L"12");
    QCOMPARE(m_box->currentText(), QStringLiteral("64"));
    QCOMPARE(m_service->limits.size(), 1);
    m_context->sendInputStringOnTextChanged(L"12");
    QCOMPARE(m_service->limits.size(), 2);
    m_context->sendInputStringOnEnterPressing(L"72");
    QCOMPARE(m_box->currentText(), QStringLiteral("72"));
    m_context->sendKey(keyRecord(QEvent::KeyPress, Qt::Key_0, L"0"));
    QCOMPARE(m_box->currentText(), QStringLiteral("720"));
    QCOMPARE(m_context->getSendData().fieldKind, 1);
    QCOMPARE(m_context->getSendData().text, std::wstring(L"720"));
    m_box->setEditable(false);
    m_context->sendInputStringOnEnterPressing(L"1");
    m_context->sendInputStringOnTextChanged(L"1");
    QCOMPARE(m_context->getSendData().fieldKind, 0);
}

void TestInputContext::stringsIntoATextItem()
{
    m_item->setPlainText(QStringLiteral("Breaking news"));
    m_item->setFocus();
    open(m_view);
    QTextCursor cursor = m_item->textCursor();
    cursor.setPosition(9);
    cursor.movePosition(QTextCursor::End, QTextCursor::KeepAnchor);
    m_item->setTextCursor(cursor);
    m_context->sendInputString(L"快讯 속보");
    QCOMPARE(m_item->toPlainText(), QStringLiteral("Breaking 快讯 속보"));
    m_context->sendInputStringOnEnterPressing(L"!");
    QCOMPARE(m_item->toPlainText(), QStringLiteral("Breaking 快讯 속보!"));
    m_context->sendInputStringOnTextChanged(L"?");
    QCOMPARE(m_item->toPlainText(), QStringLiteral("Breaking 快讯 속보!"));
    m_context->sendKey(keyRecord(QEvent::KeyPress, Qt::Key_A, L"a"));
    QCOMPARE(m_item->toPlainText(), QStringLiteral("Breaking 快讯 속보!a"));
    m_item->setTextInteractionFlags(Qt::NoTextInteraction);
    m_context->sendInputString(L"x");
    QCOMPARE(m_item->toPlainText(), QStringLiteral("Breaking 快讯 속보!a"));
}

void TestInputContext::stringsWithoutAFocusAreDropped()
{
    m_context->sendSoftKeyboardState(true);
    m_context->sendInputString(L"a");
    m_context->sendInputStringOnEnterPressing(L"a");
    m_context->sendInputStringOnTextChanged(L"a");
    m_context->sendInputStringSelectionPos({});
    QVERIFY(!KSInputContext::isSoftKeyboardClosed());
    m_context->sendKey(keyRecord(QEvent::KeyPress, Qt::Key_A, L"a"));
    QVERIFY(KSInputContext::isSoftKeyboardClosed());
    QVERIFY(m_service->calls.isEmpty());
    QCOMPARE(m_edit->text(), QString());
}

void TestInputContext::enterClosesAPlainField()
{
    QSignalSpy entered(m_edit, &QLineEdit::returnPressed);
    open(m_edit);
    m_service->calls.clear();
    m_context->sendKey(keyRecord(QEvent::KeyPress, Qt::Key_Enter, L"\r"));
    QCOMPARE(m_service->calls.count(QStringLiteral("close")), 1);
    QVERIFY(KSInputContext::isSoftKeyboardClosed());
    QCOMPARE(entered.count(), 1);

    m_edit->setValidator(new QRegularExpressionValidator(QRegularExpression(QStringLiteral(".*")), m_edit));
    open(m_edit);
    m_service->calls.clear();
    m_context->sendKey(keyRecord(QEvent::KeyPress, Qt::Key_Enter, L"\r"));
    QVERIFY(!m_service->calls.contains(QStringLiteral("close")));
    QVERIFY(!KSInputContext::isSoftKeyboardClosed());
    QCOMPARE(entered.count(), 2);

    m_item->setFocus();
    open(m_view);
    m_service->calls.clear();
    m_context->sendKey(keyRecord(QEvent::KeyPress, Qt::Key_Enter, L"\r"));
    QVERIFY(!m_service->calls.contains(QStringLiteral("close")));
    QVERIFY(!KSInputContext::isSoftKeyboardClosed());
}

void TestInputContext::keysOfOtherTypesAreDropped()
{
    open(m_edit);
    m_edit->setText(QStringLiteral("a"));
    // Another process may send any number.
    for (const int type : {-1, 0, 2, 3, 5, 12, 52, 194, 199, 65536, 0x7fffffff}) {
        m_context->sendKey(keyRecord(type, Qt::Key_B, L"b"));
    }
    QCOMPARE(m_edit->text(), QStringLiteral("a"));
    QVERIFY(!KSInputContext::isSoftKeyboardClosed());
    m_context->sendKey(keyRecord(QEvent::KeyPress, -5, L"b"));
    QCOMPARE(m_edit->text(), QStringLiteral("ab"));
}

void TestInputContext::closedByTheService()
{
    open(m_edit);
    m_context->sendKey(keyRecord(1100, 0));
    QCOMPARE(m_edit->closed, 1);
    QVERIFY(m_edit->closedWasSeen);
    QVERIFY(KSInputContext::isSoftKeyboardClosed());

    m_item->setFocus();
    open(m_view);
    m_context->sendKey(keyRecord(1100, 0));
    QCOMPARE(m_item->closed, 1);
    QVERIFY(KSInputContext::isSoftKeyboardClosed());

    open(m_view);
    m_item->setTextInteractionFlags(Qt::NoTextInteraction);
    m_context->sendKey(keyRecord(1100, 0));
    QCOMPARE(m_item->closed, 1);
    QVERIFY(KSInputContext::isSoftKeyboardClosed());

    open(m_box);
    m_context->sendKey(keyRecord(1100, 0));
    QVERIFY(KSInputContext::isSoftKeyboardClosed());
}

void TestInputContext::cursorPositions()
{
    open(m_edit);
    m_edit->setText(QStringLiteral("0123456789"));
    m_context->sendInputStringSelectionPos({2, 5, 5, 1});
    QCOMPARE(m_edit->selectedText(), QStringLiteral("234"));
    m_context->sendInputStringSelectionPos({2, 5, 7, 0});
    QVERIFY(!m_edit->hasSelectedText());
    QCOMPARE(m_edit->cursorPosition(), 7);
    m_context->sendInputStringSelectionPos({0, 0, 0, 2});
    QCOMPARE(m_edit->selectedText(), QStringLiteral("0123456789"));
    open(m_box);
    m_box->setEditText(QStringLiteral("abcdef"));
    m_context->sendInputStringSelectionPos({1, 3, 0, 1});
    QCOMPARE(m_box->lineEdit()->selectedText(), QStringLiteral("bc"));
    m_item->setFocus();
    open(m_view);
    m_context->sendInputStringSelectionPos({1, 2, 3, 1});
    QCOMPARE(m_item->positions, (QList<int>{1, 2, 3, 1}));
    m_item->positions.clear();
    m_context->sendSoftKeyboardState(false);
    m_context->sendInputStringSelectionPos({1, 2, 3, 1});
    QVERIFY(m_item->positions.isEmpty());
}

void TestInputContext::cursorPositionsOutOfRange()
{
    open(m_edit);
    m_edit->setText(QStringLiteral("0123"));
    m_context->sendInputStringSelectionPos({-7, 99, 0, 1});
    QCOMPARE(m_edit->selectedText(), QStringLiteral("0123"));
    m_context->sendInputStringSelectionPos({3, 1, 0, 1});
    QCOMPARE(m_edit->selectedText(), QStringLiteral("12"));
    m_context->sendInputStringSelectionPos({0, 0, 0x7fffffff, 0});
    QCOMPARE(m_edit->cursorPosition(), 4);
    m_context->sendInputStringSelectionPos({0, 0, -0x7fffffff - 1, 0});
    QCOMPARE(m_edit->cursorPosition(), 0);
    m_context->sendInputStringSelectionPos({0, 2, 2, 77});
    QCOMPARE(m_edit->cursorPosition(), 0);
}

void TestInputContext::limitsAndMasksOnlyWhileOpen()
{
    taLimitInfo info;
    info.text = L"too long";
    info.code = 4002;
    const auto all = [&] {
        m_context->showLimitInfo(info);
        m_context->cancelLimitInfo();
        m_context->showMaskOnSoftKeyboard();
        m_context->hideMaskOnSoftKeyboard();
    };
    all();
    QVERIFY(m_service->calls.isEmpty());
    m_context->sendSoftKeyboardState(true);
    all();
    QCOMPARE(m_service->calls,
             (QStringList{QStringLiteral("sendLimitInfo"), QStringLiteral("closeLimitBalloon"),
                          QStringLiteral("showMask"), QStringLiteral("hideMask")}));
    QCOMPARE(m_service->limits.at(0).code, 4002);
}

void TestInputContext::explicitOpening()
{
    tagSoftKeyBoardInitData data;
    data.title = L"Size";
    data.limitCondition = L"^[0-9]+$";
    m_context->showSoftKeyBoardWindow(data);
    QCOMPARE(m_service->calls, (QStringList{QStringLiteral("registerCallBack"), QStringLiteral("show"),
                                            QStringLiteral("closeLimitBalloon")}));
    QCOMPARE(KSInputContext::m_strLimitCondition, QStringLiteral("^[0-9]+$"));
    QVERIFY(!KSInputContext::isSoftKeyboardClosed());
    m_context->setWindowID(0xabcdef);
}

void TestInputContext::specialKeys()
{
    const QKeyEvent tab(QEvent::KeyPress, Qt::Key_Tab, Qt::NoModifier);
    QVERIFY(!m_context->filterSpecialKeyEvent(&tab));
    m_context->sendSoftKeyboardState(true);
    for (const int key : {Qt::Key_Tab, Qt::Key_Space, Qt::Key_Home, Qt::Key_End, Qt::Key_PageUp,
                          Qt::Key_PageDown, Qt::Key_F1, Qt::Key_F12}) {
        const QKeyEvent press(QEvent::KeyPress, key, Qt::NoModifier);
        const QKeyEvent release(QEvent::KeyRelease, key, Qt::NoModifier);
        QVERIFY(m_context->filterSpecialKeyEvent(&press));
        QVERIFY(m_context->filterSpecialKeyEvent(&release));
    }
    for (const int key : {Qt::Key_A, Qt::Key_F13, Qt::Key_Return, Qt::Key_Left}) {
        const QKeyEvent press(QEvent::KeyPress, key, Qt::NoModifier);
        QVERIFY(!m_context->filterSpecialKeyEvent(&press));
    }
    const QEvent other(QEvent::User);
    QVERIFY(!m_context->filterSpecialKeyEvent(&other));
}

void TestInputContext::eventsSentToTheContext()
{
    m_edit->setFocus();
    QEvent request(QEvent::RequestSoftwareInputPanel);
    QVERIFY(QCoreApplication::sendEvent(m_context, &request));
    QCOMPARE(m_service->shown.size(), 1);
    // Sent to the field itself it takes the same road.
    KSInputContext::m_bClosed = true;
    QEvent forField(QEvent::RequestSoftwareInputPanel);
    QCoreApplication::sendEvent(m_edit, &forField);
    QCOMPARE(m_service->shown.size(), 2);
    QEvent close(QEvent::CloseSoftwareInputPanel);
    QVERIFY(QCoreApplication::sendEvent(m_context, &close));
    QCOMPARE(m_service->calls.constLast(), QStringLiteral("close"));
    // An input method event reaches the field.
    QInputMethodEvent text;
    text.setCommitString(QStringLiteral("输入"));
    QCoreApplication::sendEvent(m_context, &text);
    QCOMPARE(m_edit->text(), QStringLiteral("输入"));
}

void TestInputContext::compositionIsKept()
{
    auto method = std::make_unique<FakeInputMethod>();
    FakeInputMethod* inner = method.get();
    KSInputContext context(std::move(method));
    context.setKeyBoardController(m_service.get());
    context.setFocusObject(m_edit);
    QCOMPARE(inner->focus.data(), m_edit);
    inner->composed = QStringLiteral("ni");
    // The service takes the keys over: what was being composed goes into the field first.
    const QEvent request(QEvent::RequestSoftwareInputPanel);
    QVERIFY(context.filterEvent(&request));
    QCOMPARE(m_edit->text(), QStringLiteral("ni"));
    QCOMPARE(m_service->shown.constLast().text, std::wstring(L"ni"));
    inner->composed = QStringLiteral("hao");
    QInputMethodEvent empty;
    QCoreApplication::sendEvent(&context, &empty);
    QCOMPARE(m_edit->text(), QStringLiteral("nihao"));
    context.reset();
    QCOMPARE(inner->resets, 1);
    // The context of the application is still the first one.
    QCOMPARE(KSInputContext::instance(), m_context);
}

void TestInputContext::innerMethodGetsTheKeysWhileClosed()
{
    auto method = std::make_unique<FakeInputMethod>();
    FakeInputMethod* inner = method.get();
    KSInputContext context(std::move(method));
    context.setFocusObject(m_edit);
    const QKeyEvent press(QEvent::KeyPress, Qt::Key_N, Qt::NoModifier, QStringLiteral("n"));
    const QKeyEvent release(QEvent::KeyRelease, Qt::Key_N, Qt::NoModifier, QStringLiteral("n"));
    QVERIFY(!context.filterEvent(&press));
    inner->takesKeys = true;
    QVERIFY(context.filterEvent(&press));
    QVERIFY(context.filterEvent(&release));
    context.setKeyBoardController(m_service.get());
    QVERIFY(context.filterEvent(&press)); // a service, but closed
    QCOMPARE(inner->events.size(), 4);
    QVERIFY(m_service->keys.isEmpty());
    context.sendSoftKeyboardState(true);
    QVERIFY(context.filterEvent(&press));
    QVERIFY(!context.filterEvent(&release));
    QCOMPARE(inner->events.size(), 4);
    QCOMPARE(m_service->keys.size(), 1);
}

void TestInputContext::fieldDeletedUnderTheKeyboard()
{
    auto* edit = new QLineEdit(m_window.get());
    edit->show();
    open(edit);
    delete edit;
    m_context->sendInputString(L"a");
    m_context->sendKey(keyRecord(QEvent::KeyPress, Qt::Key_A, L"a"));
    QVERIFY(KSInputContext::m_pFocusWidget == nullptr || KSInputContext::m_pFocusWidget != edit);
    // A field that goes away because of the key it gets.
    auto* fragile = new QLineEdit(m_window.get());
    fragile->show();
    open(fragile);
    QPointer<QLineEdit> guard(fragile);
    connect(fragile, &QLineEdit::returnPressed, fragile, [fragile] { fragile->deleteLater(); });
    m_context->sendKey(keyRecord(QEvent::KeyPress, Qt::Key_Enter, L"\r"));
    QTRY_VERIFY(guard.isNull());
    m_context->sendKey(keyRecord(QEvent::KeyRelease, Qt::Key_Enter, L"\r"));
}

void TestInputContext::focusManagerWithoutAServer()
{
    const QByteArray display = qgetenv("DISPLAY");
    qputenv("DISPLAY", ":4711");
    QCOMPARE(KSInputFocusManager::getInputFocusWindow(), 0UL);
    KSInputFocusManager::setInputFocusWindow(1);
    if (display.isNull()) {
        qunsetenv("DISPLAY");
    } else {
        qputenv("DISPLAY", display);
    }
}

int main(int argc, char** argv)
{
    KSInputContext::install();
    QApplication app(argc, argv);
    TestInputContext test;
    QTEST_SET_MAIN_SOURCE_PATH
    return QTest::qExec(&test, argc, argv);
}

#include "tst_inputcontext.moc"
