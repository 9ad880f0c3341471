// The Move button and which events end the mode that it turns on.
#include "app/MoveMode.h"
#include "tests/touchui/TouchDevice.h"
#include "touchui/KSPushbutton.h"

#include <QMouseEvent>
#include <QTest>
#include <QTouchEvent>
#include <QWheelEvent>
#include <memory>

class tst_movemode : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void buttonFollowsTheMode();
    void endsWithPressesBesideTheList_data();
    void endsWithPressesBesideTheList();
    void touchWithoutPointsEndsNothing();

private:
    std::unique_ptr<QEvent> event(QEvent::Type type, const QPointF& global) const;

    std::unique_ptr<QWidget> mWindow;
    std::unique_ptr<MoveMode> mMode;
    QWidget* mList = nullptr;
    TouchDevice mDevice;
};

void tst_movemode::init()
{
    mWindow = std::make_unique<QWidget>();
    mWindow->setGeometry(100, 100, 600, 500);
    mMode = std::make_unique<MoveMode>(mWindow.get());
    mMode->button()->move(300, 10);
    mList = new QWidget(mWindow.get());
    mList->setGeometry(10, 100, 200, 300);
}

void tst_movemode::buttonFollowsTheMode()
{
    const KSPushbutton* button = mMode->button();
    QVERIFY(!mMode->isOn());
    QCOMPARE(button->text(), QStringLiteral("Move"));
    mMode->showPressed();
    QCOMPARE(button->buttonState(), KSPushbutton::ButtonPressed);
    mMode->showReleased();
    QCOMPARE(button->buttonState(), KSPushbutton::ButtonRest);

    mMode->setOn(true);
    QVERIFY(mMode->isOn());
    QCOMPARE(button->text(), QStringLiteral("Done"));
    QCOMPARE(button->buttonState(), KSPushbutton::ButtonSelectedRest);
    mMode->showPressed();
    QCOMPARE(button->buttonState(), KSPushbutton::ButtonSelectedPressed);
    mMode->showReleased();
    QCOMPARE(button->buttonState(), KSPushbutton::ButtonSelectedRest);

    mMode->setOn(false);
    QCOMPARE(button->text(), QStringLiteral("Move"));
    QCOMPARE(button->buttonState(), KSPushbutton::ButtonRest);
}

std::unique_ptr<QEvent> tst_movemode::event(QEvent::Type type, const QPointF& global) const
{
    switch (type) {
    case QEvent::TouchBegin:
    case QEvent::TouchEnd:
        return std::make_unique<QTouchEvent>(
            type, mDevice, Qt::NoModifier,
            QList<QEventPoint>{QEventPoint(0, QEventPoint::Pressed, global, global)});
    case QEvent::Wheel:
        return std::make_unique<QWheelEvent>(global, global, QPoint(), QPoint(0, 120), Qt::NoButton,
                                             Qt::NoModifier, Qt::NoScrollPhase, false);
    default:
        return std::make_unique<QMouseEvent>(type, global, global, Qt::LeftButton, Qt::LeftButton,
                                             Qt::NoModifier);
    }
}

void tst_movemode::endsWithPressesBesideTheList_data()
{
    QTest::addColumn<bool>("isOn");
    QTest::addColumn<QEvent::Type>("type");
    QTest::addColumn<QPoint>("place"); // in the window
    QTest::addColumn<bool>("isToButton");
    QTest::addColumn<bool>("ends");
    const QPoint beside(400, 300);
    const QPoint inList(50, 200);
    const QPoint onButton(310, 20);
    QTest::newRow("press") << true << QEvent::MouseButtonPress << beside << false << true;
    QTest::newRow("double click") << true << QEvent::MouseButtonDblClick << beside << false << true;
    QTest::newRow("wheel") << true << QEvent::Wheel << beside << false << true;
    QTest::newRow("finger") << true << QEvent::TouchBegin << beside << false << true;
    QTest::newRow("release") << true << QEvent::MouseButtonRelease << beside << false << false;
    QTest::newRow("lift") << true << QEvent::TouchEnd << beside << false << false;
    QTest::newRow("press in the list") << true << QEvent::MouseButtonPress << inList << false << false;
    QTest::newRow("finger in the list") << true << QEvent::TouchBegin << inList << false << false;
    QTest::newRow("over the button") << true << QEvent::MouseButtonPress << onButton << false << false;
    QTest::newRow("at the button") << true << QEvent::MouseButtonPress << beside << true << false;
    QTest::newRow("mode off") << false << QEvent::MouseButtonPress << beside << false << false;
}

void tst_movemode::endsWithPressesBesideTheList()
{
    QFETCH(bool, isOn);
    QFETCH(QEvent::Type, type);
    QFETCH(QPoint, place);
    QFETCH(bool, isToButton);
    mMode->setOn(isOn);
    const std::unique_ptr<QEvent> sent = event(type, mWindow->mapToGlobal(place));
    const QObject* receiver = isToButton ? static_cast<QObject*>(mMode->button()) : mWindow.get();
    QTEST(mMode->isEndedBy(receiver, sent.get(), mList), "ends");
}

void tst_movemode::touchWithoutPointsEndsNothing()
{
    mMode->setOn(true);
    const QTouchEvent touch(QEvent::TouchBegin, mDevice, Qt::NoModifier, QList<QEventPoint>());
    QVERIFY(!mMode->isEndedBy(mWindow.get(), &touch, mList));
}

QTEST_MAIN(tst_movemode)
#include "tst_movemode.moc"
