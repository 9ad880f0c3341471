// The slider under the finger and under the mouse.
#include "tests/support/Patience.h"
#include "tests/touchui/ShownTip.h"
#include "tests/touchui/TouchFixture.h"
#include "touchui/KSSLider.h"
#include "touchui/KSSliderStyle.h"
#include "touchui/KSToolTip.h"

#include <QSignalSpy>
#include <QTest>

class tst_ksslider : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();
    void dragFollowsTheFinger();
    void pressOffTheCentreKeepsItsOffset_data();
    void pressOffTheCentreKeepsItsOffset();
    void mouseDragsTheSameWay();
    void touchOfAnotherFingerIsDropped();
    void secondFingerDoesNotMoveIt();
    void cancelLetsGo();
    void pressBesideTheHandlePages();
    void otherMouseButtonsDoNothing();
    void keysAreSwallowed();
    void withoutResponseNothingMoves();
    void disabledWhileHeldLetsGo();
    void hiddenWhileHeldLetsGo();
    void balloonTellsTheValue();
    void receiverWritesTheBalloon();
    void marks_data();
    void marks();
    void picturesByState();
    void upright();

private:
    QPoint center() const { return m_slider->handleRect().center(); }
    QPoint centerAt(int value) const
    {
        const int span = m_slider->width() - m_slider->handleRect().width();
        return QPoint(m_slider->handleRect().width() / 2 + span * value / 10, m_slider->height() / 2);
    }

    std::unique_ptr<TouchFixture> m_touch;
    std::unique_ptr<QWidget> m_window;
    KSSLider* m_slider = nullptr;
};

namespace
{

const QString IMAGES =
    QStringLiteral("Slider:Slider_S_Handle_Rest:Slider_S_Handle_Pressed:Slider_S_Handle_Rest:"
                   "Slider_H_S_Left:Slider_H_S_Center:Slider_H_S_Right");

} // namespace

void tst_ksslider::init()
{
    Q_INIT_RESOURCE(UILibrary);
    m_touch = std::make_unique<TouchFixture>();
    m_window = std::make_unique<QWidget>();
    m_window->resize(600, 300);
    m_slider = new KSSLider(IMAGES, Qt::Horizontal, m_window.get());
    m_slider->setRange(0, 10);
    m_slider->setPageStep(2);
    m_slider->setGeometry(50, 100, 400, 60);
    m_window->show();
    QVERIFY(QTest::qWaitForWindowExposed(m_window.get(), PATIENCE_MS));
}

void tst_ksslider::cleanup()
{
    m_window.reset();
    KSToolTip::clearInstance();
    m_touch.reset();
}

void tst_ksslider::dragFollowsTheFinger()
{
    QSignalSpy pressed(m_slider, &KSSLider::signalMousePressed);
    QSignalSpy released(m_slider, &KSSLider::signalMouseRelease);
    QSignalSpy moved(m_slider, &QAbstractSlider::valueChanged);
    m_touch->press(m_slider, center());
    QVERIFY(m_slider->isSliderDown());
    QVERIFY(m_touch->isLocked());
    m_touch->move(m_slider, centerAt(4));
    QCOMPARE(m_slider->value(), 4);
    m_touch->move(m_slider, QPoint(5000, -500)); // far off it is still held
    QCOMPARE(m_slider->value(), 10);
    m_touch->lift(m_slider, QPoint(5000, -500));
    QVERIFY(!m_slider->isSliderDown());
    QVERIFY(!m_touch->isLocked());
    QCOMPARE(pressed.count(), 1);
    QCOMPARE(released.count(), 1);
    QCOMPARE(moved.count(), 2);
}

void tst_ksslider::pressOffTheCentreKeepsItsOffset_data()
{
    QTest::addColumn<double>("halves"); // of the handle's width
    QTest::newRow("left half") << -0.7;
    QTest::newRow("right half") << 0.7;
    QTest::newRow("just beside the picture") << 1.2;
}

void tst_ksslider::pressOffTheCentreKeepsItsOffset()
{
    QFETCH(double, halves);
    const QPoint offset(qRound(halves * m_slider->handleRect().width() / 2), 3);
    m_slider->setValue(5);
    const QRect before = m_slider->handleRect();
    m_touch->press(m_slider, center() + offset);
    QVERIFY(m_slider->isSliderDown());
    m_touch->move(m_slider, before.center() + offset);
    QCOMPARE(m_slider->handleRect(), before); // it does not jump under the finger
    m_touch->move(m_slider, centerAt(7) + offset);
    QCOMPARE(m_slider->value(), 7);
    QVERIFY(qAbs(m_slider->handleRect().center().x() - centerAt(7).x()) <= 1);
    m_touch->lift(m_slider, centerAt(7) + offset);
    QCOMPARE(m_slider->value(), 7);
}

void tst_ksslider::mouseDragsTheSameWay()
{
    QTest::mousePress(m_slider, Qt::LeftButton, {}, center() + QPoint(10, 0));
    QVERIFY(m_slider->isSliderDown());
    QTest::mouseMove(m_slider, centerAt(3) + QPoint(10, 0));
    QCOMPARE(m_slider->value(), 3);
    QTest::mouseRelease(m_slider, Qt::LeftButton, {}, centerAt(3) + QPoint(10, 0));
    QVERIFY(!m_slider->isSliderDown());
    QCOMPARE(m_slider->value(), 3);
}

void tst_ksslider::touchOfAnotherFingerIsDropped()
{
    m_touch->press(m_slider, center(), 3);
    // Straight to the slider: a point that it does not know.
    QEventPoint stranger(7, QEventPoint::State::Updated, centerAt(9), m_slider->mapToGlobal(centerAt(9)));
    QTouchEvent update(QEvent::TouchUpdate, m_touch->device(), Qt::NoModifier, {stranger});
    QCoreApplication::sendEvent(m_slider, &update);
    QTouchEvent end(QEvent::TouchEnd, m_touch->device(), Qt::NoModifier, {stranger});
    QVERIFY(m_slider->isSliderDown());
    QCOMPARE(m_slider->value(), 0);
    m_touch->move(m_slider, centerAt(2), 3);
    QCOMPARE(m_slider->value(), 2);
    m_touch->lift(m_slider, centerAt(2), 3);
    QVERIFY(!m_slider->isSliderDown());
}

void tst_ksslider::secondFingerDoesNotMoveIt()
{
    auto touch = QTest::touchEvent(m_slider, m_touch->device(), false);
    touch.press(0, center(), m_slider).commit();
    touch.stationary(0).press(1, centerAt(9), m_slider).commit();
    touch.stationary(0).move(1, centerAt(5), m_slider).commit();
    QCOMPARE(m_slider->value(), 0);
    touch.release(0, center(), m_slider).stationary(1).commit();
    QVERIFY(!m_slider->isSliderDown());
    touch.move(1, centerAt(6), m_slider).commit();
    QCOMPARE(m_slider->value(), 0);
    touch.release(1, centerAt(6), m_slider).commit();
    QVERIFY(!m_touch->isLocked());
}

void tst_ksslider::cancelLetsGo()
{
    QSignalSpy released(m_slider, &KSSLider::signalMouseRelease);
    m_touch->press(m_slider, center());
    m_touch->move(m_slider, centerAt(6));
    m_touch->cancel(m_slider);
    QVERIFY(!m_slider->isSliderDown());
    QVERIFY(shownTip() == nullptr);
    QCOMPARE(released.count(), 1);
    QCOMPARE(m_slider->value(), 6);
    QVERIFY(!m_touch->isLocked());
    m_touch->lift(m_slider, centerAt(6));
    QCOMPARE(released.count(), 1);
    m_touch->press(m_slider, center());
    QVERIFY(m_slider->isSliderDown());
    m_touch->lift(m_slider, center());
}

void tst_ksslider::pressBesideTheHandlePages()
{
    m_slider->setValue(2);
    m_touch->press(m_slider, centerAt(9));
    QVERIFY(!m_slider->isSliderDown());
    QCOMPARE(m_slider->value(), 4);
    m_touch->move(m_slider, centerAt(10));
    QCOMPARE(m_slider->value(), 4);
    m_touch->lift(m_slider, centerAt(10));
    m_touch->tap(m_slider, centerAt(0));
    QCOMPARE(m_slider->value(), 2);
}

void tst_ksslider::otherMouseButtonsDoNothing()
{
    QSignalSpy pressed(m_slider, &KSSLider::signalMousePressed);
    QTest::mousePress(m_slider, Qt::RightButton, {}, center());
    QVERIFY(!m_slider->isSliderDown());
    QTest::mouseRelease(m_slider, Qt::RightButton, {}, center());
    QCOMPARE(pressed.count(), 0);
    QTest::mousePress(m_slider, Qt::LeftButton, {}, center());
    QTest::mousePress(m_slider, Qt::RightButton, {}, center());
    QTest::mouseRelease(m_slider, Qt::RightButton, {}, center());
    QVERIFY(m_slider->isSliderDown());
    QTest::mouseRelease(m_slider, Qt::LeftButton, {}, center());
    QVERIFY(!m_slider->isSliderDown());
}

void tst_ksslider::keysAreSwallowed()
{
    for (const int key : {Qt::Key_Right, Qt::Key_PageUp, Qt::Key_End, Qt::Key_A})
        QTest::keyClick(m_slider, static_cast<Qt::Key>(key));
    QCOMPARE(m_slider->value(), 0);
}

void tst_ksslider::withoutResponseNothingMoves()
{
    m_slider->setReponse(false);
    m_touch->press(m_slider, center());
    QVERIFY(!m_slider->isSliderDown());
    m_touch->move(m_slider, centerAt(5));
    m_touch->lift(m_slider, centerAt(5));
    QCOMPARE(m_slider->value(), 0);
    m_slider->setReponse(true);
    m_touch->press(m_slider, center());
    m_touch->move(m_slider, centerAt(5));
    m_slider->setReponse(false);
    QVERIFY(!m_slider->isSliderDown());
    m_touch->move(m_slider, centerAt(8));
    QCOMPARE(m_slider->value(), 5);
    m_touch->lift(m_slider, centerAt(8));
}

void tst_ksslider::disabledWhileHeldLetsGo()
{
    m_touch->press(m_slider, center());
    m_slider->setEnabled(false);
    m_touch->filter->unlock(); // its lift is kept from a disabled widget
    QVERIFY(!m_slider->isSliderDown());
    QVERIFY(shownTip() == nullptr);
    m_slider->setEnabled(true);
    m_touch->lift(m_slider, center());
    m_touch->press(m_slider, center());
    m_touch->move(m_slider, centerAt(5));
    QCOMPARE(m_slider->value(), 5);
    m_touch->lift(m_slider, centerAt(5));
}

void tst_ksslider::hiddenWhileHeldLetsGo()
{
    QSignalSpy released(m_slider, &KSSLider::signalMouseRelease);
    QTest::mousePress(m_slider, Qt::LeftButton, {}, center());
    QVERIFY(shownTip() != nullptr);
    m_slider->hide();
    QVERIFY(!m_slider->isSliderDown());
    QVERIFY(shownTip() == nullptr);
    QCOMPARE(released.count(), 1);
    QTest::mouseRelease(m_window.get(), Qt::LeftButton);
}

void tst_ksslider::balloonTellsTheValue()
{
    QSignalSpy text(m_slider, &KSSLider::signalDrawTipText);
    m_touch->press(m_slider, center());
    QVERIFY(shownTip() != nullptr);
    QCOMPARE(KSToolTip::text(), QStringLiteral("0"));
    m_touch->move(m_slider, centerAt(4));
    QCOMPARE(KSToolTip::text(), QStringLiteral("4"));
    m_touch->lift(m_slider, centerAt(4));
    QVERIFY(shownTip() == nullptr);
    QCOMPARE(text.count(), 2);
    QCOMPARE(text.at(1).at(0).toString(), QStringLiteral("4"));
}

void tst_ksslider::receiverWritesTheBalloon()
{
    connect(m_slider, &KSSLider::signalDrawTip, this,
            [](KSSLider* slider) { slider->DrawTipText(QStringLiteral("%1 px").arg(slider->value())); });
    m_touch->press(m_slider, center());
    QCOMPARE(KSToolTip::text(), QStringLiteral("0 px"));
    m_touch->lift(m_slider, center());
}

void tst_ksslider::marks_data()
{
    QTest::addColumn<int>("position");
    QTest::newRow("below") << int(QSlider::TicksBelow);
    QTest::newRow("above") << int(QSlider::TicksAbove);
}

void tst_ksslider::marks()
{
    QFETCH(int, position);
    QVERIFY(m_slider->getTickRect(3).isNull());
    m_slider->setTick(1, static_cast<QSlider::TickPosition>(position));
    m_slider->resize(m_slider->sizeHint().expandedTo(QSize(400, 0)));
    QRect last;
    for (int value = 0; value <= 10; ++value) {
        const QRect mark = m_slider->getTickRect(value);
        QVERIFY(m_slider->rect().contains(mark));
        m_slider->setValue(value);
        QVERIFY(qAbs(mark.center().x() - m_slider->handleRect().center().x()) <= 1);
        QVERIFY(!mark.intersects(m_slider->handleRect()));
        QVERIFY(mark.x() > last.x() || value == 0);
        QCOMPARE(mark.y() > m_slider->handleRect().bottom(), position == QSlider::TicksBelow);
        last = mark;
    }
    QCOMPARE(m_slider->getTickRect(11), m_slider->getTickRect(10));
    m_slider->setTick(0);
    QVERIFY(m_slider->getTickRect(3).isNull());
}

void tst_ksslider::picturesByState()
{
    const QImage rest = m_slider->grab().toImage();
    m_touch->press(m_slider, center());
    const QImage pressed = m_slider->grab().toImage();
    QVERIFY(rest != pressed);
    m_touch->lift(m_slider, center());
    QCOMPARE(m_slider->grab().toImage(), rest);
    const QImage handle(QStringLiteral(":/Slider/Slider_S_Handle_Rest"));
    QCOMPARE(m_slider->handleRect().size(), handle.size());
    const QPoint middle = m_slider->handleRect().center();
    QCOMPARE(rest.pixelColor(middle), handle.pixelColor(handle.rect().center()));
    // Without pictures it can still be used.
    KSSLider plain;
    plain.resize(300, 60);
    QVERIFY(!plain.handleRect().isEmpty());
    QVERIFY(plain.grab().toImage().pixelColor(plain.handleRect().center()) !=
            plain.grab().toImage().pixelColor(299, 2));
}

void tst_ksslider::upright()
{
    KSSLider slider(QString(), Qt::Vertical, m_window.get());
    slider.setRange(0, 10);
    slider.setGeometry(500, 10, 60, 280);
    slider.show();
    m_touch->press(&slider, slider.handleRect().center());
    m_touch->move(&slider, QPoint(30, -100));
    QCOMPARE(slider.value(), 10); // up is more
    m_touch->lift(&slider, QPoint(30, -100));
    QVERIFY(slider.handleRect().top() < 3);
}

QTEST_MAIN(tst_ksslider)
#include "tst_ksslider.moc"
