// Buttons under the finger: real touch sequences through the window system.
#include "TouchDevice.h"
#include "tests/support/Patience.h"
#include "touchui/KSPushbutton.h"
#include "touchui/TouchEventButton.h"

#include <QImage>
#include <QSignalSpy>
#include <QTest>
#include <QTouchEvent>
#include <QVBoxLayout>

namespace
{

const char STANDARD[] =
    "TextToolPanel_Buttons:Button_48_Rest_Left:Button_48_Rest_Center:Button_48_Rest_Right:"
    "Button_48_Pressed_Left:Button_48_Pressed_Center:Button_48_Pressed_Right:"
    "Button_48_Disabled_Left:Button_48_Disabled_Center:Button_48_Disabled_Right:"
    "Button_48selected_Rest_Left:Button_48selected_Rest_Center:Button_48selected_Rest_Right:"
    "Button_48selected_Pressed_Left:Button_48selected_Pressed_Center:"
    "Button_48selected_Pressed_Right:Button_48selected_Disabled_Left:"
    "Button_48selected_Disabled_Center:Button_48selected_Disabled_Right";

QImage shot(QWidget& widget)
{
    QImage image(widget.size(), QImage::Format_ARGB32_Premultiplied);
    image.fill(Qt::transparent);
    widget.render(&image, QPoint(), QRegion(), QWidget::RenderFlags());
    return image;
}

double luminance(const QColor& color)
{
    const auto linear = [](double value) {
        return value <= 0.03928 ? value / 12.92 : std::pow((value + 0.055) / 1.055, 2.4);
    };
    return 0.2126 * linear(color.redF()) + 0.7152 * linear(color.greenF()) + 0.0722 * linear(color.blueF());
}

double contrast(const QColor& a, const QColor& b)
{
    const double first = luminance(a) + 0.05;
    const double second = luminance(b) + 0.05;
    return qMax(first, second) / qMin(first, second);
}

// Keeps what reached the mouse handlers.
class RecordingButton : public TouchEventButton
{
public:
    using TouchEventButton::TouchEventButton;
    QList<QPoint> moves;
    QList<QPoint> screenMoves;

protected:
    void mouseMoveEvent(QMouseEvent* event) override
    {
        moves.append(event->position().toPoint());
        screenMoves.append(event->globalPosition().toPoint());
        TouchEventButton::mouseMoveEvent(event);
    }
};

} // namespace

class tst_toucheventbutton : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void init();
    void cleanup();
    void tapIsAClick();
    void slidingOffEmitsOnce();
    void secondFingerIsIgnored();
    void releasedPointInAnUpdateReleases();
    void touchRectangleKeepsTheFingerInside();
    void disabledButtonTakesTheTouchAndDoesNothing();
    void disabledUnderTheFingerItWorksAgain();
    void cancelClicksNothing();
    void mouseStillWorks();
    void slicesByState();
    void emptyEntryIsNotDrawn();
    void selectedRow();
    void autoStateOffFreezesTheLook();
    void signalsCarryTheId();
    void badStateIsIgnored();
    void enabledFollowsTheColumn();
    void textIsReadable();

private:
    TouchDevice m_device;
    std::unique_ptr<QWidget> m_window;
    RecordingButton* m_button = nullptr;
};

void tst_toucheventbutton::initTestCase()
{
    Q_INIT_RESOURCE(TitlerToolResource);
}

void tst_toucheventbutton::init()
{
    m_window = std::make_unique<QWidget>();
    m_window->resize(400, 300);
    m_button = new RecordingButton(QStringLiteral("One"), m_window.get());
    m_button->setGeometry(100, 100, 120, 60);
    m_window->show();
    QVERIFY(QTest::qWaitForWindowExposed(m_window.get(), PATIENCE_MS));
}

void tst_toucheventbutton::cleanup()
{
    m_window.reset();
}

void tst_toucheventbutton::tapIsAClick()
{
    QSignalSpy clicked(m_button, &QAbstractButton::clicked);
    QSignalSpy released(m_button, &TouchEventButton::signalReleased);
    QSignalSpy point(m_button, &TouchEventButton::signalPressedPoint);
    QTest::touchEvent(m_button, m_device).press(0, QPoint(10, 10));
    QVERIFY(m_button->isDown());
    QTest::touchEvent(m_button, m_device).release(0, QPoint(11, 10));
    QVERIFY(!m_button->isDown());
    QCOMPARE(clicked.count(), 1);
    QCOMPARE(released.count(), 1);
    QCOMPARE(released.at(0).at(0).toBool(), false);
    QCOMPARE(point.count(), 1);
    QCOMPARE(point.at(0).at(0).toPoint(), m_button->mapToGlobal(QPoint(10, 10)));
}

void tst_toucheventbutton::slidingOffEmitsOnce()
{
    QSignalSpy clicked(m_button, &QAbstractButton::clicked);
    QSignalSpy released(m_button, &TouchEventButton::signalReleased);
    QTest::touchEvent(m_button, m_device).press(0, QPoint(10, 10));
    QTest::touchEvent(m_button, m_device).move(0, QPoint(-40, 10));
    QCOMPARE(released.count(), 1);
    QCOMPARE(released.at(0).at(0).toBool(), true);
    QTest::touchEvent(m_button, m_device).move(0, QPoint(20, 10));
    QTest::touchEvent(m_button, m_device).release(0, QPoint(20, 10));
    QCOMPARE(released.count(), 1);
    QCOMPARE(clicked.count(), 0);
}

void tst_toucheventbutton::secondFingerIsIgnored()
{
    QSignalSpy pressed(m_button, &QAbstractButton::pressed);
    QSignalSpy clicked(m_button, &QAbstractButton::clicked);
    auto touch = QTest::touchEvent(m_button, m_device, false);
    touch.press(0, QPoint(10, 10)).commit();
    touch.stationary(0).press(1, QPoint(60, 30)).commit();
    touch.stationary(0).move(1, QPoint(-50, 30)).commit();
    QVERIFY(m_button->isDown());
    touch.stationary(0).release(1, QPoint(-50, 30)).commit();
    QVERIFY(m_button->isDown());
    touch.release(0, QPoint(10, 10)).commit();
    QCOMPARE(pressed.count(), 1);
    QCOMPARE(clicked.count(), 1);
}

void tst_toucheventbutton::releasedPointInAnUpdateReleases()
{
    QSignalSpy clicked(m_button, &QAbstractButton::clicked);
    auto touch = QTest::touchEvent(m_button, m_device, false);
    touch.press(0, QPoint(10, 10)).commit();
    touch.stationary(0).press(1, QPoint(60, 30)).commit();
    // The first finger lifts while the second stays: an update, not an end.
    touch.release(0, QPoint(10, 10)).stationary(1).commit();
    QCOMPARE(clicked.count(), 1);
    QVERIFY(!m_button->isDown());
    touch.release(1, QPoint(60, 30)).commit();
    QCOMPARE(clicked.count(), 1);
}

void tst_toucheventbutton::touchRectangleKeepsTheFingerInside()
{
    m_button->setTouchRect(QRect(-50, -50, 220, 160));
    QSignalSpy clicked(m_button, &QAbstractButton::clicked);
    QSignalSpy released(m_button, &TouchEventButton::signalReleased);
    QTest::touchEvent(m_button, m_device).press(0, QPoint(10, 10));
    QTest::touchEvent(m_button, m_device).move(0, QPoint(-20, 0));
    QCOMPARE(m_button->moves.constLast(), QPoint(0, 1));
    QCOMPARE(m_button->screenMoves.constLast(), m_button->mapToGlobal(QPoint(0, 1)));
    QTest::touchEvent(m_button, m_device).move(0, QPoint(150, 90));
    QCOMPARE(m_button->moves.constLast(), QPoint(119, 59));
    QCOMPARE(released.count(), 0);
    QTest::touchEvent(m_button, m_device).move(0, QPoint(190, 30));
    QCOMPARE(m_button->moves.constLast(), QPoint(190, 30));
    QCOMPARE(released.count(), 1);
    QTest::touchEvent(m_button, m_device).release(0, QPoint(190, 30));
    QCOMPARE(clicked.count(), 0);

    QTest::touchEvent(m_button, m_device).press(0, QPoint(10, 10));
    QTest::touchEvent(m_button, m_device).release(0, QPoint(-30, 30));
    QCOMPARE(clicked.count(), 1);
}

void tst_toucheventbutton::disabledButtonTakesTheTouchAndDoesNothing()
{
    m_button->setEnabled(false);
    QSignalSpy pressed(m_button, &QAbstractButton::pressed);
    QSignalSpy point(m_button, &TouchEventButton::signalPressedPoint);
    QTest::touchEvent(m_button, m_device).press(0, QPoint(10, 10));
    QTest::touchEvent(m_button, m_device).release(0, QPoint(10, 10));
    QCOMPARE(pressed.count(), 0);
    QCOMPARE(point.count(), 0);
}

void tst_toucheventbutton::disabledUnderTheFingerItWorksAgain()
{
    QSignalSpy clicked(m_button, &QAbstractButton::clicked);
    QTest::touchEvent(m_button, m_device).press(0, QPoint(10, 10));
    m_button->setEnabled(false);
    QTest::touchEvent(m_button, m_device).release(0, QPoint(10, 10));
    m_button->setEnabled(true);
    QVERIFY(!m_button->isDown());
    QTest::touchEvent(m_button, m_device).press(0, QPoint(10, 10));
    QVERIFY(m_button->isDown());
    QTest::touchEvent(m_button, m_device).release(0, QPoint(10, 10));
    QCOMPARE(clicked.count(), 1);
}

void tst_toucheventbutton::cancelClicksNothing()
{
    QSignalSpy clicked(m_button, &QAbstractButton::clicked);
    QTest::touchEvent(m_button, m_device).press(0, QPoint(10, 10));
    QVERIFY(m_button->isDown());
    QTouchEvent cancel(QEvent::TouchCancel, m_device);
    QCoreApplication::sendEvent(m_button, &cancel);
    QVERIFY(!m_button->isDown());
    QCOMPARE(clicked.count(), 0);
    QTest::touchEvent(m_button, m_device).release(0, QPoint(10, 10));
    QTest::touchEvent(m_button, m_device).press(0, QPoint(10, 10));
    QTest::touchEvent(m_button, m_device).release(0, QPoint(10, 10));
    QCOMPARE(clicked.count(), 1);
}

void tst_toucheventbutton::mouseStillWorks()
{
    QSignalSpy clicked(m_button, &QAbstractButton::clicked);
    QTest::mouseClick(m_button, Qt::LeftButton);
    QCOMPARE(clicked.count(), 1);
}

void tst_toucheventbutton::slicesByState()
{
    KSPushbutton button{QString::fromLatin1(STANDARD)};
    button.resize(160, 48);
    QList<QImage> looks;
    for (int state = 0; state < KSPushbutton::ButtonStateCount; ++state) {
        button.changeButtonState(state);
        const QImage look = shot(button);
        for (const QImage& other : looks)
            QVERIFY(other != look);
        looks.append(look);
    }
    // The left piece stands at x = 0 in its own width, the right one at the right edge.
    button.changeButtonState(KSPushbutton::ButtonRest);
    const QImage look = shot(button);
    const QString folder = QStringLiteral(":/TextToolPanel_Buttons/");
    const QImage left = QImage(folder + QStringLiteral("Button_48_Rest_Left")).convertToFormat(look.format());
    const QImage right =
        QImage(folder + QStringLiteral("Button_48_Rest_Right")).convertToFormat(look.format());
    QCOMPARE(look.copy(0, 0, left.width(), 48), left);
    QCOMPARE(look.copy(160 - right.width(), 0, right.width(), 48), right);
}

void tst_toucheventbutton::emptyEntryIsNotDrawn()
{
    KSPushbutton button(QStringLiteral("TextToolPanel_Buttons:Button_48_Rest_Left::Button_48_Rest_Right"));
    button.resize(160, 48);
    const QImage look = shot(button);
    QCOMPARE(look.pixelColor(80, 24).alpha(), 0);
    QCOMPARE(look.pixelColor(5, 24).alpha(), 255);
    // No entries at all for this state.
    button.changeButtonState(KSPushbutton::ButtonPressed);
    QCOMPARE(shot(button).pixelColor(5, 24).alpha(), 0);
    button.setImage(QString());
    button.changeButtonState(KSPushbutton::ButtonRest);
    QCOMPARE(shot(button).pixelColor(5, 24).alpha(), 0);
    button.setImage(QString::fromLatin1(STANDARD));
    QCOMPARE(shot(button).pixelColor(80, 24).alpha(), 255);
    button.cleanImages();
    QCOMPARE(shot(button).pixelColor(80, 24).alpha(), 0);
}

void tst_toucheventbutton::selectedRow()
{
    KSPushbutton button{QString::fromLatin1(STANDARD)};
    button.changeButtonState(KSPushbutton::ButtonPressed);
    button.setSelected(true);
    QCOMPARE(button.buttonState(), KSPushbutton::ButtonSelectedPressed);
    button.setSelected(true);
    QCOMPARE(button.buttonState(), KSPushbutton::ButtonSelectedPressed);
    button.setSelected(false);
    QCOMPARE(button.buttonState(), KSPushbutton::ButtonPressed);
    QVERIFY(!button.isSelected());
}

void tst_toucheventbutton::autoStateOffFreezesTheLook()
{
    KSPushbutton button{QString::fromLatin1(STANDARD)};
    button.setAutoState(false);
    button.changeButtonState(KSPushbutton::ButtonPressed);
    QCOMPARE(button.buttonState(), KSPushbutton::ButtonPressed);
    QCOMPARE(button.paintedState(), KSPushbutton::ButtonRest);
    button.setAutoState(true);
    QCOMPARE(button.paintedState(), KSPushbutton::ButtonPressed);
}

void tst_toucheventbutton::signalsCarryTheId()
{
    auto* button = new KSPushbutton(QString::fromLatin1(STANDARD), m_window.get());
    button->setGeometry(10, 10, 80, 48);
    button->show();
    QSignalSpy pressed(button, &KSPushbutton::pressed);
    QSignalSpy released(button, &KSPushbutton::signalReleased);
    QTest::touchEvent(button, m_device).press(0, QPoint(10, 10));
    QTest::touchEvent(button, m_device).release(0, QPoint(10, 10));
    QCOMPARE(pressed.at(0).at(0).toInt(), -1);
    QCOMPARE(released.at(0), QVariantList({false, -1}));
    button->setButtonId(7);
    QTest::touchEvent(button, m_device).press(0, QPoint(10, 10));
    QTest::touchEvent(button, m_device).move(0, QPoint(-10, -10));
    QTest::touchEvent(button, m_device).release(0, QPoint(-10, -10));
    QCOMPARE(pressed.at(1).at(0).toInt(), 7);
    QCOMPARE(released.at(1), QVariantList({true, 7}));
    QCOMPARE(released.count(), 2);
}

void tst_toucheventbutton::badStateIsIgnored()
{
    KSPushbutton button{QString::fromLatin1(STANDARD)};
    button.changeButtonState(KSPushbutton::ButtonPressed);
    button.changeButtonState(6);
    button.changeButtonState(-1);
    QCOMPARE(button.buttonState(), KSPushbutton::ButtonPressed);
}

void tst_toucheventbutton::enabledFollowsTheColumn()
{
    KSPushbutton button{QString::fromLatin1(STANDARD)};
    button.setEnabled(false);
    QCOMPARE(button.buttonState(), KSPushbutton::ButtonDisabled);
    button.setEnabled(true);
    QCOMPARE(button.buttonState(), KSPushbutton::ButtonRest);
    button.setSelected(true);
    button.setEnabled(false);
    QCOMPARE(button.buttonState(), KSPushbutton::ButtonSelectedDisabled);
}

void tst_toucheventbutton::textIsReadable()
{
    const QColor enabled(220, 220, 220);
    const QColor disabled(102, 102, 102);
    const QString folder = QStringLiteral(":/TextToolPanel_Buttons/");
    for (const char* base : {"Button_48", "Button_48selected", "Button-38B", "Button-38selected"}) {
        for (const char* state : {"_Rest", "_Pressed", "_Disabled"}) {
            const QImage face(folder + QLatin1String(base) + QLatin1String(state) +
                              QStringLiteral("_Center"));
            QVERIFY(!face.isNull());
            const bool isDisabled = qstrcmp(state, "_Disabled") == 0;
            // Text covers the middle half of the height.
            for (int y = face.height() / 4; y < face.height() * 3 / 4; ++y) {
                const double ratio = contrast(face.pixelColor(2, y), isDisabled ? disabled : enabled);
                QVERIFY2(ratio >= (isDisabled ? 2.0 : 4.5),
                         qPrintable(QStringLiteral("%1%2").arg(base, state)));
            }
        }
    }
}

QTEST_MAIN(tst_toucheventbutton)
#include "tst_toucheventbutton.moc"
