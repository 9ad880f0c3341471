#include "TouchCanvas.h"
#include "tests/support/Patience.h"

#include "messaging/services/SubCommonDefine.h"
#include "tests/fakes/FakeSoftKeyBoardController.h"
#include "tests/touchui/TouchDevice.h"
#include "touchui/KSInputContext.h"

#include <QClipboard>
#include <QDir>
#include <algorithm>

// The soft keyboard of the appliance and the text objects of a canvas, through the application's input
// context: what is typed, where the cursor goes, and how editing ends.
class tst_scenekeyboard : public QObject
{
    Q_OBJECT

public:
    // What a finger does, and in which state it finds the object.
    enum Touch { TapOnSelected, TapOnEdited, DoubleTap, DoubleTapOnEdited, LongPress };
    Q_ENUM(Touch)

private Q_SLOTS:
    void initTestCase();
    void init();
    void cleanup();
    void secondTapOpensTheKeyboard();
    void eachTouchAsksOnce_data();
    void eachTouchAsksOnce();
    void draggedSelectionAsksOncePerChange();
    void newTextIsTypedInto();
    void tapOnEmptyCanvasClosesTheKeyboard();
    void fourScripts_data();
    void fourScripts();
    void keysOfTheKeyboard();
    void emojiAndMarkSurvive();
    void cursorMessages_data();
    void cursorMessages();
    void cursorInsideACharacter();
    void cursorMessageDuringADrag();
    void changeOfTheWholeEndsEditing_data();
    void changeOfTheWholeEndsEditing();
    void renamedFolderEndsEditing();
    void closeOnText();
    void closeOnEmptiedObject();
    void closeOnBlanks();
    void closeMakesAStepOfTyping();
    void undoAfterCloseLosesNothing();
    void substitutionByTheKeyboard();
    void pasteOfTenThousand();
    void serviceDiesInMidWord();
    void serviceDiesWithoutATrace();

private:
    // What the service sends when a key of it is pressed.
    void sendKey(int key, const QString& text);
    void sendText(const QString& text) { m_context->sendInputString(text.toStdWString()); }
    void sendCursor(int begin, int end, int current, int mode);
    void sendClose();

    TouchDevice m_device;
    KSInputContext* m_context = nullptr;
    std::unique_ptr<FakeSoftKeyBoardController> m_keyboard;
};

void tst_scenekeyboard::initTestCase()
{
    qRegisterMetaType<TText*>("TText*");
    qApp->setObjectName(QStringLiteral("Titler"));
    m_context = KSInputContext::instance();
    QVERIFY(m_context);
}

void tst_scenekeyboard::init()
{
    messages = new FakeMessageBoxController;
    m_keyboard = std::make_unique<FakeSoftKeyBoardController>();
    m_context->setKeyBoardController(m_keyboard.get());
    InputLanguageFonts::resetLastFonts();
    InputLanguageFonts::mInputLanguage = 2;
    InputLanguageFonts::IS_CN_MODULE = false;
}

void tst_scenekeyboard::cleanup()
{
    m_context->setKeyBoardController(nullptr);
    m_keyboard.reset();
    delete messages;
    messages = nullptr;
}

void tst_scenekeyboard::sendKey(int key, const QString& text)
{
    SubCommonDefine::tagSoftKeyBoardKeyData data;
    data.key = key;
    data.text = text.toStdWString();
    data.eventType = QEvent::KeyPress;
    m_context->sendKey(data);
    data.eventType = QEvent::KeyRelease;
    m_context->sendKey(data);
}

void tst_scenekeyboard::sendCursor(int begin, int end, int current, int mode)
{
    SubCommonDefine::tagSoftKeyBoardKeyTextSelectionPos position;
    position.begin = begin;
    position.end = end;
    position.current = current;
    position.mode = mode;
    m_context->sendInputStringSelectionPos(position);
}

void tst_scenekeyboard::sendClose()
{
    SubCommonDefine::tagSoftKeyBoardKeyData data;
    data.eventType = KSInputContext::SoftKeyBoardCloseType;
    m_context->sendKey(data);
}

void tst_scenekeyboard::secondTapOpensTheKeyboard()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("MMMM")});
    GraphicsText* item = canvas.text(1);
    canvas.touchTap(canvas.caretIn(*item, 3));
    QVERIFY(m_keyboard->shown.isEmpty());
    canvas.touchTap(canvas.caretIn(*item, 3));
    QVERIFY(!m_keyboard->shown.isEmpty());
    const auto data = m_keyboard->shown.last();
    QCOMPARE(data.fieldKind, 0);
    QCOMPARE(data.title, std::wstring(L"Text Input"));
    QCOMPARE(data.keyboardType, 1);
    QCOMPARE(data.maxLength, 300);
    QCOMPARE(data.textLength, 3);
    QCOMPARE(data.selectionStart, 3);
    QCOMPARE(data.selectionEnd, 3);
    QCOMPARE(data.selectionMode, 0);
    QCOMPARE(data.lastValue, 300);
    QVERIFY(!KSInputContext::isSoftKeyboardClosed());
}

void tst_scenekeyboard::eachTouchAsksOnce_data()
{
    QTest::addColumn<Touch>("touch");
    QTest::addColumn<int>("begin");
    QTest::addColumn<int>("end");
    QTest::addColumn<int>("mode");
    QTest::newRow("tap on a selected object") << TapOnSelected << 3 << 3 << 0;
    QTest::newRow("tap on an edited object") << TapOnEdited << 3 << 3 << 0;
    QTest::newRow("double tap") << DoubleTap << -1 << -1 << 2;
    QTest::newRow("double tap on an edited object") << DoubleTapOnEdited << -1 << -1 << 2;
    QTest::newRow("long press") << LongPress << 3 << 4 << 1;
}

void tst_scenekeyboard::eachTouchAsksOnce()
{
    QFETCH(Touch, touch);
    QFETCH(int, begin);
    QFETCH(int, end);
    QFETCH(int, mode);
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("MMMMMM")});
    GraphicsText* item = canvas.text(1);
    const QPoint place = canvas.caretIn(*item, 3) + QPoint(1, 0);
    if (touch == DoubleTap)
        canvas.quickTap(place);
    else
        canvas.touchTap(place);
    if (touch == TapOnEdited || touch == LongPress)
        canvas.touchTap(canvas.caretIn(*item, 5));
    if (touch == DoubleTapOnEdited)
        canvas.quickTap(canvas.caretIn(*item, 5));
    m_keyboard->shown.clear();
    canvas.press(place);
    if (touch == LongPress)
        QTRY_VERIFY(item->isHandleCaret());
    canvas.release(place);
    QCOMPARE(m_keyboard->shown.size(), 1);
    const auto data = m_keyboard->shown.constLast();
    QCOMPARE(data.title, std::wstring(L"Text Input"));
    QCOMPARE(data.keyboardType, 1);
    QCOMPARE(data.selectionStart, begin);
    QCOMPARE(data.selectionEnd, end);
    QCOMPARE(data.textLength, end);
    QCOMPARE(data.selectionMode, mode);
    QVERIFY(!KSInputContext::isSoftKeyboardClosed());
}

void tst_scenekeyboard::draggedSelectionAsksOncePerChange()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("MMMMMMMM")});
    GraphicsText* item = canvas.text(1);
    canvas.edit(1, canvas.caretIn(*item, 2));
    sendCursor(2, 5, 5, 1);
    m_keyboard->shown.clear();
    canvas.slide(canvas.handleIn(*item, 5), canvas.handleIn(*item, 7));
    QCOMPARE(item->textCursor().position(), 7);
    QCOMPARE(m_keyboard->shown.constLast().selectionEnd, 7);
    QList<int> ends;
    for (const auto& data : std::as_const(m_keyboard->shown))
        ends.append(data.selectionEnd);
    // Lifting the finger selects nothing else.
    canvas.release(canvas.handleIn(*item, 7));
    QCOMPARE(m_keyboard->shown.size(), ends.size());
    QVERIFY(std::adjacent_find(ends.cbegin(), ends.cend()) == ends.cend());
}

void tst_scenekeyboard::newTextIsTypedInto()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({});
    canvas.scene->slotInsertNewTextItem();
    QCOMPARE(m_keyboard->shown.last().keyboardType, 0);
    QCOMPARE(m_keyboard->shown.last().selectionMode, 2);
    sendText("Breaking");
    QCOMPARE(canvas.text(1)->toPlainText(), QStringLiteral("Breaking"));
    QVERIFY(inStep(*canvas.text(1)));
    // The next request is one for a text that exists.
    sendKey(Qt::Key_Left, QString());
    QCOMPARE(m_keyboard->shown.last().keyboardType, 1);
    QCOMPARE(m_keyboard->shown.last().textLength, 7);
}

void tst_scenekeyboard::tapOnEmptyCanvasClosesTheKeyboard()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("MMMM")});
    canvas.edit(1, canvas.caretIn(*canvas.text(1), 2));
    QVERIFY(!KSInputContext::isSoftKeyboardClosed());
    // A tap on the object keeps the keyboard open.
    canvas.touchTap(canvas.caretIn(*canvas.text(1), 1));
    QVERIFY(!KSInputContext::isSoftKeyboardClosed());
    const qsizetype before = m_keyboard->calls.count("dummyClose");
    canvas.touchTap(QPoint(80, 600));
    QCOMPARE(m_keyboard->calls.count("dummyClose"), before + 1);
    QVERIFY(KSInputContext::isSoftKeyboardClosed());
}

void tst_scenekeyboard::fourScripts_data()
{
    QTest::addColumn<QString>("text");
    QTest::addColumn<int>("row");
    QTest::addColumn<QString>("latin");
    QTest::addColumn<QString>("asian");
    const QString mixed = QString::fromUtf8("News 快讯 ニュース 속보 é");
    QTest::newRow("chinese") << mixed << 0 << "DFHeiW5-A"
                             << "DFHeiW5-A";
    QTest::newRow("chinese mixed") << mixed << 1 << "KST"
                                   << "DFHeiW5-A";
    QTest::newRow("japanese") << mixed << 2 << "KST"
                              << "KST Japanese Pro";
    QTest::newRow("korean") << mixed << 3 << "KST"
                            << "YDGothic 100 Pro";
    QTest::newRow("other") << mixed << 4 << "KST"
                           << "KST";
}

void tst_scenekeyboard::fourScripts()
{
    QFETCH(QString, text);
    QFETCH(int, row);
    QFETCH(QString, latin);
    QFETCH(QString, asian);
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("a")});
    canvas.edit(1, canvas.caretIn(*canvas.text(1), 1));
    GraphicsText* item = canvas.text(1);
    item->setInputLanguage(row);
    if (row == 0)
        InputLanguageFonts::resetLastFonts();
    // Letter by letter, as a keyboard does.
    for (const QChar c : text)
        sendText(QString(c));
    QCOMPARE(item->toPlainText(), QLatin1Char('a') + text);
    QVERIFY(inStep(*item));
    const auto& styles = item->getItemTText()->textItems();
    for (int i = 1; i < int(styles.size()); ++i) {
        const QChar c = item->toPlainText().at(i);
        const bool isLatin = InputLanguageFonts::getSoftkeyboardMode(c) == InputLanguageFonts::Latin;
        // A change of script takes the family last used for that script; the first run keeps its own family.
        const QString expected = i <= 5 ? QStringLiteral("KST") : (isLatin ? latin : asian);
        QCOMPARE(QString::fromStdString(styles[size_t(i)]->getFontFamily()), expected);
        QCOMPARE(QString::fromStdString(styles[size_t(i)]->getAlphaDefaultFontOfInputLanguage()),
                 isLatin ? latin : asian);
    }
    sendClose();
    QCOMPARE(QString::fromStdString(canvas.saved()->getText()[0]->getText()), QLatin1Char('a') + text);
}

void tst_scenekeyboard::keysOfTheKeyboard()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({});
    canvas.scene->slotInsertNewTextItem();
    GraphicsText* item = canvas.text(1);
    for (const QChar c : QString::fromUtf8("abc快é"))
        sendKey(0, QString(c));
    sendKey(Qt::Key_Return, QStringLiteral("\r"));
    sendKey(0, QStringLiteral("d"));
    QCOMPARE(item->toPlainText(), QString::fromUtf8("abc快é\nd"));
    sendKey(Qt::Key_Backspace, QString());
    sendKey(Qt::Key_Backspace, QString());
    QCOMPARE(item->toPlainText(), QString::fromUtf8("abc快é"));
    QVERIFY(inStep(*item));
    // No key was sent back to the service it came from.
    QVERIFY(m_keyboard->keys.isEmpty());
    // A key of a physical keyboard goes to the service, which decides what becomes of it.
    QTest::keyClick(canvas.window.windowHandle(), Qt::Key_Q);
    QCOMPARE(item->toPlainText(), QString::fromUtf8("abc快é"));
    QCOMPARE(m_keyboard->keys.size(), 1);
}

void tst_scenekeyboard::emojiAndMarkSurvive()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({});
    canvas.scene->slotInsertNewTextItem();
    const QString text = QString::fromUtf8("a😀e\u0301b");
    sendText(text);
    GraphicsText* item = canvas.text(1);
    QCOMPARE(item->toPlainText(), text);
    QCOMPARE(item->getItemTText()->textItems().size(), size_t(6));
    // Styles the whole text, then half of a pair, which no tool can select alone.
    selectRange(*item, 0, 6);
    TText large = makeSource(makeStyle("", "KST", 150), 6);
    canvas.scene->slotChangeObjectTextStyle(&large, TextObjectConstants::PropertySize, 1);
    selectRange(*item, 1, 2);
    TText bold = makeSource(makeStyle(""), 1);
    bold.textItems()[0]->setFontBold(1);
    canvas.scene->slotChangeObjectTextStyle(&bold, TextObjectConstants::PropertyBold, 1);
    QCOMPARE(item->toPlainText(), text);
    QVERIFY(inStep(*item));
    // Saved and loaded.
    sendClose();
    const auto saved = canvas.saved();
    QVERIFY(saved);
    canvas.scene->slotUpdateArchive(saved.get());
    item = canvas.text(1);
    QCOMPARE(item->toPlainText(), text);
    QVERIFY(inStep(*item));
    const auto& styles = item->getItemTText()->textItems();
    QCOMPARE(styles[1]->getText(), std::string("😀"));
    QCOMPARE(styles[2]->getText(), std::string());
    QCOMPARE(styles[4]->getText(), std::string("\u0301"));
    for (const TextStyle* style : styles)
        QCOMPARE(style->getFontSize(), 150);
    QCOMPARE(styles[1]->isFontBold(), 1);
    // Undo and redo on a new canvas: erased by one key, as one character.
    item->initNewTextSelectAll();
    item->getSelectionInfo(0, 0, 3, 0);
    sendKey(Qt::Key_Backspace, QString());
    QCOMPARE(item->toPlainText(), QString::fromUtf8("ae\u0301b"));
    QVERIFY(inStep(*item));
}

void tst_scenekeyboard::cursorMessages_data()
{
    QTest::addColumn<int>("begin");
    QTest::addColumn<int>("end");
    QTest::addColumn<int>("current");
    QTest::addColumn<int>("mode");
    QTest::addColumn<int>("anchor");
    QTest::addColumn<int>("position");
    QTest::addColumn<bool>("handles");
    QTest::addColumn<bool>("shadow");
    QTest::newRow("cursor") << 0 << 0 << 4 << 0 << 4 << 4 << false << false;
    QTest::newRow("selection forward") << 1 << 5 << 0 << 1 << 1 << 5 << true << false;
    QTest::newRow("selection backward") << 5 << 1 << 0 << 1 << 5 << 1 << true << false;
    QTest::newRow("all of it by positions") << 0 << 8 << 0 << 1 << 0 << 8 << true << true;
    QTest::newRow("everything") << 0 << 0 << 0 << 2 << 0 << 8 << false << true;
    QTest::newRow("unknown mode") << 1 << 5 << 3 << 9 << 2 << 2 << false << false;
}

void tst_scenekeyboard::cursorMessages()
{
    QFETCH(int, begin);
    QFETCH(int, end);
    QFETCH(int, current);
    QFETCH(int, mode);
    QFETCH(int, anchor);
    QFETCH(int, position);
    QFETCH(bool, handles);
    QFETCH(bool, shadow);
    TouchCanvas canvas(m_device);
    canvas.show();
    TText record = makeRecord("MMMMMMMM");
    for (int i = 0; i < 8; ++i)
        record.textItems()[size_t(i)]->setFontSize(60 + i);
    canvas.open({record});
    GraphicsText* item = canvas.text(1);
    canvas.edit(1, canvas.caretIn(*item, 2));
    QSignalSpy modes(item, &GraphicsText::signalNotifyTextPropertyAreaObjectSelectionMode);
    QList<int> shown;
    connect(item, &GraphicsText::signalNotifyPropertyAreaObjectSelectionStyleChange, item,
            [&shown](TText* style) {
                shown.clear();
                for (const TextStyle* one : style->textItems())
                    shown.append(one->getFontSize());
            });
    sendCursor(begin, end, current, mode);
    QCOMPARE(item->textCursor().anchor(), anchor);
    QCOMPARE(item->textCursor().position(), position);
    QCOMPARE(item->isHandleCaret(), handles);
    QCOMPARE(item->textInteractionFlags(), Qt::TextEditorInteraction);
    if (mode <= 2)
        QCOMPARE(modes.last(), QVariantList({shadow, false}));
    else
        QCOMPARE(modes.count(), 0);
    // The panel shows the styles of the selection, or that of the character before the cursor.
    const int first = anchor == position ? position - 1 : qMin(anchor, position);
    QCOMPARE(shown.size(), qMax(1, qAbs(anchor - position)));
    QCOMPARE(shown.first(), 60 + first);
    QCOMPARE(canvas.stack.count(), 0);
}

// Keyboards may count characters differently: a cursor inside a pair is moved before it.
void tst_scenekeyboard::cursorInsideACharacter()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord(QString::fromUtf8("a😀b"))});
    GraphicsText* item = canvas.text(1);
    canvas.edit(1, canvas.caretIn(*item, 0));
    sendCursor(0, 0, 2, 0);
    QCOMPARE(item->textCursor().position(), 1);
    sendText(QStringLiteral("x"));
    QCOMPARE(item->toPlainText(), QString::fromUtf8("ax😀b"));
    sendCursor(3, 5, 5, 1);
    QCOMPARE(item->textCursor().selectionStart(), 2);
    QCOMPARE(item->textCursor().selectionEnd(), 5);
    sendText(QStringLiteral("y"));
    QCOMPARE(item->toPlainText(), QStringLiteral("axy"));
    QVERIFY(inStep(*item));
    sendClose();
    QCOMPARE(canvas.saved()->getText()[0]->getText(), std::string("axy"));
}

// While a finger drags a selection, the keyboard's answer to it must not move the cursor.
void tst_scenekeyboard::cursorMessageDuringADrag()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("MMMMMMMM")});
    GraphicsText* item = canvas.text(1);
    canvas.edit(1, canvas.caretIn(*item, 2));
    sendCursor(2, 5, 5, 1);
    canvas.slide(canvas.handleIn(*item, 5), canvas.handleIn(*item, 7));
    QCOMPARE(item->textCursor().position(), 7);
    sendCursor(0, 3, 0, 1);
    sendCursor(0, 0, 0, 0);
    QCOMPARE(item->textCursor().anchor(), 2);
    QCOMPARE(item->textCursor().position(), 7);
    canvas.release(canvas.handleIn(*item, 7));
    sendCursor(0, 3, 0, 1);
    QCOMPARE(item->textCursor().position(), 3);
}

void tst_scenekeyboard::changeOfTheWholeEndsEditing_data()
{
    QTest::addColumn<int>("property");
    QTest::newRow("align") << int(TextObjectConstants::PropertyAlign);
    QTest::newRow("shadow") << int(TextObjectConstants::PropertyShadow);
}

// These tools are enabled while the whole text is selected. Using one ends editing and selects the object.
void tst_scenekeyboard::changeOfTheWholeEndsEditing()
{
    QFETCH(int, property);
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("MMMM")});
    GraphicsText* item = canvas.text(1);
    canvas.quickTap(canvas.caretIn(*item, 2));
    canvas.quickTap(canvas.caretIn(*item, 2));
    QVERIFY(!KSInputContext::isSoftKeyboardClosed());
    const qsizetype before = m_keyboard->calls.count("dummyClose");
    TText source = makeSource(makeStyle("M"), 4);
    source.setTextAlign(1);
    source.setShadowStyle(1);
    canvas.scene->slotChangeObjectTextStyle(&source, property, 1);
    QCOMPARE(item->textInteractionFlags(), Qt::NoTextInteraction);
    QCOMPARE(m_keyboard->calls.count("dummyClose"), before + 1);
    QVERIFY(KSInputContext::isSoftKeyboardClosed());
    // The keyboard is not open while an object is selected, so it is not closed.
    source.setTextAlign(0);
    source.setShadowStyle(2);
    canvas.scene->slotChangeObjectTextStyle(&source, property, 1);
    QCOMPARE(m_keyboard->calls.count("dummyClose"), before + 1);
    QCOMPARE(canvas.stack.count(), 2);
}

// The file manager renames the open folder in mid word.
void tst_scenekeyboard::renamedFolderEndsEditing()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("M")});
    canvas.edit(1, canvas.caretIn(*canvas.text(1), 1));
    sendText("a");
    QVERIFY(!KSInputContext::isSoftKeyboardClosed());
    QSignalSpy exists(canvas.scene.get(), &CanvasScene::signalSceneNotifyIfExistSelectedObject);
    const QString after = canvas.folder.path() + QStringLiteral("/renamed");
    QVERIFY(QDir().mkpath(after));
    canvas.scene->folderRenamed(canvas.folder.path(), after);
    QVERIFY(!canvas.scene->itemIsEditorInteraction());
    QVERIFY(KSInputContext::isSoftKeyboardClosed());
    QVERIFY(!exists.isEmpty() && !exists.constLast().constFirst().toBool());
    QCOMPARE(canvas.text(1)->toPlainText(), QStringLiteral("Ma"));
}

void tst_scenekeyboard::closeOnText()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("MMMM")});
    GraphicsText* item = canvas.text(1);
    canvas.edit(1, canvas.caretIn(*item, 4));
    sendText("x");
    QSignalSpy closed(canvas.scene.get(), &CanvasScene::signalSceneSoftWareClosedWhenEditObject);
    QSignalSpy modes(canvas.scene.get(), &CanvasScene::signalSceneNotifyTextPropertyAreaObjectSelectionMode);
    QSignalSpy exists(canvas.scene.get(), &CanvasScene::signalSceneNotifyIfExistSelectedObject);
    sendClose();
    QCOMPARE(closed.count(), 1);
    QCOMPARE(item->getStatusId(), 0);
    QCOMPARE(item->textInteractionFlags(), Qt::NoTextInteraction);
    QVERIFY(!item->hasFocus());
    QVERIFY(!item->textCursor().hasSelection());
    QCOMPARE(item->parentTextItem()->getFocusFlag(), int(TextObjectConstants::FocusObject));
    QCOMPARE(modes.last(), QVariantList({true, true}));
    QCOMPARE(exists.last(), QVariantList({true}));
    QVERIFY(KSInputContext::isSoftKeyboardClosed());
    QCOMPARE(canvas.saved()->getText()[0]->getText(), std::string("MMMMx"));
    // The pictures are made when another title is shown.
    canvas.scene->slotMakeSceneThumnail();
    QCOMPARE(canvas.log.slow, 1);
}

void tst_scenekeyboard::closeOnEmptiedObject()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("M"), makeRecord("other", 2)});
    canvas.scene->clearItemsSelectionMode();
    GraphicsText* item = canvas.text(1);
    item->initNewTextSelectAll();
    sendCursor(0, 0, 0, 2);
    sendKey(Qt::Key_Backspace, QString());
    QCOMPARE(item->toPlainText(), QString());
    QSignalSpy exists(canvas.scene.get(), &CanvasScene::signalSceneNotifyIfExistSelectedObject);
    sendClose();
    QCOMPARE(canvas.text(1), nullptr);
    QVERIFY(canvas.text(2));
    QCOMPARE(exists.last(), QVariantList({false}));
    QCOMPARE(canvas.saved()->getText().size(), size_t(1));
    // First the object comes back, then its text.
    canvas.stack.undo();
    QVERIFY(canvas.text(1));
    QCOMPARE(canvas.text(1)->toPlainText(), QString());
    canvas.stack.undo();
    QCOMPARE(canvas.text(1)->toPlainText(), QStringLiteral("M"));
}

void tst_scenekeyboard::closeOnBlanks()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({});
    canvas.scene->slotInsertNewTextItem();
    sendText(QStringLiteral("  \n \t"));
    sendClose();
    QCOMPARE(canvas.text(1), nullptr);
}

void tst_scenekeyboard::closeMakesAStepOfTyping()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("M")});
    canvas.edit(1, canvas.caretIn(*canvas.text(1), 1));
    sendText("ab");
    QCOMPARE(canvas.stack.count(), 0);
    sendClose();
    QCOMPARE(canvas.stack.count(), 1);
    canvas.stack.undo();
    QCOMPARE(canvas.text(1)->toPlainText(), QStringLiteral("M"));
    canvas.stack.redo();
    QCOMPARE(canvas.text(1)->toPlainText(), QStringLiteral("Mab"));
    // Closing again without a change does not make an undo step.
    canvas.text(1)->initNewTextSelectAll();
    sendClose();
    QCOMPARE(canvas.stack.count(), 1);
}

// The window ends editing before it undoes; after the keyboard was closed, editing has ended already.
void tst_scenekeyboard::undoAfterCloseLosesNothing()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("M")});
    GraphicsText* item = canvas.text(1);
    canvas.edit(1, canvas.caretIn(*item, 1));
    sendText("a");
    item->pushLastEditTextIntoStack();
    sendText("b");
    sendClose();
    canvas.scene->clearItemsSelectionMode();
    canvas.stack.undo();
    QCOMPARE(item->toPlainText(), QStringLiteral("Ma"));
    canvas.stack.redo();
    QCOMPARE(item->toPlainText(), QStringLiteral("Mab"));

    // A drag after the keyboard was closed is an undo step of its own, after that of the typing.
    canvas.touchTap(canvas.pointOn(1));
    canvas.edit(1, canvas.caretIn(*item, 3));
    sendText("c");
    sendClose();
    const QPointF place = item->scenePos();
    canvas.touchDrag(canvas.pointOn(1), canvas.pointOn(1) + QPoint(40, 40));
    canvas.stack.undo();
    QCOMPARE(item->scenePos(), place);
    QCOMPARE(item->toPlainText(), QStringLiteral("Mabc"));
    canvas.stack.undo();
    QCOMPARE(item->toPlainText(), QStringLiteral("Mab"));
}

// A keyboard that converts replaces what it had sent.
void tst_scenekeyboard::substitutionByTheKeyboard()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    TText record = makeRecord("abni");
    record.textItems()[2]->setFontSize(70);
    record.textItems()[3]->setFontSize(80);
    canvas.open({record});
    GraphicsText* item = canvas.text(1);
    canvas.edit(1, canvas.caretIn(*item, 4));
    QSignalSpy modes(item, &GraphicsText::signalNotifyTextPropertyAreaObjectSelectionMode);
    sendCursor(2, 4, 4, 1);
    sendText(QString::fromUtf8("你"));
    QCOMPARE(item->toPlainText(), QString::fromUtf8("ab你"));
    QVERIFY(inStep(*item));
    QCOMPARE(canvas.stack.count(), 1);
    QCOMPARE(modes.last(), QVariantList({false, false}));
    QVERIFY(!item->isHandleCaret());
    canvas.stack.undo();
    QCOMPARE(item->toPlainText(), QStringLiteral("abni"));
    QCOMPARE(item->getItemTText()->textItems()[2]->getFontSize(), 70);
    QCOMPARE(item->getItemTText()->textItems()[3]->getFontSize(), 80);
}

void tst_scenekeyboard::pasteOfTenThousand()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("ab")});
    GraphicsText* item = canvas.text(1);
    canvas.edit(1, canvas.caretIn(*item, 1));
    QString text;
    for (int i = 0; i < 1000; ++i)
        text += QStringLiteral("123456789\n");
    sendText(text);
    const QString kept = item->toPlainText();
    QCOMPARE(kept.size() - kept.count(QLatin1Char('\n')), 300);
    QVERIFY(kept.startsWith(QStringLiteral("a123456789\n")));
    QVERIFY(kept.endsWith(QLatin1Char('b')));
    QVERIFY(inStep(*item));
    item->pushLastEditTextIntoStack();
    QCOMPARE(canvas.stack.count(), 1);
    canvas.stack.undo();
    QCOMPARE(item->toPlainText(), QStringLiteral("ab"));
    // Pasted text as well.
    canvas.touchTap(canvas.pointOn(1));
    sendClose();
    canvas.text(1)->initNewTextSelectAll();
    QGuiApplication::clipboard()->setText(QString(10000, 'x'));
    m_context->dummyCloseSoftKeyBoardWindow();
    QTest::keySequence(canvas.window.windowHandle(), QKeySequence::Paste);
    QCOMPARE(canvas.text(1)->toPlainText().size(), 300);
    QVERIFY(inStep(*canvas.text(1)));
}

void tst_scenekeyboard::serviceDiesInMidWord()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("M")});
    GraphicsText* item = canvas.text(1);
    canvas.edit(1, canvas.caretIn(*item, 1));
    sendText("Brea");
    QTest::keyClick(canvas.window.windowHandle(), Qt::Key_K);
    QCOMPARE(m_keyboard->keys.size(), 1);
    sendText("k");
    m_keyboard->alive = false;
    // Further keys must not wait for an answer, since the service is dead.
    for (const char letter : {'i', 'n', 'g'})
        QTest::keyClick(canvas.window.windowHandle(), letter);
    QCOMPARE(m_keyboard->keys.size(), 1);
    QCOMPARE(item->toPlainText(), QStringLiteral("MBreaking"));
    QVERIFY(KSInputContext::isSoftKeyboardClosed());
    QCOMPARE(item->getFocusFlag(), int(TextObjectConstants::FocusEdit));
    // Leaving the object saves the whole text as one undo step.
    canvas.touchTap(QPoint(80, 600));
    QCOMPARE(canvas.saved()->getText()[0]->getText(), std::string("MBreaking"));
    QCOMPARE(canvas.stack.count(), 1);
    // A tap into the text edits it without a keyboard.
    canvas.edit(1, canvas.caretIn(*item, 9));
    QTest::keyClick(canvas.window.windowHandle(), '!');
    QCOMPARE(item->toPlainText(), QStringLiteral("MBreaking!"));
}

// The keyboard service is dead: the typed text becomes an undo step and is saved without it.
void tst_scenekeyboard::serviceDiesWithoutATrace()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("M")});
    canvas.edit(1, canvas.caretIn(*canvas.text(1), 1));
    sendText("Brea");
    m_context->setKeyBoardController(nullptr);
    QCOMPARE(canvas.stack.count(), 0);
    QTRY_COMPARE(canvas.stack.count(), 1);
    QCOMPARE(canvas.saved()->getText()[0]->getText(), std::string("MBrea"));
    QCOMPARE(canvas.text(1)->getFocusFlag(), int(TextObjectConstants::FocusEdit));
}

int main(int argc, char** argv)
{
    KSInputContext::install();
    QApplication application(argc, argv);
    tst_scenekeyboard test;
    return QTest::qExec(&test, argc, argv);
}

#include "tst_scenekeyboard.moc"
