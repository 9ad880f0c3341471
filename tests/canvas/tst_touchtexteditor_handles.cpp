#include "TouchCanvas.h"
#include "tests/support/Patience.h"

// Selecting characters by finger: long press and the two handles; and what the cursor keys do.
class tst_touchtexteditor_handles : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void init();
    void longPress_data();
    void longPress();
    void longPressOnNoWord();
    void shortPressSelectsNothing();
    void longPressNeedsEditing();
    void grabBesideTheHandle_data();
    void grabBesideTheHandle();
    void pressTooFarFromTheHandle();
    void dragOfEachHandle_data();
    void dragOfEachHandle();
    void handlesAcrossLines();
    void keyboardHearsOfTheSelection();
    void collapseIsRefused_data();
    void collapseIsRefused();
    void typingEndsTheHandles();
    void emptiedTextHasNoHandles();
    void handlesAreDrawn();
    void cursorKeys_data();
    void cursorKeys();

private:
    // Edits the first object and selects from anchor to position, with handles.
    void select(TouchCanvas& canvas, int anchor, int position);

    TouchDevice m_device;
};

void tst_touchtexteditor_handles::initTestCase()
{
    Q_INIT_RESOURCE(TitlerToolResource);
    Q_INIT_RESOURCE(UILibrary);
    qRegisterMetaType<TText*>("TText*");
}

void tst_touchtexteditor_handles::init()
{
    InputLanguageFonts::resetLastFonts();
    InputLanguageFonts::mInputLanguage = 2;
    InputLanguageFonts::IS_CN_MODULE = false;
}

void tst_touchtexteditor_handles::select(TouchCanvas& canvas, int anchor, int position)
{
    GraphicsText& item = *canvas.text(1);
    canvas.edit(1, canvas.caretIn(item, 0));
    item.getSelectionInfo(anchor, position, position, 1);
    QVERIFY(item.isHandleCaret());
    QCOMPARE(item.textCursor().anchor(), anchor);
    QCOMPARE(item.textCursor().position(), position);
}

void tst_touchtexteditor_handles::longPress_data()
{
    QTest::addColumn<int>("near");
    QTest::addColumn<int>("shift");
    QTest::addColumn<int>("anchor");
    QTest::addColumn<int>("position");
    // "MM MMMM MM": words at 0, 3 and 8. shift: pixels right of the caret that is pressed.
    QTest::newRow("left of a word") << 3 << 4 << 3 << 4;
    QTest::newRow("inside a word, right of the caret") << 5 << 6 << 5 << 6;
    QTest::newRow("inside a word, left of the caret") << 5 << -6 << 4 << 5;
    QTest::newRow("right of a word") << 10 << 6 << 10 << 9;
    QTest::newRow("right edge of the last character") << 10 << -6 << 9 << 10;
    QTest::newRow("left of everything") << 0 << -6 << 0 << 1;
}

void tst_touchtexteditor_handles::longPress()
{
    QFETCH(int, near);
    QFETCH(int, shift);
    QFETCH(int, anchor);
    QFETCH(int, position);
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("MM MMMM MM")});
    GraphicsText* item = canvas.text(1);
    canvas.edit(1, canvas.caretIn(*item, 1));
    QSignalSpy keyboard(item, &GraphicsText::signalNotifySceneCurrentObjectInEditMode);
    const QPoint point = canvas.caretIn(*item, near) + QPoint(shift, 0);
    canvas.press(point);
    QVERIFY(!item->textCursor().hasSelection());
    const int calls = int(keyboard.count());
    QTRY_VERIFY(item->textCursor().hasSelection());
    QCOMPARE(item->textCursor().anchor(), anchor);
    QCOMPARE(item->textCursor().position(), position);
    QVERIFY(item->isHandleCaret());
    QCOMPARE(keyboard.count(), calls + 1);
    canvas.release(point);
    QVERIFY(item->isHandleCaret());
    QCOMPARE(qAbs(item->textCursor().anchor() - item->textCursor().position()), 1);
    QCOMPARE(item->getFocusFlag(), int(TextObjectConstants::FocusEdit));
}

void tst_touchtexteditor_handles::longPressOnNoWord()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("MM\n\nMM")});
    GraphicsText* item = canvas.text(1);
    canvas.edit(1, canvas.caretIn(*item, 0));
    const QPoint point = canvas.caretIn(*item, 3) + QPoint(1, 0);
    canvas.press(point);
    item->slotLongPressed();
    QVERIFY(!item->textCursor().hasSelection());
    QVERIFY(!item->isHandleCaret());
    QCOMPARE(item->textCursor().position(), 3);
    canvas.release(point);
}

void tst_touchtexteditor_handles::shortPressSelectsNothing()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("MMMM")});
    GraphicsText* item = canvas.text(1);
    canvas.edit(1, canvas.caretIn(*item, 1));
    canvas.touchTap(canvas.caretIn(*item, 2));
    // The timer of the press was stopped: it does not fire later.
    const auto timers = item->findChildren<QTimer*>();
    for (const QTimer* timer : timers)
        QVERIFY(!timer->isActive());
    QTest::qWait(0);
    QVERIFY(!item->textCursor().hasSelection());
}

void tst_touchtexteditor_handles::longPressNeedsEditing()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("MMMM")});
    GraphicsText* item = canvas.text(1);
    canvas.touchTap(canvas.caretIn(*item, 2));
    item->slotLongPressed();
    QVERIFY(!item->textCursor().hasSelection());
    QCOMPARE(item->getFocusFlag(), int(TextObjectConstants::FocusObject));
}

void tst_touchtexteditor_handles::grabBesideTheHandle_data()
{
    QTest::addColumn<QPointF>("offset");
    // Offsets from the top left of the handle of 24 by 27 pixels, just inside the margin of eight pixels.
    QTest::newRow("middle") << QPointF(12.0, 13.0);
    QTest::newRow("left") << QPointF(-7.0, 13.0);
    QTest::newRow("right") << QPointF(31.0, 13.0);
    QTest::newRow("above") << QPointF(12.0, -7.0);
    QTest::newRow("below") << QPointF(12.0, 34.0);
    QTest::newRow("corner") << QPointF(31.0, 34.0);
}

void tst_touchtexteditor_handles::grabBesideTheHandle()
{
    QFETCH(QPointF, offset);
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("MMMMMMMM\nMM")});
    GraphicsText* item = canvas.text(1);
    select(canvas, 2, 5);
    const QPoint grabbed = canvas.inView(*item, TouchCanvas::handleOf(*item, 5) + offset);
    canvas.slide(grabbed, canvas.handleIn(*item, 7));
    QCOMPARE(item->textCursor().anchor(), 2);
    QCOMPARE(item->textCursor().position(), 7);
    canvas.release(canvas.handleIn(*item, 7));
    QCOMPARE(item->textCursor().anchor(), 2);
    QCOMPARE(item->textCursor().position(), 7);
    QVERIFY(item->isHandleCaret());
    QCOMPARE(item->getFocusFlag(), int(TextObjectConstants::FocusEdit));
    QCOMPARE(canvas.stack.count(), 0);
}

void tst_touchtexteditor_handles::pressTooFarFromTheHandle()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("MMMMMMMM")});
    GraphicsText* item = canvas.text(1);
    select(canvas, 2, 5);
    const QPoint beside = canvas.inView(*item, TouchCanvas::handleOf(*item, 5) + QPointF(34.0, -10.0));
    canvas.touchTap(beside);
    QVERIFY(!item->textCursor().hasSelection());
    QVERIFY(!item->isHandleCaret());
}

void tst_touchtexteditor_handles::dragOfEachHandle_data()
{
    QTest::addColumn<int>("anchor");
    QTest::addColumn<int>("position");
    QTest::addColumn<int>("grabbed");
    QTest::addColumn<int>("target");
    QTest::newRow("end, wider") << 2 << 5 << 5 << 7;
    QTest::newRow("end, narrower") << 2 << 5 << 5 << 3;
    QTest::newRow("end, across the start") << 2 << 5 << 5 << 0;
    QTest::newRow("start, wider") << 2 << 5 << 2 << 1;
    QTest::newRow("start, narrower") << 2 << 5 << 2 << 4;
    QTest::newRow("start, across the end") << 2 << 5 << 2 << 7;
    QTest::newRow("backward selection") << 5 << 2 << 2 << 1;
    QTest::newRow("backward selection, other end") << 5 << 2 << 5 << 7;
    QTest::newRow("from the first position") << 0 << 4 << 0 << 2;
    QTest::newRow("from the last position") << 4 << 8 << 8 << 6;
}

void tst_touchtexteditor_handles::dragOfEachHandle()
{
    QFETCH(int, anchor);
    QFETCH(int, position);
    QFETCH(int, grabbed);
    QFETCH(int, target);
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("MMMMMMMM")});
    GraphicsText* item = canvas.text(1);
    select(canvas, anchor, position);
    canvas.touchDrag(canvas.handleIn(*item, grabbed), canvas.handleIn(*item, target));
    // The end that was not touched stays; the end under the finger moves on.
    const int other = grabbed == anchor ? position : anchor;
    QCOMPARE(item->textCursor().anchor(), other);
    QCOMPARE(item->textCursor().position(), target);
    QVERIFY(item->isHandleCaret());
    // The handle can be dragged again immediately.
    canvas.touchDrag(canvas.handleIn(*item, target), canvas.handleIn(*item, grabbed));
    QCOMPARE(item->textCursor().anchor(), other);
    QCOMPARE(item->textCursor().position(), grabbed);
}

void tst_touchtexteditor_handles::handlesAcrossLines()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("MMMM\nMMMM\nMMMM")});
    GraphicsText* item = canvas.text(1);
    select(canvas, 1, 3);
    canvas.touchDrag(canvas.handleIn(*item, 3), canvas.handleIn(*item, 12));
    QCOMPARE(item->textCursor().anchor(), 1);
    QCOMPARE(item->textCursor().position(), 12);
    canvas.touchDrag(canvas.handleIn(*item, 1), canvas.handleIn(*item, 7));
    QCOMPARE(item->textCursor().anchor(), 12);
    QCOMPARE(item->textCursor().position(), 7);
}

void tst_touchtexteditor_handles::keyboardHearsOfTheSelection()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("MMMMMMMM")});
    GraphicsText* item = canvas.text(1);
    select(canvas, 2, 5);
    QSignalSpy keyboard(item, &GraphicsText::signalNotifySceneCurrentObjectInEditMode);
    canvas.slide(canvas.handleIn(*item, 5), canvas.handleIn(*item, 7));
    const int calls = int(keyboard.count());
    QVERIFY(calls >= 1);
    QCOMPARE(item->objectName(), QStringLiteral("0#Text Input#1#300##7#2#7#1##300"));
    // The same selection is not reported twice.
    canvas.move(canvas.handleIn(*item, 7) + QPoint(1, 0));
    QCOMPARE(keyboard.count(), calls);
    canvas.release(canvas.handleIn(*item, 7));
}

void tst_touchtexteditor_handles::collapseIsRefused_data()
{
    QTest::addColumn<int>("anchor");
    QTest::addColumn<int>("position");
    QTest::addColumn<int>("begin");
    QTest::addColumn<int>("end");
    // The end is dragged onto the start, which stays selected with one neighbour.
    QTest::newRow("in the middle, from the right") << 3 << 6 << 2 << 3;
    QTest::newRow("in the middle, from the left") << 6 << 3 << 6 << 7;
    QTest::newRow("at the start of the text") << 0 << 3 << 0 << 1;
    QTest::newRow("at the end of the text") << 8 << 5 << 7 << 8;
}

void tst_touchtexteditor_handles::collapseIsRefused()
{
    QFETCH(int, anchor);
    QFETCH(int, position);
    QFETCH(int, begin);
    QFETCH(int, end);
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("MMMMMMMM")});
    GraphicsText* item = canvas.text(1);
    select(canvas, anchor, position);
    const QPoint grabbed = canvas.handleIn(*item, position);
    const QPoint target = canvas.handleIn(*item, anchor);
    canvas.slide(grabbed, target);
    QVERIFY(!item->textCursor().hasSelection());
    canvas.release(target);
    QCOMPARE(item->textCursor().selectionStart(), begin);
    QCOMPARE(item->textCursor().selectionEnd(), end);
    QVERIFY(item->isHandleCaret());
}

void tst_touchtexteditor_handles::typingEndsTheHandles()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("MMMMMMMM")});
    GraphicsText* item = canvas.text(1);
    select(canvas, 2, 5);
    QTest::keyClick(canvas.view.viewport(), Qt::Key_X);
    QCOMPARE(item->toPlainText(), QStringLiteral("MMxMMM"));
    QVERIFY(!item->isHandleCaret());
    QVERIFY(inStep(*item));
}

void tst_touchtexteditor_handles::emptiedTextHasNoHandles()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("MM")});
    GraphicsText* item = canvas.text(1);
    select(canvas, 0, 2);
    QTest::keyClick(canvas.view.viewport(), Qt::Key_Backspace);
    QCOMPARE(item->toPlainText(), QString());
    canvas.touchTap(canvas.caretIn(*item, 0));
    QVERIFY(!item->isHandleCaret());
    QVERIFY(canvas.text(1));
}

void tst_touchtexteditor_handles::handlesAreDrawn()
{
    TouchCanvas canvas(m_device);
    canvas.show();
    canvas.open({makeRecord("MMMMMMMM")});
    GraphicsText* item = canvas.text(1);
    canvas.edit(1, canvas.caretIn(*item, 0));
    const QImage plain = canvas.view.grab().toImage();
    select(canvas, 2, 5);
    const QImage selected = canvas.view.grab().toImage();
    // Something is drawn where each handle hangs, below the line.
    for (const int position : {2, 5}) {
        const QPoint middle = canvas.handleIn(*item, position);
        QVERIFY(plain.pixelColor(middle) != selected.pixelColor(middle));
    }
    // The pressed picture differs from the released one.
    canvas.slide(canvas.handleIn(*item, 5), canvas.handleIn(*item, 6));
    const QImage held = canvas.view.grab().toImage();
    canvas.release(canvas.handleIn(*item, 6));
    const QImage released = canvas.view.grab().toImage();
    const QPoint corner = canvas.inView(*item, TouchCanvas::handleOf(*item, 6));
    QVERIFY(held.copy(QRect(corner, QSize(24, 27))) != released.copy(QRect(corner, QSize(24, 27))));
}

void tst_touchtexteditor_handles::cursorKeys_data()
{
    QTest::addColumn<int>("key");
    QTest::addColumn<int>("position");
    QTest::addColumn<int>("size");
    QTest::newRow("left") << int(Qt::Key_Left) << 6 << 60;
    QTest::newRow("right") << int(Qt::Key_Right) << 8 << 96;
    QTest::newRow("up") << int(Qt::Key_Up) << 2 << 50;
    QTest::newRow("down") << int(Qt::Key_Down) << 12 << 96;
}

void tst_touchtexteditor_handles::cursorKeys()
{
    QFETCH(int, key);
    QFETCH(int, position);
    QFETCH(int, size);
    TouchCanvas canvas(m_device);
    canvas.show();
    TText record = makeRecord("MMMM\nMMMM\nMMMM");
    record.textItems()[1]->setFontSize(50);
    record.textItems()[5]->setFontSize(60);
    canvas.open({record});
    GraphicsText* item = canvas.text(1);
    canvas.edit(1, canvas.caretIn(*item, 7));
    QCOMPARE(item->textCursor().position(), 7);
    QSignalSpy keyboard(item, &GraphicsText::signalNotifySceneCurrentObjectInEditMode);
    int shown = 0;
    connect(item, &GraphicsText::signalNotifyPropertyAreaObjectSelectionStyleChange, item,
            [&shown](TText* style) { shown = style->textItems().front()->getFontSize(); });
    QTest::keyClick(canvas.view.viewport(), Qt::Key(key));
    const int reached = item->textCursor().position();
    if (key == Qt::Key_Left || key == Qt::Key_Right)
        QCOMPARE(reached, position);
    else
        QVERIFY2(qAbs(reached - position) <= 1, qPrintable(QString::number(reached)));
    QCOMPARE(keyboard.count(), 1);
    QCOMPARE(keyboard.last().at(0).value<GraphicsText*>(), item);
    if (key == Qt::Key_Left || key == Qt::Key_Right)
        QCOMPARE(shown, size);
    else
        QVERIFY(shown > 0);
    // Other keys do not ask for the keyboard.
    QTest::keyClick(canvas.view.viewport(), Qt::Key_Home);
    QCOMPARE(keyboard.count(), 1);
}

QTEST_MAIN(tst_touchtexteditor_handles)
#include "tst_touchtexteditor_handles.moc"
