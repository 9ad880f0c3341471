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

    std::unique_ptr<QWidget> m_window;
    std::unique_ptr<MoveMode> m_mode;
    QWidget* m_list = nullptr;
    TouchDevice m_device;
};

void tst_movemode::init()
{
    m_window = std::make_unique<QWidget>();
    m_window->setGeometry(100, 100, 600, 500);
    m_mode = std::make_unique<MoveMode>(m_window.get());
    m_mode->button()->move(300, 10);
    m_list = new QWidget(m_window.get());
    m_list->setGeometry(10, 100, 200, 300);
}

void tst_movemode::buttonFollowsTheMode()
{
    const KSPushbutton* button = m_mode->button();
    QVERIFY(!m_mode->isOn());
    QCOMPARE(button->text(), QStringLiteral("Move"));
    m_mode->showPressed();
    QCOMPARE(button->buttonState(), KSPushbutton::ButtonPressed);
    m_mode->showReleased();
    QCOMPARE(button->buttonState(), KSPushbutton::ButtonRest);

    m_mode->setOn(true);
    QVERIFY(m_mode->isOn());
    QCOMPARE(button->text(), QStringLiteral("Done"));
    QCOMPARE(button->buttonState(), KSPushbutton::ButtonSelectedRest);
    m_mode->showPressed();
    QCOMPARE(button->buttonState(), KSPushbutton::ButtonSelectedPressed);
    m_mode->showReleased();
    QCOMPARE(button->buttonState(), KSPushbutton::ButtonSelectedRest);

    m_mode->setOn(false);
    QCOMPARE(button->text(), QStringLiteral("Move"));
    QCOMPARE(button->buttonState(), KSPushbutton::ButtonRest);
}

std::unique_ptr<QEvent> tst_movemode::event(QEvent::Type type, const QPointF& global) const
{
    switch (type) {
    case QEvent::TouchBegin:
    case QEvent::TouchEnd:
        return std::make_unique<QTouchEvent>(
            type, m_device, Qt::NoModifier,
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
    m_mode->setOn(isOn);
    const std::unique_ptr<QEvent> sent = event(type, m_window->mapToGlobal(place));
    const QObject* receiver = isToButton ? static_cast<QObject*>(m_mode->button()) : m_window.get();
    QTEST(m_mode->isEndedBy(receiver, sent.get(), m_list), "ends");
}

void tst_movemode::touchWithoutPointsEndsNothing()
{
    m_mode->setOn(true);
    const QTouchEvent touch(QEvent::TouchBegin, m_device, Qt::NoModifier, QList<QEventPoint>());
    QVERIFY(!m_mode->isEndedBy(m_window.get(), &touch, m_list));
}

QTEST_MAIN(tst_movemode)
#include "tst_movemode.moc"
