#include "CanvasTestTools.h"
#include "tests/fakes/FakeTextObject.h"

#include "canvas/TextStyleEditor.h"
#include "canvas/TouchTextEditor.h"

#include <QGraphicsSceneMouseEvent>
#include <QTest>
#include <memory>

using namespace TextObjectConstants;

// What a finger does to a text object: which gesture press, move and release make, and what is reported.
class tst_touchtexteditor : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void firstTapSelects();
    void secondTapEdits();
    void dragMovesASelectedObject();
    void dragOfAnObjectThatIsNotSelectedIsATap();
    void dragEndsWithTheSelection();
    void cancelledDragReturns();
    void doubleTapSelectsTheWholeText();
    void doubleTapThatQtMakesAPressOf();
    void moveOfADoubleTapDragsNothing();
    void longPressSelectsACharacter();
    void keyboardSelectionIsNotTakenWhileDragging();
};

namespace
{

// A finger on an object whose text is "abc def".
struct Finger {
    Finger()
    {
        object.styles.setCurrent(makeRecord("abc def"));
        styleEditor.initShowText();
        object.reports.clear();
    }

    std::unique_ptr<QGraphicsSceneMouseEvent> event(QEvent::Type type, QPointF scenePoint)
    {
        auto made = std::make_unique<QGraphicsSceneMouseEvent>(type);
        made->setButton(Qt::LeftButton);
        made->setButtons(Qt::LeftButton);
        made->setScenePos(scenePoint);
        made->setLastScenePos(last);
        made->setPos(scenePoint - object.text.pos());
        last = scenePoint;
        return made;
    }
    void press(QPointF point)
    {
        const auto made = event(QEvent::GraphicsSceneMousePress, point);
        touch.filter(made.get());
        touch.mousePress(made.get());
    }
    void move(QPointF point)
    {
        const auto made = event(QEvent::GraphicsSceneMouseMove, point);
        if (touch.filter(made.get()))
            return;
        // Qt drags the item itself.
        if (object.focusFlag == FocusObject)
            object.text.setPos(object.text.pos() + made->scenePos() - made->lastScenePos());
        touch.mouseMove(made.get());
        if (object.focusFlag == FocusObject)
            object.placement.markMoved();
    }
    void release(QPointF point)
    {
        const auto made = event(QEvent::GraphicsSceneMouseRelease, point);
        touch.mouseRelease(made.get());
    }
    void doubleTap(QPointF point)
    {
        const auto made = event(QEvent::GraphicsSceneMouseDoubleClick, point);
        touch.mouseDoubleClick(made.get());
    }
    void tap(QPointF point)
    {
        press(point);
        release(point);
    }
    void selectText(int begin, int end)
    {
        QTextCursor cursor = object.text.textCursor();
        cursor.setPosition(begin);
        cursor.setPosition(end, QTextCursor::KeepAnchor);
        object.text.setTextCursor(cursor);
    }

    FakeTextObject object;
    TextStyleEditor styleEditor{object.parts()};
    TouchTextEditor touch{object.parts(), styleEditor};
    QPointF last;
    const QPointF on{350.0, 240.0};
};

} // namespace

void tst_touchtexteditor::firstTapSelects()
{
    Finger finger;
    finger.tap(finger.on);
    QCOMPARE(finger.object.focusFlag, int(FocusObject));
    QVERIFY(!finger.object.writable);
    QVERIFY(finger.object.reports.contains("pressed"));
    QVERIFY(finger.object.reports.contains("mode 11"));
    QCOMPARE(finger.object.reports.last(), QString("no keyboard"));
    QVERIFY(!finger.object.reports.contains("moved"));
}

void tst_touchtexteditor::secondTapEdits()
{
    Finger finger;
    finger.tap(finger.on);
    finger.object.reports.clear();
    finger.tap(finger.on);
    QCOMPARE(finger.object.focusFlag, int(FocusEdit));
    QVERIFY(finger.object.writable && finger.object.focused);
    QVERIFY(finger.object.reports.contains("editing"));
    QCOMPARE(finger.object.reports.last(), QString("keyboard"));
    // The finger moves nothing now.
    finger.press(finger.on);
    QVERIFY(!(finger.object.text.flags() & QGraphicsItem::ItemIsMovable));
    finger.object.handled.clear();
    finger.move(finger.on + QPointF(50.0, 0.0));
    QVERIFY(finger.object.handled.isEmpty());
}

void tst_touchtexteditor::dragMovesASelectedObject()
{
    Finger finger;
    finger.tap(finger.on);
    finger.object.reports.clear();
    finger.press(finger.on);
    finger.move(finger.on + QPointF(20.0, 10.0));
    finger.move(finger.on + QPointF(60.0, 30.0));
    finger.release(finger.on + QPointF(60.0, 30.0));
    QCOMPARE(finger.object.focusFlag, int(FocusObject));
    QVERIFY(!finger.object.writable);
    QCOMPARE(finger.object.reports.count("moved"), 1);
    QCOMPARE(finger.object.movedBy, QPointF(60.0, 30.0));
    QCOMPARE(finger.object.styles.current().getXValue(), 360.0F);
    QCOMPARE(finger.object.styles.current().getYValue(), 230.0F);
}

void tst_touchtexteditor::dragOfAnObjectThatIsNotSelectedIsATap()
{
    Finger finger;
    finger.press(finger.on);
    finger.move(finger.on + QPointF(60.0, 30.0));
    finger.release(finger.on + QPointF(60.0, 30.0));
    QCOMPARE(finger.object.focusFlag, int(FocusObject));
    QVERIFY(!finger.object.reports.contains("moved"));
    QVERIFY(!finger.object.handled.contains(QEvent::GraphicsSceneMouseMove));
}

void tst_touchtexteditor::dragEndsWithTheSelection()
{
    Finger finger;
    finger.tap(finger.on);
    finger.press(finger.on);
    finger.move(finger.on + QPointF(20.0, 10.0));
    finger.object.handled.clear();
    finger.object.focusFlag = FocusNone;
    finger.move(finger.on + QPointF(60.0, 30.0));
    QVERIFY(finger.object.handled.isEmpty());
}

void tst_touchtexteditor::cancelledDragReturns()
{
    Finger finger;
    finger.tap(finger.on);
    finger.object.reports.clear();
    finger.press(finger.on);
    finger.move(finger.on + QPointF(60.0, 30.0));
    QVERIFY(finger.object.text.pos() != QPointF(300.0, 200.0));
    finger.touch.cancelTouch();
    QCOMPARE(finger.object.text.pos(), QPointF(300.0, 200.0));
    QVERIFY(!finger.object.reports.contains("moved"));
    // The next tap is not taken for the end of the drag.
    finger.tap(finger.on);
    QCOMPARE(finger.object.focusFlag, int(FocusEdit));
}

void tst_touchtexteditor::doubleTapSelectsTheWholeText()
{
    Finger finger;
    finger.tap(finger.on);
    finger.doubleTap(finger.on);
    QVERIFY(finger.touch.isDoubleClickedSelection());
    QCOMPARE(finger.object.selection().selectedText(), QString("abc def"));
    finger.release(finger.on);
    QCOMPARE(finger.object.focusFlag, int(FocusEdit));
    QVERIFY(!finger.touch.isHandleCaret());
    // Only the next touch shows handles for what is selected.
    finger.selectText(0, 3);
    finger.release(finger.on);
    QVERIFY(finger.touch.isHandleCaret());
}

void tst_touchtexteditor::doubleTapThatQtMakesAPressOf()
{
    // An item without focus gets a press for its double click.
    class Pressing : public FakeTextObject
    {
    public:
        void handleByTextItem(QEvent::Type type, QEvent& event) override
        {
            FakeTextObject::handleByTextItem(type, event);
            if (type == QEvent::GraphicsSceneMouseDoubleClick)
                touch->mousePress(static_cast<QGraphicsSceneMouseEvent*>(&event));
        }
        TouchTextEditor* touch = nullptr;
    };
    Pressing object;
    object.styles.setCurrent(makeRecord("abc def"));
    TextStyleEditor styleEditor(object.parts());
    TouchTextEditor touch(object.parts(), styleEditor);
    object.touch = &touch;
    styleEditor.initShowText();
    QGraphicsSceneMouseEvent doubleClick(QEvent::GraphicsSceneMouseDoubleClick);
    touch.mouseDoubleClick(&doubleClick);
    QVERIFY(object.handled.contains(QEvent::GraphicsSceneMousePress));
    QGraphicsSceneMouseEvent release(QEvent::GraphicsSceneMouseRelease);
    touch.mouseRelease(&release);
    QVERIFY(object.selection().hasSelection());
    QVERIFY(!touch.isHandleCaret());
}

void tst_touchtexteditor::moveOfADoubleTapDragsNothing()
{
    Finger finger;
    finger.tap(finger.on);
    finger.doubleTap(finger.on);
    finger.object.handled.clear();
    const auto move = finger.event(QEvent::GraphicsSceneMouseMove, finger.on + QPointF(9.0, 0.0));
    finger.touch.mouseMove(move.get());
    QVERIFY(finger.object.handled.isEmpty());
    finger.release(finger.on + QPointF(9.0, 0.0));
    QCOMPARE(finger.object.focusFlag, int(FocusEdit));
    // Nor is the next tap on the object, once it is selected again, taken for the end of a drag.
    finger.touch.changeItemToSolidLineState();
    QCOMPARE(finger.object.focusFlag, int(FocusObject));
    finger.tap(finger.on);
    QCOMPARE(finger.object.focusFlag, int(FocusEdit));
}

void tst_touchtexteditor::longPressSelectsACharacter()
{
    Finger finger;
    finger.tap(finger.on);
    finger.tap(finger.on);
    finger.press(finger.on);
    QVERIFY(finger.touch.longPressTimer().isActive());
    finger.selectText(1, 1);
    finger.touch.longPressed();
    QVERIFY(finger.touch.isHandleCaret());
    QCOMPARE(finger.object.selection().selectedText().size(), 1);
    finger.release(finger.on);
    QVERIFY(!finger.touch.longPressTimer().isActive());
    QVERIFY(finger.touch.isHandleCaret());
}

void tst_touchtexteditor::keyboardSelectionIsNotTakenWhileDragging()
{
    Finger finger;
    finger.tap(finger.on);
    finger.tap(finger.on);
    finger.press(finger.on);
    finger.selectText(1, 1);
    finger.touch.longPressed();
    finger.move(finger.on + QPointF(20.0, 0.0));
    finger.selectText(1, 3);
    finger.move(finger.on + QPointF(40.0, 0.0));
    finger.touch.getSelectionInfo(0, 7, 7, 1);
    QCOMPARE(finger.object.selection().selectedText(), QString("bc"));
    finger.release(finger.on + QPointF(40.0, 0.0));
    finger.touch.getSelectionInfo(0, 7, 7, 1);
    QCOMPARE(finger.object.selection().selectedText(), QString("abc def"));
}

QTEST_MAIN(tst_touchtexteditor)
#include "tst_touchtexteditor.moc"
