// The palette: its colours, what a choice, OK and Cancel send, and where a finger can move it.
#include "PanelFixture.h"
#include "tests/support/Patience.h"

#include "panel/ColorButton.h"
#include "panel/ColorPalette.h"
#include "touchui/FlickMotion.h"

#include <QLabel>

class tst_colorpalette : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase() { m_environment = std::make_unique<PanelEnvironment>(); }
    void cleanupTestCase() { m_environment.reset(); }
    void init();
    void cleanup();
    void table();
    void opensOnItsColor();
    void opensOnAnotherColor();
    void tapPreviews();
    void okSendsTheChoice();
    void cancelSendsWhatWasThere();
    void escapeIsCancel();
    void pressedLook();
    void dragRules_data();
    void dragRules();
    void fingerDrags_data();
    void fingerDrags();
    void buttonsDoNotDrag();
    void masksTakeTheTouches();
    void buttonsStandBetweenTheLines();
    void cornersAreDark();

private:
    ColorButton* button(int index) const { return m_palette->findChildren<ColorButton*>().at(index); }
    void tapAnswer(const char* name)
    {
        m_environment->tap(m_palette->findChild<QWidget*>(QString::fromLatin1(name)));
    }

    std::unique_ptr<PanelEnvironment> m_environment;
    std::unique_ptr<ColorPalette> m_palette;
    std::unique_ptr<QSignalSpy> m_sent;
};

void tst_colorpalette::init()
{
    m_palette = std::make_unique<ColorPalette>(nullptr);
    m_palette->setTitlerWindowRect(QRect(0, 0, 1920, 1080));
    m_sent = std::make_unique<QSignalSpy>(m_palette.get(), &ColorPalette::sendColorValue);
    m_palette->move(100, 100);
    m_palette->show();
    QVERIFY(QTest::qWaitForWindowExposed(m_palette.get(), PATIENCE_MS));
}

void tst_colorpalette::cleanup()
{
    m_sent.reset();
    m_palette.reset();
}

void tst_colorpalette::table()
{
    const QList<QString>& colors = m_palette->colors();
    QCOMPARE(colors.size(), 30);
    QCOMPARE(colors.at(0), QStringLiteral("#FFFFFF"));
    QCOMPARE(colors.at(9), QStringLiteral("#273F69"));
    QCOMPARE(colors.at(10), QStringLiteral("#C80000"));
    QCOMPARE(colors.at(19), QStringLiteral("#F250B2"));
    QCOMPARE(colors.at(20), QStringLiteral("#610707"));
    QCOMPARE(colors.at(29), QStringLiteral("#FFC4FD"));
    for (int i = 0; i < 30; ++i)
        QCOMPARE(button(i)->grab().toImage().pixelColor(20, 20), QColor(colors.at(i)));
}

// The corners of the frame are round; outside of them no system colour is visible.
void tst_colorpalette::cornersAreDark()
{
    const QImage picture = m_palette->grab().toImage();
    const QRect area = picture.rect();
    for (const QPoint& corner : {area.topLeft(), area.topRight(), area.bottomLeft(), area.bottomRight()})
        QVERIFY2(qGray(picture.pixel(corner)) < 64, qPrintable(picture.pixelColor(corner).name()));
}

void tst_colorpalette::opensOnItsColor()
{
    m_palette->setCurrentColor(QStringLiteral("#C80000"));
    QCOMPARE(m_palette->currentIndex(), 10);
    QCOMPARE(button(10)->buttonState(), KSPushbutton::ButtonSelectedRest);
    m_palette->setCurrentColor(QStringLiteral("#ffc4fd"));
    QCOMPARE(m_palette->currentIndex(), 29);
    QCOMPARE(button(10)->buttonState(), KSPushbutton::ButtonRest);
    QVERIFY(m_sent->isEmpty());
}

void tst_colorpalette::opensOnAnotherColor()
{
    m_palette->setCurrentColor(QStringLiteral("#C80000"));
    m_palette->setCurrentColor(QStringLiteral("#123456"));
    QCOMPARE(m_palette->currentIndex(), ColorPalette::USELESS_VALUE);
    for (int i = 0; i < 30; ++i)
        QVERIFY(!button(i)->isSelected());
    m_environment->tap(button(4));
    tapAnswer("PaletteCancel");
    QCOMPARE(*m_sent, (QList<QVariantList>{{"#000000", 0}, {"#123456", 2}}));
}

void tst_colorpalette::tapPreviews()
{
    m_palette->setCurrentColor(QStringLiteral("#FFFFFF"));
    m_environment->tap(button(12));
    m_environment->tap(button(20));
    QCOMPARE(*m_sent, (QList<QVariantList>{{"#FFF700", 0}, {"#610707", 0}}));
    QCOMPARE(m_palette->currentIndex(), 20);
    QVERIFY(!button(12)->isSelected() && button(20)->isSelected());
    QVERIFY(button(20)->styleSheet().contains(QStringLiteral("border: 2px solid blue")));
    QVERIFY(button(12)->styleSheet().contains(QStringLiteral("border: 1px solid white")));
    QVERIFY(m_palette->isVisible());
}

void tst_colorpalette::okSendsTheChoice()
{
    m_palette->setCurrentColor(QStringLiteral("#FFFFFF"));
    m_environment->tap(button(14));
    tapAnswer("PaletteOK");
    QCOMPARE(m_sent->last(), (QVariantList{"#00C743", 1}));
    QVERIFY(!m_palette->isVisible());
}

void tst_colorpalette::cancelSendsWhatWasThere()
{
    m_palette->setCurrentColor(QStringLiteral("#273F69"));
    m_environment->tap(button(14));
    m_environment->tap(button(15));
    tapAnswer("PaletteCancel");
    QCOMPARE(m_sent->last(), (QVariantList{"#273F69", 2}));
    QVERIFY(!m_palette->isVisible());
}

void tst_colorpalette::escapeIsCancel()
{
    m_palette->setCurrentColor(QStringLiteral("#273F69"));
    QTest::keyClick(m_palette.get(), Qt::Key_Escape);
    QCOMPARE(*m_sent, (QList<QVariantList>{{"#273F69", 2}}));
    m_palette->reject(); // closed already
    QCOMPARE(m_sent->size(), 1);
}

void tst_colorpalette::pressedLook()
{
    m_palette->setCurrentColor(QStringLiteral("#FFFFFF"));
    for (const int index : {0, 7}) {
        ColorButton* each = button(index);
        QTest::touchEvent(each, m_environment->device).press(0, each->rect().center(), each);
        QCOMPARE(each->buttonState(),
                 index == 0 ? KSPushbutton::ButtonSelectedPressed : KSPushbutton::ButtonPressed);
        const QPoint away = each->rect().center() + QPoint(0, 300);
        QTest::touchEvent(each, m_environment->device).move(0, away, each);
        QTest::touchEvent(each, m_environment->device).release(0, away, each);
        QCOMPARE(each->isSelected(), index == 0);
    }
    QVERIFY(m_sent->isEmpty());
}

void tst_colorpalette::dragRules_data()
{
    QTest::addColumn<QPoint>("target");
    QTest::addColumn<QPoint>("result");
    // The palette of 640 by 333 in a window of 1920 by 1080: x from 0 to 1280, y from 0 to 747.
    QTest::newRow("inside") << QPoint(700, 400) << QPoint(700, 400);
    QTest::newRow("left") << QPoint(-50, 400) << QPoint(0, 400);
    QTest::newRow("right") << QPoint(1500, 400) << QPoint(1280, 400);
    QTest::newRow("top") << QPoint(700, -1) << QPoint(700, 0);
    QTest::newRow("bottom") << QPoint(700, 900) << QPoint(700, 747);
    QTest::newRow("upper left corner") << QPoint(-5, -5) << QPoint(640, 350);
    QTest::newRow("upper right corner") << QPoint(1300, -5) << QPoint(640, 350);
    QTest::newRow("lower left corner") << QPoint(-5, 800) << QPoint(640, 350);
    QTest::newRow("lower right corner") << QPoint(1300, 800) << QPoint(640, 350);
    QTest::newRow("at the left edge") << QPoint(0, 400) << QPoint(0, 400);
    QTest::newRow("at the right edge") << QPoint(1280, 400) << QPoint(1280, 400);
    QTest::newRow("just inside") << QPoint(1, 746) << QPoint(1, 746);
}

void tst_colorpalette::dragRules()
{
    QFETCH(QPoint, target);
    QTEST(FlickMotion::slideInside(target, QPoint(640, 350), QRect(0, 0, 1920, 1080), QSize(640, 333)),
          "result");
}

void tst_colorpalette::fingerDrags_data()
{
    QTest::addColumn<bool>("touch");
    QTest::addColumn<QPoint>("start"); // in the palette
    QTest::newRow("finger on the frame") << true << QPoint(20, 300);
    QTest::newRow("finger on the title") << true << QPoint(60, 25);
    QTest::newRow("mouse") << false << QPoint(20, 300);
}

void tst_colorpalette::fingerDrags()
{
    QFETCH(bool, touch);
    QFETCH(QPoint, start);
    const auto dragTo = [&](const QPoint& offset) {
        m_palette->move(640, 350);
        const QPoint from = m_palette->pos() + start;
        // The palette moves under the finger: positions are told on the screen.
        const auto send = [&](QEvent::Type type, const QPoint& global) {
            QMouseEvent event(type, m_palette->mapFromGlobal(global), global, Qt::LeftButton, Qt::LeftButton,
                              Qt::NoModifier);
            QCoreApplication::sendEvent(m_palette.get(), &event);
        };
        const auto local = [&](const QPoint& global) { return m_palette->mapFromGlobal(global); };
        if (touch) {
            QTest::touchEvent(m_palette.get(), m_environment->device).press(0, local(from), m_palette.get());
            QTest::touchEvent(m_palette.get(), m_environment->device)
                .move(0, local(from + offset), m_palette.get());
            QTest::touchEvent(m_palette.get(), m_environment->device)
                .release(0, local(from + offset), m_palette.get());
        } else {
            send(QEvent::MouseButtonPress, from);
            send(QEvent::MouseMove, from + offset);
            send(QEvent::MouseButtonRelease, from + offset);
        }
        return m_palette->pos();
    };
    QCOMPARE(dragTo(QPoint(30, -20)), QPoint(670, 330));
    QCOMPARE(dragTo(QPoint(-900, 40)), QPoint(0, 390));
    QCOMPARE(dragTo(QPoint(40, 900)), QPoint(680, 747));
    QCOMPARE(dragTo(QPoint(-900, -900)), QPoint(640, 350));
    QVERIFY(m_sent->isEmpty());
}

void tst_colorpalette::buttonsDoNotDrag()
{
    ColorButton* each = button(3);
    const QPoint before = m_palette->pos();
    QTest::touchEvent(each, m_environment->device).press(0, each->rect().center(), each);
    QTest::touchEvent(each, m_environment->device).move(0, QPoint(100, 100), each);
    QTest::touchEvent(each, m_environment->device).release(0, QPoint(100, 100), each);
    QCOMPARE(m_palette->pos(), before);
}

void tst_colorpalette::masksTakeTheTouches()
{
    m_palette->showDialogMask(true);
    QVERIFY(!m_palette->testAttribute(Qt::WA_AcceptTouchEvents));
    const QWidget* top = m_palette->childAt(button(0)->geometry().center());
    QVERIFY(top && top != button(0));
    QCOMPARE(top->geometry(), m_palette->rect());
    m_palette->showMessageMask(true);
    m_palette->showMessageMask(false);
    QVERIFY(!m_palette->testAttribute(Qt::WA_AcceptTouchEvents)); // the mask of the dialog is still shown
    m_palette->showDialogMask(false);
    QVERIFY(m_palette->testAttribute(Qt::WA_AcceptTouchEvents));
    QCOMPARE(m_palette->childAt(button(0)->geometry().center()), button(0));
}

void tst_colorpalette::buttonsStandBetweenTheLines()
{
    QCOMPARE(m_palette->size(), QSize(640, 333));
    for (int i = 0; i < 30; ++i) {
        QVERIFY(!button(i)->geometry().intersects(ColorPalette::TOPLINE_RECT));
        QVERIFY(!button(i)->geometry().intersects(ColorPalette::BOTTOMLINE_RECT));
        QVERIFY(m_palette->rect().contains(button(i)->geometry()));
    }
    QCOMPARE(button(1)->x() - button(0)->geometry().right() - 1, 8);
    QCOMPARE(button(10)->y() - button(0)->geometry().bottom() - 1, 30);
    for (const char* name : {"PaletteOK", "PaletteCancel"}) {
        const QWidget* answer = m_palette->findChild<QWidget*>(QString::fromLatin1(name));
        QCOMPARE(answer->size(), QSize(160, 48));
        QVERIFY(m_palette->rect().contains(answer->geometry()));
        QVERIFY(!answer->geometry().intersects(ColorPalette::BOTTOMLINE_RECT));
    }
}

QTEST_MAIN(tst_colorpalette)
#include "tst_colorpalette.moc"
