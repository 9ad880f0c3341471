#include "TouchCanvas.h"

#include "tests/touchui/TouchDevice.h"

#include <QTouchEvent>

// What one finger does to the text objects of a canvas, as touches that pass the application's gate: select,
// edit, drag, and that a second finger changes nothing.
class tst_touchtexteditor_taps : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void init();
    void cleanup();
    void firstTapSelects();
    void secondTapEditsWhereItFell_data();
    void secondTapEditsWhereItFell();
    void thirdTapStaysInEditing();
    void tapBesideTheText();
    void tapOnAnotherObject();
    void tapOnEmptyCanvas();
    void dragOfASelectedObject();
    void dragOfAnObjectThatIsNotSelected();
    void dragWhileEditingMovesNothing();
    void jitterIsATap();
    void dragAgainstALimit_data();
    void dragAgainstALimit();
    void fingerReturnsFromALimit_data();
    void fingerReturnsFromALimit();
    void doubleTap();
    void doubleTapOnASelectedObject();
    void tapAfterADoubleTap();
    void cancelledDragPutsTheObjectBack();
    void cancelledTapChoosesNothing();
    void frameIsNoHandle();
    void secondFingerOnTheCanvas();
    void secondFingerOnAButton();
    void fingerOnAButtonBeforeTheCanvas();

private:
    TouchDevice m_device;
};

void tst_touchtexteditor_taps::initTestCase()
{
    qRegisterMetaType<TText*>("TText*");
}

void tst_touchtexteditor_taps::init()
{
    messages = new FakeMessageBoxController;
    InputLanguageFonts::resetLastFonts();
    InputLanguageFonts::mInputLanguage = 2;
    InputLanguageFonts::IS_CN_MODULE = false;
}

void tst_touchtexteditor_taps::cleanup()
{
    delete messages;
    messages = nullptr;
}

void tst_touchtexteditor_taps::firstTapSelects()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("abc")});
    GraphicsText* item = canvas.text(1);
    QSignalSpy keyboard(item, &GraphicsText::signalNotifySceneCurrentObjectInEditMode);
    QSignalSpy modes(canvas.scene.get(), &CanvasScene::signalSceneNotifyTextPropertyAreaObjectSelectionMode);
    QSignalSpy exists(canvas.scene.get(), &CanvasScene::signalSceneNotifyIfExistSelectedObject);
    int shown = 0;
    connect(item, &GraphicsText::signalNotifyPropertyAreaObjectSelectionStyleChange, item,
            [&shown](TText* style) { shown = int(style->textItems().size()); });
    canvas.touchTap(canvas.characterIn(*item, 1));
    QCOMPARE(item->getFocusFlag(), int(TextObjectConstants::FocusObject));
    QCOMPARE(item->getBoundingLineStatus(), int(TextObjectConstants::FocusObject));
    QCOMPARE(item->parentTextItem()->getFocusFlag(), int(TextObjectConstants::FocusObject));
    QCOMPARE(item->textInteractionFlags(), Qt::NoTextInteraction);
    QVERIFY(!item->textCursor().hasSelection());
    QVERIFY(!item->isHandleCaret());
    // The panel shows every character, and all its tools apply.
    QCOMPARE(shown, 3);
    QCOMPARE(modes.last(), QVariantList({true, true}));
    QCOMPARE(exists.last(), QVariantList({true}));
    // No keyboard.
    QCOMPARE(keyboard.last().at(0).value<GraphicsText*>(), nullptr);
    QCOMPARE(canvas.stack.count(), 0);
}

void tst_touchtexteditor_taps::secondTapEditsWhereItFell_data()
{
    QTest::addColumn<int>("position");
    for (const int position : {0, 1, 3, 4, 5, 6, 9})
        QTest::addRow("position %d", position) << position;
}

void tst_touchtexteditor_taps::secondTapEditsWhereItFell()
{
    QFETCH(int, position);
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord(QString::fromUtf8("MMMM\n速報WM"))});
    GraphicsText* item = canvas.text(1);
    QSignalSpy keyboard(item, &GraphicsText::signalNotifySceneCurrentObjectInEditMode);
    QSignalSpy modes(canvas.scene.get(), &CanvasScene::signalSceneNotifyTextPropertyAreaObjectSelectionMode);
    canvas.touchTap(canvas.characterIn(*item, 1));
    canvas.touchTap(canvas.caretIn(*item, position));
    QCOMPARE(item->getFocusFlag(), int(TextObjectConstants::FocusEdit));
    QCOMPARE(item->parentTextItem()->getFocusFlag(), int(TextObjectConstants::FocusEdit));
    QCOMPARE(item->textInteractionFlags(), Qt::TextEditorInteraction);
    QVERIFY(item->hasFocus());
    QCOMPARE(item->textCursor().position(), position);
    QVERIFY(!item->isHandleCaret());
    QCOMPARE(modes.last(), QVariantList({false, false}));
    QCOMPARE(keyboard.last().at(0).value<GraphicsText*>(), item);
    QCOMPARE(canvas.stack.count(), 0);
}

void tst_touchtexteditor_taps::thirdTapStaysInEditing()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("MMMMMM")});
    GraphicsText* item = canvas.text(1);
    canvas.edit(1, canvas.caretIn(*item, 1));
    canvas.touchTap(canvas.caretIn(*item, 4));
    QCOMPARE(item->getFocusFlag(), int(TextObjectConstants::FocusEdit));
    QCOMPARE(item->textCursor().position(), 4);
    QVERIFY(!item->textCursor().hasSelection());
}

void tst_touchtexteditor_taps::tapBesideTheText()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("MM\nMMMMMM")});
    GraphicsText* item = canvas.text(1);
    const QRectF area = item->layoutRect();
    // Within the frame, but beside and below the characters.
    canvas.edit(1, canvas.inView(*item, QPointF(area.right() - 4.0, 50.0)));
    QCOMPARE(item->textCursor().position(), 2);
    canvas.scene->clearItemsSelectionAndFocus();
    canvas.edit(1, canvas.inView(*item, QPointF(area.right() - 4.0, area.bottom() - 30.0)));
    QCOMPARE(item->textCursor().position(), 9);
    // Below the last line, where the handles hang: the last line, in the column of the first.
    canvas.scene->clearItemsSelectionAndFocus();
    canvas.edit(1, canvas.inView(*item, QPointF(area.right() - 4.0, area.bottom() - 10.0)));
    QCOMPARE(item->textCursor().position(), 5);
}

void tst_touchtexteditor_taps::tapOnAnotherObject()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    TText other = makeRecord("other", 2);
    other.setYValue(450.0F);
    canvas.open({makeRecord("abc"), other});
    GraphicsText* item = canvas.text(1);
    canvas.edit(1, canvas.caretIn(*item, 3));
    typeText(*item, "d");
    canvas.touchTap(canvas.characterIn(*canvas.text(2), 2));
    QCOMPARE(item->getFocusFlag(), int(TextObjectConstants::FocusNone));
    QCOMPARE(item->textInteractionFlags(), Qt::NoTextInteraction);
    QCOMPARE(item->parentTextItem()->getFocusFlag(), int(TextObjectConstants::FocusNone));
    QCOMPARE(canvas.text(2)->getFocusFlag(), int(TextObjectConstants::FocusObject));
    // Leaving made a step of what was typed.
    QCOMPARE(canvas.stack.count(), 1);
    QCOMPARE(canvas.saved()->getText()[0]->getText(), std::string("abcd"));
}

void tst_touchtexteditor_taps::tapOnEmptyCanvas()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("abc")});
    canvas.edit(1, canvas.caretIn(*canvas.text(1), 1));
    QSignalSpy exists(canvas.scene.get(), &CanvasScene::signalSceneNotifyIfExistSelectedObject);
    QSignalSpy pressed(canvas.scene.get(), &CanvasScene::signalCanvasSceneMousePressed);
    // The point is on the screen of the test; touches outside of it do not reach a window.
    canvas.touchTap(QPoint(80, 600));
    QCOMPARE(canvas.text(1)->getFocusFlag(), int(TextObjectConstants::FocusNone));
    QCOMPARE(canvas.text(1)->textInteractionFlags(), Qt::NoTextInteraction);
    QCOMPARE(exists.last(), QVariantList({false}));
    QCOMPARE(pressed.count(), 1);
    QVERIFY(!canvas.scene->itemIsEditorInteraction());
    QVERIFY(!canvas.scene->itemIsSelectionMode());
}

void tst_touchtexteditor_taps::dragOfASelectedObject()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("abc")});
    GraphicsText* item = canvas.text(1);
    canvas.touchTap(canvas.pointOn(1));
    QSignalSpy keyboard(item, &GraphicsText::signalNotifySceneCurrentObjectInEditMode);
    QList<QPointF> reported;
    connect(item, &GraphicsText::signalNotifyPropertyAreaObjectSelectionStyleChange, item,
            [&reported](TText* style) { reported.append(QPointF(style->getXValue(), style->getYValue())); });
    const QPoint from = canvas.pointOn(1);
    canvas.slide(from, from + QPoint(64, -32));
    // Under way the object follows, and no step is made.
    QCOMPARE(item->scenePos(), QPointF(364.0, 168.0));
    QCOMPARE(canvas.stack.count(), 0);
    canvas.release(from + QPoint(64, -32));
    QCOMPARE(item->scenePos(), QPointF(364.0, 168.0));
    QCOMPARE(item->pos(), QPointF());
    QCOMPARE(item->getFocusFlag(), int(TextObjectConstants::FocusObject));
    QCOMPARE(item->textInteractionFlags(), Qt::NoTextInteraction);
    QCOMPARE(keyboard.last().at(0).value<GraphicsText*>(), nullptr);
    QCOMPARE(canvas.stack.count(), 1);
    QVERIFY(reported.contains(QPointF(364.0, 168.0)));
    QCOMPARE(item->getItemTText()->getXValue(), 364.0F);
    QCOMPARE(canvas.saved()->getText()[0]->getYValue(), 168.0F);
    canvas.stack.undo();
    QCOMPARE(item->scenePos(), QPointF(300.0, 200.0));
    QCOMPARE(canvas.saved()->getText()[0]->getXValue(), 300.0F);
    canvas.stack.redo();
    QCOMPARE(item->scenePos(), QPointF(364.0, 168.0));
}

void tst_touchtexteditor_taps::dragOfAnObjectThatIsNotSelected()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("abc")});
    canvas.touchDrag(canvas.pointOn(1), canvas.pointOn(1) + QPoint(64, 32));
    QCOMPARE(canvas.text(1)->scenePos(), QPointF(300.0, 200.0));
    QCOMPARE(canvas.text(1)->getFocusFlag(), int(TextObjectConstants::FocusObject));
    QCOMPARE(canvas.stack.count(), 0);
}

void tst_touchtexteditor_taps::dragWhileEditingMovesNothing()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("MMMM")});
    GraphicsText* item = canvas.text(1);
    canvas.edit(1, canvas.caretIn(*item, 1));
    canvas.touchDrag(canvas.caretIn(*item, 1), canvas.caretIn(*item, 3));
    QCOMPARE(item->scenePos(), QPointF(300.0, 200.0));
    QCOMPARE(item->getFocusFlag(), int(TextObjectConstants::FocusEdit));
    // Without handles a drag changes nothing.
    QVERIFY(!item->textCursor().hasSelection());
    QCOMPARE(canvas.stack.count(), 0);
}

void tst_touchtexteditor_taps::jitterIsATap()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("abc")});
    const QPoint point = canvas.pointOn(1);
    canvas.touchTap(point);
    canvas.press(point);
    canvas.move(point + QPoint(3, 3));
    canvas.move(point + QPoint(-3, 2));
    canvas.release(point);
    QCOMPARE(canvas.text(1)->scenePos(), QPointF(300.0, 200.0));
    QCOMPARE(canvas.text(1)->getFocusFlag(), int(TextObjectConstants::FocusEdit));
}

void tst_touchtexteditor_taps::dragAgainstALimit_data()
{
    QTest::addColumn<QPoint>("direction");
    QTest::newRow("left") << QPoint(-1, 0);
    QTest::newRow("right") << QPoint(1, 0);
    QTest::newRow("top") << QPoint(0, -1);
    QTest::newRow("bottom") << QPoint(0, 1);
}

void tst_touchtexteditor_taps::dragAgainstALimit()
{
    QFETCH(QPoint, direction);
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("abcdef\nghi")});
    GraphicsText* item = canvas.text(1);
    canvas.touchTap(canvas.pointOn(1));
    const QPoint from = canvas.pointOn(1);
    const QPoint to = from + direction * 1600;
    canvas.pressAndDrag(from, to);
    canvas.release(to);
    const QSizeF size = item->layoutRect().size();
    QPointF expected(300.0, 200.0);
    if (direction.x() < 0)
        expected.setX(-(size.width() - 100.0));
    else if (direction.x() > 0)
        expected.setX(1280.0 - 100.0);
    else if (direction.y() < 0)
        expected.setY(-(size.height() - 100.0));
    else
        expected.setY(720.0 - 100.0);
    QCOMPARE(item->scenePos(), expected);
    QCOMPARE(item->parentTextItem()->pos(), expected);
    QCOMPARE(item->pos(), QPointF());
    QCOMPARE(item->getFocusFlag(), int(TextObjectConstants::FocusObject));
    QCOMPARE(canvas.stack.count(), 1);
    QCOMPARE(item->getItemTText()->getXValue(), float(expected.x()));
    QCOMPARE(item->getItemTText()->getYValue(), float(expected.y()));
    const auto saved = canvas.saved();
    QVERIFY(qAbs(saved->getText()[0]->getXValue() - float(expected.x())) < 0.01F);
    QVERIFY(qAbs(saved->getText()[0]->getYValue() - float(expected.y())) < 0.01F);
    canvas.stack.undo();
    QCOMPARE(item->scenePos(), QPointF(300.0, 200.0));
}

void tst_touchtexteditor_taps::fingerReturnsFromALimit_data()
{
    QTest::addColumn<QPoint>("direction");
    QTest::addColumn<double>("factor");
    QTest::newRow("left") << QPoint(-1, 0) << 2.0;
    QTest::newRow("top") << QPoint(0, -1) << 3.0;
}

// Held at the left or upper side, the object waits until the finger has come back a good way.
void tst_touchtexteditor_taps::fingerReturnsFromALimit()
{
    QFETCH(QPoint, direction);
    QFETCH(double, factor);
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("abcdef\nghi")});
    GraphicsText* item = canvas.text(1);
    canvas.touchTap(canvas.pointOn(1));
    const QPoint from = canvas.pointOn(1);
    const QPoint to = from + direction * 1600;
    canvas.pressAndDrag(from, to);
    const QPointF held = item->scenePos();
    const double reach =
        direction.x() != 0 ? item->layoutRect().width() - 100.0 : item->layoutRect().height() - 100.0;
    // The position of the finger from which on the object follows.
    const int turn = int((factor - 1.0) * reach);
    const QPoint along = direction.x() != 0 ? QPoint(1, 0) : QPoint(0, 1);
    const QPoint still = direction.x() != 0 ? QPoint(0, from.y()) : QPoint(from.x(), 0);
    canvas.move(still + along * (turn - 20));
    QCOMPARE(item->scenePos(), held);
    canvas.move(still + along * (turn - 4));
    QCOMPARE(item->scenePos(), held);
    canvas.move(still + along * (turn + 6));
    canvas.move(still + along * (turn + 16));
    const QPointF moved = item->scenePos() - held;
    QVERIFY2(direction.x() != 0 ? moved.x() > 5.0 && moved.x() < 30.0 : moved.y() > 5.0 && moved.y() < 30.0,
             qPrintable(QString("%1 %2").arg(moved.x()).arg(moved.y())));
    canvas.release(still + along * (turn + 16));
    QCOMPARE(canvas.stack.count(), 1);
}

void tst_touchtexteditor_taps::doubleTap()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("abc def")});
    GraphicsText* item = canvas.text(1);
    QSignalSpy modes(canvas.scene.get(), &CanvasScene::signalSceneNotifyTextPropertyAreaObjectSelectionMode);
    QSignalSpy keyboard(item, &GraphicsText::signalNotifySceneCurrentObjectInEditMode);
    canvas.quickTap(canvas.pointOn(1));
    canvas.quickTap(canvas.pointOn(1));
    QCOMPARE(item->textCursor().selectionStart(), 0);
    QCOMPARE(item->textCursor().selectionEnd(), 7);
    QCOMPARE(item->getFocusFlag(), int(TextObjectConstants::FocusEdit));
    QCOMPARE(item->textInteractionFlags(), Qt::TextEditorInteraction);
    QVERIFY(item->isDoubleClickedSelection());
    QVERIFY(!item->isHandleCaret());
    // The keyboard learns that everything is selected.
    QCOMPARE(keyboard.last().at(0).value<GraphicsText*>(), item);
    QCOMPARE(item->objectName(), canvas.scene->getDoubleClickDataInfo(QString()));
    QCOMPARE(modes.last(), QVariantList({true, false}));
}

void tst_touchtexteditor_taps::doubleTapOnASelectedObject()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("abc def")});
    GraphicsText* item = canvas.text(1);
    canvas.touchTap(canvas.pointOn(1));
    canvas.quickTap(canvas.pointOn(1));
    canvas.quickTap(canvas.pointOn(1));
    QCOMPARE(item->textCursor().selectionEnd() - item->textCursor().selectionStart(), 7);
    QVERIFY(item->isDoubleClickedSelection());
    // A typed key replaces all of it in one step.
    QTest::keyClick(canvas.view.viewport(), Qt::Key_X);
    QCOMPARE(item->toPlainText(), QStringLiteral("x"));
    QVERIFY(!item->isDoubleClickedSelection());
    QCOMPARE(canvas.stack.count(), 1);
    canvas.stack.undo();
    QCOMPARE(canvas.text(1)->toPlainText(), QStringLiteral("abc def"));
}

void tst_touchtexteditor_taps::tapAfterADoubleTap()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("MMMMMM")});
    GraphicsText* item = canvas.text(1);
    canvas.quickTap(canvas.pointOn(1));
    canvas.quickTap(canvas.pointOn(1));
    canvas.view.mouseClick();
    canvas.touchTap(canvas.caretIn(*item, 2));
    QVERIFY(!item->isDoubleClickedSelection());
    QVERIFY(!item->textCursor().hasSelection());
    QCOMPARE(item->textCursor().position(), 2);
    QCOMPARE(item->getFocusFlag(), int(TextObjectConstants::FocusEdit));
}

// The object returns to its place and lets go of the finger.
void tst_touchtexteditor_taps::cancelledDragPutsTheObjectBack()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("abc")});
    GraphicsText* item = canvas.text(1);
    canvas.touchTap(canvas.pointOn(1));
    const QPoint from = canvas.pointOn(1);
    canvas.slide(from, from + QPoint(80, 40));
    const QPointF place = item->scenePos();
    QVERIFY(place != QPointF(300.0, 200.0));
    QTouchEvent cancel(QEvent::TouchCancel, m_device);
    QCoreApplication::sendEvent(canvas.view.viewport(), &cancel);
    canvas.view.mouseClick();
    QCOMPARE(item->scenePos(), QPointF(300.0, 200.0));
    QCOMPARE(item->getItemTText()->getXValue(), 300.0F);
    QCOMPARE(canvas.stack.count(), 0);
    QCOMPARE(canvas.scene->mouseGrabberItem(), nullptr);
    // A second cancel has no effect.
    QTouchEvent again(QEvent::TouchCancel, m_device);
    QCoreApplication::sendEvent(canvas.view.viewport(), &again);
    QCOMPARE(item->getFocusFlag(), int(TextObjectConstants::FocusObject));
    canvas.touchDrag(from, from + QPoint(80, 40));
    QCOMPARE(item->scenePos(), place);
    QCOMPARE(canvas.stack.count(), 1);
    canvas.stack.undo();
    QCOMPARE(item->scenePos(), QPointF(300.0, 200.0));
}

void tst_touchtexteditor_taps::cancelledTapChoosesNothing()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("abc")});
    GraphicsText* item = canvas.text(1);
    QSignalSpy keyboard(item, &GraphicsText::signalNotifySceneCurrentObjectInEditMode);
    for (const int flag : {int(TextObjectConstants::FocusNone), int(TextObjectConstants::FocusObject)}) {
        QCOMPARE(item->getFocusFlag(), flag);
        canvas.press(canvas.pointOn(1));
        keyboard.clear();
        canvas.view.cancelTouch();
        canvas.release(canvas.pointOn(1));
        QCOMPARE(item->getFocusFlag(), flag);
        QCOMPARE(keyboard.count(), 0);
        QCOMPARE(canvas.scene->mouseGrabberItem(), nullptr);
        canvas.touchTap(canvas.pointOn(1));
    }
    QCOMPARE(item->getFocusFlag(), int(TextObjectConstants::FocusEdit));
    QVERIFY(keyboard.count() > 0);
}

// The frame is drawn a little outside the text; a press there does not reach the object.
void tst_touchtexteditor_taps::frameIsNoHandle()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("abc")});
    GraphicsText* item = canvas.text(1);
    for (const int taps : {0, 1}) {
        if (taps > 0)
            canvas.touchTap(canvas.pointOn(1));
        const QPoint above = canvas.inView(*item, QPointF(item->layoutRect().center().x(), -1.0));
        canvas.touchDrag(above, above + QPoint(80, -60));
        QCOMPARE(item->scenePos(), QPointF(300.0, 200.0));
        QCOMPARE(canvas.stack.count(), 0);
        QCOMPARE(item->getFocusFlag(), int(TextObjectConstants::FocusNone));
    }
}

void tst_touchtexteditor_taps::secondFingerOnTheCanvas()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    TText other = makeRecord("other", 2);
    other.setYValue(450.0F);
    canvas.open({makeRecord("abc"), other});
    canvas.touchTap(canvas.pointOn(1));
    const QPoint from = canvas.pointOn(1);
    const QPoint second = canvas.pointOn(2);
    QWidget* on = canvas.view.viewport();
    QTest::touchEvent(on, m_device).press(1, from, on);
    QTest::touchEvent(on, m_device).move(1, from + QPoint(20, 0), on);
    // The second finger comes, moves and goes while the first drags on.
    QTest::touchEvent(on, m_device).move(1, from + QPoint(30, 0), on).press(2, second, on);
    QTest::touchEvent(on, m_device).move(1, from + QPoint(40, 0), on).move(2, second + QPoint(0, 50), on);
    QTest::touchEvent(on, m_device).move(1, from + QPoint(50, 0), on).release(2, second + QPoint(0, 50), on);
    QTest::touchEvent(on, m_device).move(1, from + QPoint(60, 0), on);
    QTest::touchEvent(on, m_device).release(1, from + QPoint(60, 0), on);
    QCOMPARE(canvas.text(1)->scenePos(), QPointF(360.0, 200.0));
    QCOMPARE(canvas.text(1)->getFocusFlag(), int(TextObjectConstants::FocusObject));
    QCOMPARE(canvas.text(2)->getFocusFlag(), int(TextObjectConstants::FocusNone));
    QCOMPARE(canvas.text(2)->scenePos(), QPointF(300.0, 450.0));
    QCOMPARE(canvas.stack.count(), 1);
}

void tst_touchtexteditor_taps::secondFingerOnAButton()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("abc")});
    canvas.touchTap(canvas.pointOn(1));
    QSignalSpy clicked(canvas.button, &QAbstractButton::clicked);
    const QPoint from = canvas.pointOn(1);
    QWidget* on = canvas.view.viewport();
    const QPoint middle = canvas.button->rect().center();
    QTest::touchEvent(&canvas.window, m_device).press(1, from, on);
    QTest::touchEvent(&canvas.window, m_device).move(1, from + QPoint(30, 0), on);
    QTest::touchEvent(&canvas.window, m_device).stationary(1).press(2, middle, canvas.button);
    QTest::touchEvent(&canvas.window, m_device).stationary(1).release(2, middle, canvas.button);
    QTest::touchEvent(&canvas.window, m_device).move(1, from + QPoint(60, 0), on);
    QTest::touchEvent(&canvas.window, m_device).release(1, from + QPoint(60, 0), on);
    QCOMPARE(clicked.count(), 0);
    QCOMPARE(canvas.text(1)->scenePos(), QPointF(360.0, 200.0));
    QCOMPARE(canvas.stack.count(), 1);
    // The button works after the canvas is released.
    QTest::touchEvent(&canvas.window, m_device).press(1, middle, canvas.button);
    QTest::touchEvent(&canvas.window, m_device).release(1, middle, canvas.button);
    QCOMPARE(clicked.count(), 1);
}

void tst_touchtexteditor_taps::fingerOnAButtonBeforeTheCanvas()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("abc")});
    QWidget* on = canvas.view.viewport();
    const QPoint middle = canvas.button->rect().center();
    QTest::touchEvent(&canvas.window, m_device).press(1, middle, canvas.button);
    QTest::touchEvent(&canvas.window, m_device).stationary(1).press(2, canvas.pointOn(1), on);
    QTest::touchEvent(&canvas.window, m_device).stationary(1).release(2, canvas.pointOn(1), on);
    QTest::touchEvent(&canvas.window, m_device).release(1, middle, canvas.button);
    QCOMPARE(canvas.text(1)->getFocusFlag(), int(TextObjectConstants::FocusNone));
    canvas.touchTap(canvas.pointOn(1));
    QCOMPARE(canvas.text(1)->getFocusFlag(), int(TextObjectConstants::FocusObject));
}

QTEST_MAIN(tst_touchtexteditor_taps)
#include "tst_touchtexteditor_taps.moc"
