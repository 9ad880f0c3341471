// What fields tell the soft keyboard service, and which keys it gets.
#include "tests/touchui/InputContextFixture.h"

using namespace SubCommonDefine;

class tst_ksinputcontext : public InputContextFixture
{
    Q_OBJECT

private Q_SLOTS:
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
};

void tst_ksinputcontext::isTheContextOfTheApplication()
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

void tst_ksinputcontext::describesALineEdit_data()
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

void tst_ksinputcontext::describesALineEdit()
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

void tst_ksinputcontext::describesTheRestOfALineEdit()
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

void tst_ksinputcontext::describesATextItem()
{
    m_item->setObjectName(QStringLiteral("0#Text Input#1#300#a#b#4#2#4#1##299"));
    m_context->setFocusWidget(m_view);
    tagSoftKeyBoardInitData data = m_context->getSendData();
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
    data = m_context->getSendData();
    QCOMPARE(data.text, std::wstring());
    QCOMPARE(data.textLength, -1);
    QCOMPARE(data.selectionStart, -1);
    QCOMPARE(data.selectionEnd, -1);
    QCOMPARE(data.selectionMode, 2);
    QCOMPARE(data.lastValue, 300);
}

void tst_ksinputcontext::findsTheEditedItem()
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

void tst_ksinputcontext::clickOpensForAField()
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

void tst_ksinputcontext::keysDoNotShowAgain()
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

void tst_ksinputcontext::leavingAFieldCloses()
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

void tst_ksinputcontext::serviceOwnsTheStateInTheTitler()
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

void tst_ksinputcontext::closeKeepsTheKeyboardOfTheCanvas()
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

void tst_ksinputcontext::dummyAndSimpleClose()
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

void tst_ksinputcontext::focusStaysWhileOpen()
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

void tst_ksinputcontext::otherApplicationsKeepTheirFocusWidget()
{
    qApp->setObjectName(QStringLiteral("another"));
    open(m_edit);
    m_context->setFocusWidget(m_other);
    QCOMPARE(m_context->focusWidget(), m_edit);
}

void tst_ksinputcontext::physicalKeyGoesToTheServiceOnce()
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

void tst_ksinputcontext::keyOfTheServiceIsNotSentBack()
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

void tst_ksinputcontext::physicalKeysWorkWithoutAService()
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

int main(int argc, char** argv)
{
    KSInputContext::install();
    QApplication app(argc, argv);
    tst_ksinputcontext test;
    QTEST_SET_MAIN_SOURCE_PATH
    return QTest::qExec(&test, argc, argv);
}

#include "tst_ksinputcontext.moc"
