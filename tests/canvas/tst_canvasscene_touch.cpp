#include "CanvasFixture.h"
#include "tests/support/Patience.h"

// What fingers, keys and the soft keyboard do to the objects of a canvas.
class tst_canvasscene_touch : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void init();
    void cleanup();
    void tapSelectsThenEdits();
    void secondTapPlacesTheCursor();
    void dragMovesASelectedObject();
    void dragStopsAtTheLimit();
    void rightButtonDoesNothing();
    void releaseOnEmptyCanvas();
    void emptyObjectGoesAtTheNextRelease();
    void emptyObjectUnderTheFingerStays();
    void doubleTapSelectsAll();
    void longPressSelectsACharacter();
    void handleIsGrabbedBesideItsPicture();
    void keyboardClosedOnText();
    void keyboardClosedOnEmptiedObject();
    void keyboardCursor_data();
    void keyboardCursor();
    void dataInfo();
    void keyboardRequestNamesTheItem();
    void typingByKeys();
};

void tst_canvasscene_touch::initTestCase()
{
    qRegisterMetaType<TText*>("TText*");
}

void tst_canvasscene_touch::init()
{
    messages = new FakeMessageBoxController;
    InputLanguageFonts::resetLastFonts();
    InputLanguageFonts::mInputLanguage = 2;
    InputLanguageFonts::IS_CN_MODULE = false;
}

void tst_canvasscene_touch::cleanup()
{
    delete messages;
    messages = nullptr;
    ICanvasHost::setInstance(nullptr);
}

void tst_canvasscene_touch::tapSelectsThenEdits()
{
    Canvas canvas;
    canvas.show();
    canvas.open({makeRecord("abc")});
    GraphicsText* item = canvas.text(1);
    QSignalSpy keyboard(item, &GraphicsText::signalNotifySceneCurrentObjectInEditMode);
    QSignalSpy modes(canvas.scene.get(), &CanvasScene::signalSceneNotifyTextPropertyAreaObjectSelectionMode);
    QSignalSpy selected(canvas.scene.get(), &CanvasScene::signalSceneNotifyIfExistSelectedObject);
    canvas.tap(canvas.pointOn(1));
    QCOMPARE(item->getFocusFlag(), 1);
    QCOMPARE(item->getStatusId(), 0);
    QCOMPARE(item->textInteractionFlags(), Qt::NoTextInteraction);
    QCOMPARE(modes.last(), QVariantList({true, true}));
    QCOMPARE(selected.last(), QVariantList({true}));
    QCOMPARE(keyboard.last().at(0).value<GraphicsText*>(), nullptr);
    canvas.tap(canvas.pointOn(1));
    QCOMPARE(item->getFocusFlag(), 0);
    QCOMPARE(item->textInteractionFlags(), Qt::TextEditorInteraction);
    QCOMPARE(item->parentTextItem()->getFocusFlag(), 0);
    QCOMPARE(keyboard.last().at(0).value<GraphicsText*>(), item);
    QCOMPARE(modes.last(), QVariantList({false, false}));
    QVERIFY(item->hasFocus());
    QCOMPARE(canvas.stack.count(), 0);
}

void tst_canvasscene_touch::secondTapPlacesTheCursor()
{
    Canvas canvas;
    canvas.show();
    canvas.open({makeRecord("MMMM\nWWWW")});
    GraphicsText* item = canvas.text(1);
    for (const int position : {2, 7}) {
        canvas.scene->clearItemsSelectionAndFocus();
        QTextCursor before = item->textCursor();
        before.setPosition(0);
        item->setTextCursor(before);
        QTextCursor cursor(item->document());
        cursor.setPosition(position);
        const QTextBlock block = cursor.block();
        const QTextLine line = block.layout()->lineAt(0);
        const QPointF place(line.cursorToX(position - block.position()) + 27.0,
                            27.0 + (block.blockNumber() + 0.5) * line.height());
        const QPoint point = canvas.view.mapFromScene(item->mapToScene(place));
        canvas.tap(point);
        canvas.tap(point);
        QCOMPARE(item->textCursor().position(), position);
    }
}

void tst_canvasscene_touch::dragMovesASelectedObject()
{
    Canvas canvas;
    canvas.show();
    canvas.open({makeRecord("abc")});
    GraphicsText* item = canvas.text(1);
    canvas.tap(canvas.pointOn(1));
    canvas.drag(canvas.pointOn(1), canvas.pointOn(1) + QPoint(60, 30));
    QCOMPARE(item->getFocusFlag(), 1);
    QCOMPARE(item->scenePos(), QPointF(360.0, 230.0));
    QCOMPARE(item->pos(), QPointF());
    QCOMPARE(item->parentTextItem()->pos(), QPointF(360.0, 230.0));
    QCOMPARE(canvas.stack.count(), 1);
    QCOMPARE(canvas.saved()->getText()[0]->getXValue(), 360.0F);
    canvas.stack.undo();
    QCOMPARE(item->scenePos(), QPointF(300.0, 200.0));
    // An object that is not selected stays.
    canvas.scene->clearItemsSelectionMode();
    canvas.drag(canvas.pointOn(1), canvas.pointOn(1) + QPoint(60, 30));
    QCOMPARE(item->scenePos(), QPointF(300.0, 200.0));
}

void tst_canvasscene_touch::dragStopsAtTheLimit()
{
    Canvas canvas;
    canvas.show();
    TText record = makeRecord("abcdef");
    record.setXValue(10.0F);
    canvas.open({record});
    GraphicsText* item = canvas.text(1);
    canvas.tap(canvas.pointOn(1));
    const QPoint from = canvas.pointOn(1);
    QTest::mousePress(canvas.view.viewport(), Qt::LeftButton, {}, from);
    for (int x = from.x(); x > -1500; x -= 40)
        canvas.sendMove(QPoint(x, from.y()));
    QTest::mouseRelease(canvas.view.viewport(), Qt::LeftButton, {}, QPoint(5, from.y()));
    QCOMPARE(item->scenePos().x(), -(item->layoutRect().width() - 100.0));
    QCOMPARE(item->getFocusFlag(), 1);
    QCOMPARE(canvas.stack.count(), 1);
}

void tst_canvasscene_touch::rightButtonDoesNothing()
{
    Canvas canvas;
    canvas.show();
    canvas.open({makeRecord("abc")});
    QTest::mouseClick(canvas.view.viewport(), Qt::RightButton, {}, canvas.pointOn(1));
    QCOMPARE(canvas.text(1)->getFocusFlag(), -1);
    canvas.tap(canvas.pointOn(1));
    QCOMPARE(canvas.text(1)->getFocusFlag(), 1);
    // The right button does not end editing, either.
    QSignalSpy selected(canvas.scene.get(), &CanvasScene::signalSceneNotifyIfExistSelectedObject);
    for (const QPoint place : {canvas.pointOn(1), EmptyPlace}) {
        QTest::mouseClick(canvas.view.viewport(), Qt::RightButton, {}, place);
        QTest::mouseClick(canvas.view.viewport(), Qt::MiddleButton, {}, place);
        QCOMPARE(canvas.text(1)->getFocusFlag(), 1);
    }
    canvas.tap(canvas.pointOn(1));
    QCOMPARE(canvas.text(1)->textInteractionFlags(), Qt::TextEditorInteraction);
    selected.clear();
    for (const QPoint place : {canvas.pointOn(1), EmptyPlace}) {
        QTest::mouseClick(canvas.view.viewport(), Qt::RightButton, {}, place);
        QTest::mouseDClick(canvas.view.viewport(), Qt::RightButton, {}, place);
        QCOMPARE(canvas.text(1)->textInteractionFlags(), Qt::TextEditorInteraction);
    }
    QVERIFY(selected.isEmpty());
    // The next left press goes to the item at its place.
    canvas.tap(EmptyPlace);
    QCOMPARE(canvas.text(1)->textInteractionFlags(), Qt::NoTextInteraction);
}

void tst_canvasscene_touch::releaseOnEmptyCanvas()
{
    Canvas canvas;
    canvas.show();
    canvas.open({makeRecord("abc")});
    canvas.tap(canvas.pointOn(1));
    canvas.tap(canvas.pointOn(1));
    typeText(*canvas.text(1), "d");
    QSignalSpy selected(canvas.scene.get(), &CanvasScene::signalSceneNotifyIfExistSelectedObject);
    QSignalSpy pressed(canvas.scene.get(), &CanvasScene::signalCanvasSceneMousePressed);
    canvas.tap(EmptyPlace);
    QCOMPARE(selected.last(), QVariantList({false}));
    QCOMPARE(pressed.count(), 1);
    QCOMPARE(canvas.text(1)->getFocusFlag(), -1);
    QCOMPARE(canvas.text(1)->textInteractionFlags(), Qt::NoTextInteraction);
    // What was typed became a step.
    QCOMPARE(canvas.stack.count(), 1);
}

void tst_canvasscene_touch::emptyObjectGoesAtTheNextRelease()
{
    Canvas canvas;
    canvas.show();
    canvas.open({makeRecord("abc")});
    canvas.scene->slotInsertNewTextItem();
    QVERIFY(canvas.text(2));
    typeText(*canvas.text(2), "  \n ");
    canvas.text(2)->pushLastEditTextIntoStack();
    const int steps = canvas.stack.count();
    canvas.tap(canvas.pointOn(1));
    QCOMPARE(canvas.text(2), nullptr);
    QCOMPARE(canvas.stack.count(), steps + 1);
    canvas.stack.undo();
    QVERIFY(canvas.text(2));
}

void tst_canvasscene_touch::emptyObjectUnderTheFingerStays()
{
    Canvas canvas;
    canvas.show();
    canvas.open({});
    canvas.scene->slotInsertNewTextItem();
    canvas.tap(canvas.pointOn(1));
    QVERIFY(canvas.text(1));
    canvas.tap(EmptyPlace);
    canvas.scene->slotDeleteEmptyItems();
    QCOMPARE(canvas.text(1), nullptr);
}

void tst_canvasscene_touch::doubleTapSelectsAll()
{
    Canvas canvas;
    canvas.show();
    canvas.open({makeRecord("abc def")});
    GraphicsText* item = canvas.text(1);
    canvas.tap(canvas.pointOn(1));
    canvas.tap(canvas.pointOn(1));
    QTest::mouseDClick(canvas.view.viewport(), Qt::LeftButton, {}, canvas.pointOn(1));
    QCOMPARE(item->textCursor().selectionStart(), 0);
    QCOMPARE(item->textCursor().selectionEnd(), 7);
    QVERIFY(item->isDoubleClickedSelection());
    QVERIFY(!item->isHandleCaret());
}

void tst_canvasscene_touch::longPressSelectsACharacter()
{
    Canvas canvas;
    canvas.show();
    canvas.open({makeRecord("abcdef")});
    GraphicsText* item = canvas.text(1);
    canvas.tap(canvas.pointOn(1));
    canvas.tap(canvas.pointOn(1));
    QTest::mousePress(canvas.view.viewport(), Qt::LeftButton, {}, canvas.pointOn(1));
    QVERIFY(!item->textCursor().hasSelection());
    QTRY_VERIFY(item->textCursor().hasSelection());
    QCOMPARE(item->textCursor().selectionEnd() - item->textCursor().selectionStart(), 1);
    QVERIFY(item->isHandleCaret());
    QTest::mouseRelease(canvas.view.viewport(), Qt::LeftButton, {}, canvas.pointOn(1));
    QVERIFY(item->isHandleCaret());
}

void tst_canvasscene_touch::handleIsGrabbedBesideItsPicture()
{
    Canvas canvas;
    canvas.show();
    canvas.open({makeRecord("abcdefgh")});
    GraphicsText* item = canvas.text(1);
    canvas.tap(canvas.pointOn(1));
    canvas.tap(canvas.pointOn(1));
    item->getSelectionInfo(2, 5, 5, 1);
    QVERIFY(item->isHandleCaret());
    QLineF line;
    QPointF point;
    int block = 0;
    QVERIFY(CaretGeometry(*item->document()).caretPoint(line, point, block, 5));
    const QPointF beside = point + QPointF(24.0 + 7.0, 10.0);
    const QPoint pressed = canvas.view.mapFromScene(item->mapToScene(beside));
    QTest::mousePress(canvas.view.viewport(), Qt::LeftButton, {}, pressed);
    // A press beside the handle starts at its other end; a drag selects from there.
    QVERIFY(CaretGeometry(*item->document()).caretPoint(line, point, block, 7));
    const QPointF target = point + QPointF(12.0, 10.0);
    canvas.sendMove(canvas.view.mapFromScene(item->mapToScene(target)) + QPoint(0, 5));
    canvas.sendMove(canvas.view.mapFromScene(item->mapToScene(target)));
    QVERIFY(item->textCursor().hasSelection());
    QTest::mouseRelease(canvas.view.viewport(), Qt::LeftButton, {},
                        canvas.view.mapFromScene(item->mapToScene(target)));
    QVERIFY(item->textCursor().hasSelection());
    QVERIFY(item->isHandleCaret());
}

void tst_canvasscene_touch::keyboardClosedOnText()
{
    Canvas canvas;
    canvas.open({makeRecord("abc")});
    canvas.text(1)->initNewTextSelectAll();
    typeTextAt(*canvas.text(1), 3, "d");
    QSignalSpy closed(canvas.scene.get(), &CanvasScene::signalSceneSoftWareClosedWhenEditObject);
    QEvent close(QEvent::Type(1100));
    QCoreApplication::sendEvent(canvas.text(1), &close);
    QCOMPARE(closed.count(), 1);
    QCOMPARE(canvas.text(1)->getStatusId(), 0);
    QCOMPARE(canvas.saved()->getText()[0]->getText(), std::string("abcd"));
}

void tst_canvasscene_touch::keyboardClosedOnEmptiedObject()
{
    Canvas canvas;
    canvas.open({makeRecord("a"), makeRecord("b", 2)});
    canvas.text(1)->initNewTextSelectAll();
    QTextCursor cursor = canvas.text(1)->textCursor();
    cursor.setPosition(1);
    cursor.deletePreviousChar();
    QSignalSpy selected(canvas.scene.get(), &CanvasScene::signalSceneNotifyIfExistSelectedObject);
    QEvent close(QEvent::Type(1100));
    QCoreApplication::sendEvent(canvas.text(1), &close);
    QCOMPARE(canvas.text(1), nullptr);
    QCOMPARE(selected.last(), QVariantList({false}));
    QCOMPARE(canvas.saved()->getText().size(), size_t(1));
}

void tst_canvasscene_touch::keyboardCursor_data()
{
    QTest::addColumn<int>("begin");
    QTest::addColumn<int>("end");
    QTest::addColumn<int>("current");
    QTest::addColumn<int>("mode");
    QTest::addColumn<int>("anchor");
    QTest::addColumn<int>("position");
    QTest::addColumn<bool>("handles");
    QTest::addColumn<bool>("shadow");
    QTest::newRow("place") << 0 << 0 << 3 << 0 << 3 << 3 << false << false;
    QTest::newRow("forward") << 1 << 4 << 0 << 1 << 1 << 4 << true << false;
    QTest::newRow("backward") << 4 << 1 << 0 << 1 << 4 << 1 << true << false;
    QTest::newRow("everything by hand") << 0 << 6 << 0 << 1 << 0 << 6 << true << true;
    QTest::newRow("everything") << 0 << 0 << 0 << 2 << 0 << 6 << false << true;
    QTest::newRow("far outside") << -9 << 900 << 0 << 1 << 0 << 6 << true << true;
}

void tst_canvasscene_touch::keyboardCursor()
{
    QFETCH(int, begin);
    QFETCH(int, end);
    QFETCH(int, current);
    QFETCH(int, mode);
    QFETCH(int, anchor);
    QFETCH(int, position);
    QFETCH(bool, handles);
    QFETCH(bool, shadow);
    Canvas canvas;
    canvas.open({makeRecord("abcdef")});
    GraphicsText* item = canvas.text(1);
    item->initNewTextSelectAll();
    QSignalSpy modes(item, &GraphicsText::signalNotifyTextPropertyAreaObjectSelectionMode);
    KSSoftKeyboardCursorSettingEvent event(begin, end, current, mode);
    QCoreApplication::sendEvent(item, &event);
    QCOMPARE(item->textCursor().anchor(), anchor);
    QCOMPARE(item->textCursor().position(), position);
    QCOMPARE(item->isHandleCaret(), handles);
    QCOMPARE(modes.last(), QVariantList({shadow, false}));
}

void tst_canvasscene_touch::dataInfo()
{
    Canvas canvas;
    canvas.open({makeRecord("abcdef")});
    GraphicsText* item = canvas.text(1);
    QCOMPARE(canvas.scene->getNewTextDataInfo(""), QStringLiteral("0#Text Input#0#300##-1#-1#-1#2##300"));
    QCOMPARE(canvas.scene->getDoubleClickDataInfo(""), QStringLiteral("0#Text Input#1#300##-1#-1#-1#2##300"));
    item->initNewTextSelectAll();
    item->getSelectionInfo(0, 0, 4, 0);
    QCOMPARE(canvas.scene->getCommonStateDataInfo("", item),
             QStringLiteral("0#Text Input#1#300##4#4#4#0##300"));
    item->getSelectionInfo(1, 4, 0, 1);
    QCOMPARE(canvas.scene->getCommonStateDataInfo("", item),
             QStringLiteral("0#Text Input#1#300##4#1#4#1##300"));
    item->getSelectionInfo(4, 1, 0, 1);
    QCOMPARE(canvas.scene->getCommonStateDataInfo("t", item),
             QStringLiteral("0#Text Input#1#300#t#1#4#1#1##300"));
}

void tst_canvasscene_touch::keyboardRequestNamesTheItem()
{
    Canvas canvas;
    canvas.show();
    canvas.open({});
    canvas.scene->slotInsertNewTextItem();
    GraphicsText* item = canvas.text(1);
    QCOMPARE(item->objectName(), canvas.scene->getNewTextDataInfo(""));
    // Only the first request of a new object is one for a new text.
    QTest::keyClick(canvas.view.viewport(), Qt::Key_A);
    QTest::keyClick(canvas.view.viewport(), Qt::Key_Left);
    QCOMPARE(item->objectName(), QStringLiteral("0#Text Input#1#300##0#0#0#0##300"));
}

void tst_canvasscene_touch::typingByKeys()
{
    Canvas canvas;
    canvas.show();
    canvas.open({});
    canvas.scene->slotInsertNewTextItem();
    QTest::keyClicks(canvas.view.viewport(), "Breaking ");
    QTest::keyClick(canvas.view.viewport(), Qt::Key_Return);
    for (const QChar c : QString::fromUtf8("速報é"))
        QTest::sendKeyEvent(QTest::Click, canvas.view.viewport(), Qt::Key_unknown, QString(c),
                            Qt::NoModifier);
    GraphicsText* item = canvas.text(1);
    QCOMPARE(item->toPlainText(), QString::fromUtf8("Breaking \n速報é"));
    QVERIFY(inStep(*item));
    QTest::keyClick(canvas.view.viewport(), Qt::Key_Backspace);
    QTest::keyClick(canvas.view.viewport(), Qt::Key_Home, Qt::ControlModifier);
    QTest::keyClick(canvas.view.viewport(), Qt::Key_Delete);
    QCOMPARE(item->toPlainText(), QString::fromUtf8("reaking \n速報"));
    QVERIFY(inStep(*item));
    // The document has no undo of its own.
    QTest::keyClick(canvas.view.viewport(), Qt::Key_Z, Qt::ControlModifier);
    QCOMPARE(item->toPlainText(), QString::fromUtf8("reaking \n速報"));
    // Keys find the object although the scene lost the focus.
    canvas.scene->setFocusItem(nullptr);
    QTest::keyClick(canvas.view.viewport(), Qt::Key_B);
    QCOMPARE(item->toPlainText(), QString::fromUtf8("breaking \n速報"));
}

QTEST_MAIN(tst_canvasscene_touch)
#include "tst_canvasscene_touch.moc"
