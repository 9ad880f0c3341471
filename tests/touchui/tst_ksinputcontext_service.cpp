// What the soft keyboard service sends to fields.
#include "support/LogManager.h"
#include "tests/support/LogFixture.h"
#include "tests/support/Patience.h"
#include "tests/touchui/InputContextFixture.h"

using namespace SubCommonDefine;

class tst_ksinputcontext_service : public InputContextFixture
{
    Q_OBJECT

public:
    explicit tst_ksinputcontext_service(LogFixture& log) : m_log(log) {}

private Q_SLOTS:
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
    void typedTextIsLogged();
    void textOfTheCanvasIsLogged();
    void whatIsNoTypedTextIsNotLogged();

private:
    // Contexts that other tests make end the logging with them.
    void startLog()
    {
        INIT_LOGGING(L"KS2Titler");
        typed();
    }
    QStringList typed() { return m_log.takeOperations(QStringLiteral("Text Input")); }

    LogFixture& m_log;
};

void tst_ksinputcontext_service::stringsIntoALineEdit()
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

void tst_ksinputcontext_service::stringsIntoAComboBox()
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

void tst_ksinputcontext_service::stringsIntoATextItem()
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

void tst_ksinputcontext_service::stringsWithoutAFocusAreDropped()
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

void tst_ksinputcontext_service::enterClosesAPlainField()
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

void tst_ksinputcontext_service::keysOfOtherTypesAreDropped()
{
    open(m_edit);
    m_edit->setText(QStringLiteral("a"));
    // Another process may send any number.
    for (const int type : {-1, 0, 2, 3, 5, 12, 52, 194, 199, 65536, 0x7fffffff})
        m_context->sendKey(keyRecord(type, Qt::Key_B, L"b"));
    QCOMPARE(m_edit->text(), QStringLiteral("a"));
    QVERIFY(!KSInputContext::isSoftKeyboardClosed());
    m_context->sendKey(keyRecord(QEvent::KeyPress, -5, L"b"));
    QCOMPARE(m_edit->text(), QStringLiteral("ab"));
}

void tst_ksinputcontext_service::closedByTheService()
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

void tst_ksinputcontext_service::cursorPositions()
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

void tst_ksinputcontext_service::cursorPositionsOutOfRange()
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

void tst_ksinputcontext_service::limitsAndMasksOnlyWhileOpen()
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

void tst_ksinputcontext_service::explicitOpening()
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

void tst_ksinputcontext_service::specialKeys()
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

void tst_ksinputcontext_service::eventsSentToTheContext()
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

void tst_ksinputcontext_service::compositionIsKept()
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

void tst_ksinputcontext_service::innerMethodGetsTheKeysWhileClosed()
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

void tst_ksinputcontext_service::fieldDeletedUnderTheKeyboard()
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

void tst_ksinputcontext_service::focusManagerWithoutAServer()
{
    const QByteArray display = qgetenv("DISPLAY");
    qputenv("DISPLAY", ":4711");
    QCOMPARE(KSInputFocusManager::getInputFocusWindow(), 0UL);
    KSInputFocusManager::setInputFocusWindow(1);
    if (display.isNull())
        qunsetenv("DISPLAY");
    else
        qputenv("DISPLAY", display);
}

void tst_ksinputcontext_service::typedTextIsLogged()
{
    startLog();
    open(m_edit);
    m_context->sendInputStringOnEnterPressing(L"快讯 1");
    QCOMPARE(typed(), QStringList{QStringLiteral("200: 快讯 1")});
    m_context->sendKey(keyRecord(QEvent::KeyPress, Qt::Key_A, L"a"));
    m_context->sendKey(keyRecord(QEvent::KeyRelease, Qt::Key_A, L"a"));
    m_context->sendKey(keyRecord(QEvent::KeyPress, Qt::Key_Space, L" "));
    QCOMPARE(m_edit->text(), QStringLiteral("快讯 1a "));
    QCOMPARE(typed(), QStringList({"200: a", "200:  "}));
    open(m_box);
    m_context->sendInputStringOnEnterPressing(L"72");
    m_context->sendKey(keyRecord(QEvent::KeyPress, Qt::Key_0, L"0"));
    QCOMPARE(typed(), QStringList({"200: 72", "200: 0"}));
}

void tst_ksinputcontext_service::textOfTheCanvasIsLogged()
{
    startLog();
    m_item->setFocus();
    open(m_view);
    m_context->sendInputString(L"속보");
    m_context->sendInputStringOnEnterPressing(L"!");
    m_context->sendKey(keyRecord(QEvent::KeyPress, Qt::Key_E, L"é"));
    QCOMPARE(typed(), QStringList({QStringLiteral("200: 속보"), "200: !", QStringLiteral("200: é")}));
    // An entry stays one line, and cannot pass itself off as another one.
    m_context->sendInputString(L"one\nx localhost KS2Titler[1]: [Text Input] 200: two");
    QCOMPARE(m_item->document()->blockCount(), 2);
    QCOMPARE(typed().size(), 1);
}

void tst_ksinputcontext_service::whatIsNoTypedTextIsNotLogged()
{
    startLog();
    m_context->sendInputString(L"a"); // no field
    open(m_edit);
    // Only asked about, while the operator goes on typing.
    m_context->sendInputString(L"a");
    m_context->sendInputStringOnTextChanged(L"a");
    m_context->sendInputStringOnEnterPressing(L"");
    m_context->sendKey(keyRecord(QEvent::KeyPress, Qt::Key_Left));
    m_context->sendKey(keyRecord(QEvent::KeyPress, Qt::Key_Backspace, L"\b"));
    m_context->sendKey(keyRecord(QEvent::KeyPress, Qt::Key_Delete, L"\x7f"));
    m_context->sendKey(keyRecord(QEvent::KeyPress, Qt::Key_Enter, L"\r"));
    open(m_box);
    m_box->setEditable(false);
    m_context->sendInputStringOnEnterPressing(L"a");
    m_item->setTextInteractionFlags(Qt::NoTextInteraction);
    open(m_view);
    m_context->sendInputString(L"a");
    QCOMPARE(typed(), QStringList());
    m_item->setTextInteractionFlags(Qt::TextEditorInteraction);
    m_context->sendInputString(L"b");
    QCOMPARE(typed(), QStringList{"200: b"});
}

int main(int argc, char** argv)
{
    LogFixture log;
    KSInputContext::install();
    QApplication app(argc, argv);
    tst_ksinputcontext_service test(log);
    QTEST_SET_MAIN_SOURCE_PATH
    return QTest::qExec(&test, argc, argv);
}

#include "tst_ksinputcontext_service.moc"
