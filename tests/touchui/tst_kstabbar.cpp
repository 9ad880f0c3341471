// Tabs and radio buttons under the finger.
#include "tests/support/Patience.h"
#include "tests/touchui/TouchFixture.h"
#include "touchui/KSCommonStyle.h"
#include "touchui/KSRadiobutton.h"
#include "touchui/KSTabBar.h"
#include "touchui/KSTabStyle.h"
#include "touchui/KSTabWidget.h"

#include <QLabel>
#include <QSignalSpy>
#include <QTest>

class tst_kstabbar : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();
    void tapChangesOnTheLift();
    void slidingOffChangesNothing();
    void secondFingerAndCancel();
    void mouseTaps();
    void disabledTabIsNoTab();
    void sizesOfTabs();
    void looksOfTabs();
    void paletteAndFont();
    void positionSetsTheShape_data();
    void positionSetsTheShape();
    void paneIsPainted();
    void removedTabWhileHeld();
    void styleSuitsFingers();
    void radioTapChooses();
    void radioSlidOffChoosesNothing();
    void radioSecondFingerAndCancel();
    void radioMouse();
    void radioDisabled();
    void radioLooks();

private:
    QPoint tab(int index) const { return m_bar->tabRect(index).center(); }

    std::unique_ptr<TouchFixture> m_touch;
    std::unique_ptr<QWidget> m_window;
    KSTabWidget* m_tabs = nullptr;
    KSTabBar* m_bar = nullptr;
    KSRadiobutton* m_first = nullptr;
    KSRadiobutton* m_second = nullptr;
};

void tst_kstabbar::init()
{
    Q_INIT_RESOURCE(UILibrary);
    m_touch = std::make_unique<TouchFixture>();
    m_window = std::make_unique<QWidget>();
    m_window->resize(800, 600);
    m_tabs = new KSTabWidget(m_window.get());
    m_tabs->setGeometry(10, 10, 700, 300);
    m_tabs->addTab(new QLabel, QStringLiteral("Preset"));
    m_tabs->addTab(new QLabel, QStringLiteral("User"));
    m_tabs->addTab(new QLabel, QStringLiteral("Third"));
    m_bar = m_tabs->ksTabBar();
    auto* group = new QWidget(m_window.get());
    group->setGeometry(10, 400, 400, 60);
    m_first = new KSRadiobutton(QStringLiteral("2px"), group);
    m_first->setGeometry(0, 0, 150, 50);
    m_second = new KSRadiobutton(QStringLiteral("10px"), group);
    m_second->setGeometry(200, 0, 150, 50);
    m_first->setChecked(true);
    m_window->show();
    QVERIFY(QTest::qWaitForWindowExposed(m_window.get(), PATIENCE_MS));
}

void tst_kstabbar::cleanup()
{
    m_window.reset();
    m_touch.reset();
}

void tst_kstabbar::tapChangesOnTheLift()
{
    QSignalSpy clicked(m_bar, &QTabBar::tabBarClicked);
    m_touch->press(m_bar, tab(1));
    QCOMPARE(m_bar->pressedTab(), 1);
    QCOMPARE(m_tabs->currentIndex(), 0);
    m_touch->lift(m_bar, tab(1));
    QCOMPARE(m_tabs->currentIndex(), 1);
    QCOMPARE(m_bar->pressedTab(), -1);
    QCOMPARE(clicked.count(), 1);
    QVERIFY(!m_touch->isLocked());
}

void tst_kstabbar::slidingOffChangesNothing()
{
    m_touch->press(m_bar, tab(1));
    m_touch->move(m_bar, tab(2));
    QCOMPARE(m_bar->pressedTab(), -1);
    m_touch->move(m_bar, tab(1)); // and back on it
    QCOMPARE(m_bar->pressedTab(), 1);
    m_touch->move(m_bar, QPoint(tab(1).x(), 300));
    m_touch->lift(m_bar, QPoint(tab(1).x(), 300));
    QCOMPARE(m_tabs->currentIndex(), 0);
    QCOMPARE(m_bar->pressedTab(), -1);
}

void tst_kstabbar::secondFingerAndCancel()
{
    auto touch = QTest::touchEvent(m_bar, m_touch->device(), false);
    touch.press(0, tab(1), m_bar).commit();
    touch.stationary(0).press(1, tab(2), m_bar).commit();
    touch.stationary(0).release(1, tab(2), m_bar).commit();
    QCOMPARE(m_tabs->currentIndex(), 0);
    QCOMPARE(m_bar->pressedTab(), 1);
    m_touch->cancel(m_bar);
    QCOMPARE(m_bar->pressedTab(), -1);
    touch.release(0, tab(1), m_bar).commit();
    QCOMPARE(m_tabs->currentIndex(), 0);
    QVERIFY(!m_touch->isLocked());
}

void tst_kstabbar::mouseTaps()
{
    QTest::mousePress(m_bar, Qt::LeftButton, {}, tab(2));
    QCOMPARE(m_tabs->currentIndex(), 0);
    QTest::mouseRelease(m_bar, Qt::LeftButton, {}, tab(2));
    QCOMPARE(m_tabs->currentIndex(), 2);
    QTest::mouseClick(m_bar, Qt::RightButton, {}, tab(0));
    QCOMPARE(m_tabs->currentIndex(), 2);
}

void tst_kstabbar::disabledTabIsNoTab()
{
    m_tabs->setTabEnabled(1, false);
    m_touch->press(m_bar, tab(1));
    QCOMPARE(m_bar->pressedTab(), -1);
    m_touch->lift(m_bar, tab(1));
    QCOMPARE(m_tabs->currentIndex(), 0);
    m_touch->press(m_bar, QPoint(690, 20)); // beside all tabs
    m_touch->lift(m_bar, QPoint(690, 20));
    QCOMPARE(m_tabs->currentIndex(), 0);
}

void tst_kstabbar::sizesOfTabs()
{
    const QSize own = m_bar->tabRect(1).size();
    QCOMPARE(own.height(), KSTabBar::TAB_HEIGHT);
    m_bar->setTabSizeHint(1, QSize(240, 60));
    QCOMPARE(m_bar->tabRect(1).size().width(), 240);
    QCOMPARE(m_bar->tabText(1), QStringLiteral("User"));
    QCOMPARE(m_bar->sizeHint().height(), 60);
    m_tabs->insertTab(1, new QLabel, QStringLiteral("Between"));
    QCOMPARE(m_bar->tabRect(2).size().width(), 240); // its size moves along
    m_tabs->removeTab(0);
    QCOMPARE(m_bar->tabRect(1).size().width(), 240);
    m_bar->setTabSizeHint(1, QSize());
    QCOMPARE(m_bar->tabRect(1).size().width(), own.width());
    m_bar->setTabSizeHint(-1, QSize(10, 10));
    m_bar->setTabSizeHint(9, QSize(10, 10));
    QCOMPARE(m_bar->count(), 3);
}

void tst_kstabbar::looksOfTabs()
{
    const auto look = [this](int index) { return m_bar->grab(m_bar->tabRect(index)).toImage(); };
    m_tabs->setTabText(0, QString());
    m_tabs->setTabText(1, QString());
    m_bar->setTabSizeHint(0, QSize(140, 52));
    m_bar->setTabSizeHint(1, QSize(140, 52));
    const QImage selected = look(0);
    const QImage rest = look(1);
    QVERIFY(selected != rest);
    m_touch->press(m_bar, tab(1));
    const QImage pressed = look(1);
    QVERIFY(pressed != rest);
    QVERIFY(pressed != selected);
    m_touch->move(m_bar, QPoint(0, 300));
    QCOMPARE(look(1), rest);
    m_touch->lift(m_bar, QPoint(0, 300));
    m_tabs->setTabEnabled(1, false);
    QVERIFY(look(1) != rest);
    // A shorter string leaves the other looks like that at rest.
    m_tabs->setTabEnabled(1, true);
    auto* style = qobject_cast<KSTabStyle*>(m_bar->style());
    QVERIFY(style != nullptr);
    style->setImages(QStringLiteral("Pane_Tab:Tab_Rest_Left:Tab_Rest_Center:Tab_Rest_Right"));
    QCOMPARE(look(0), look(1));
}

void tst_kstabbar::paletteAndFont()
{
    QCOMPARE(m_bar->font().pixelSize(), 24);
    for (const QPalette::ColorGroup group : {QPalette::Active, QPalette::Inactive, QPalette::Disabled}) {
        QCOMPARE(m_bar->palette().color(group, QPalette::WindowText), QColor(160, 160, 160));
        QCOMPARE(m_bar->palette().color(group, QPalette::BrightText), QColor(220, 220, 220));
        QCOMPARE(m_bar->palette().color(group, QPalette::Window), QColor(50, 50, 50));
    }
}

void tst_kstabbar::positionSetsTheShape_data()
{
    QTest::addColumn<int>("position");
    QTest::addColumn<int>("shape");
    QTest::newRow("north") << int(QTabWidget::North) << int(QTabBar::RoundedNorth);
    QTest::newRow("south") << int(QTabWidget::South) << int(QTabBar::RoundedSouth);
    QTest::newRow("west") << int(QTabWidget::West) << int(QTabBar::RoundedWest);
    QTest::newRow("east") << int(QTabWidget::East) << int(QTabBar::RoundedEast);
}

void tst_kstabbar::positionSetsTheShape()
{
    QFETCH(int, position);
    m_tabs->setTabPosition(static_cast<QTabWidget::TabPosition>(position));
    QTEST(int(m_bar->shape()), "shape");
    QVERIFY(!m_tabs->grab().isNull());
    m_touch->tap(m_bar, tab(2));
    QCOMPARE(m_tabs->currentIndex(), 2);
}

void tst_kstabbar::paneIsPainted()
{
    const QImage look = m_tabs->grab().toImage();
    const QImage corner(QStringLiteral(":/Pane_Tab/Pane_Bottom_Right"));
    QVERIFY(!corner.isNull());
    const QPoint inside(corner.width() / 2, corner.height() / 2);
    QCOMPARE(look.pixelColor(QPoint(700, 300) - QPoint(corner.width(), corner.height()) + inside),
             corner.pixelColor(inside));
}

void tst_kstabbar::removedTabWhileHeld()
{
    m_touch->press(m_bar, tab(2));
    m_tabs->removeTab(2);
    QCOMPARE(m_bar->pressedTab(), -1);
    m_touch->lift(m_bar, QPoint(20, 20));
    QCOMPARE(m_tabs->currentIndex(), 0);
}

void tst_kstabbar::styleSuitsFingers()
{
    KSCommonStyle style;
    QCOMPARE(style.styleHint(QStyle::SH_UnderlineShortcut), 0);
    QCOMPARE(style.styleHint(QStyle::SH_TabBar_Alignment), int(Qt::AlignLeft));
    QCOMPARE(style.styleHint(QStyle::SH_EtchDisabledText), 0);
}

void tst_kstabbar::radioTapChooses()
{
    QSignalSpy toggled(m_second, &QAbstractButton::toggled);
    m_touch->press(m_second, QPoint(100, 20));
    QVERIFY(m_second->isDown());
    m_touch->lift(m_second, QPoint(100, 20));
    QVERIFY(m_second->isChecked());
    QVERIFY(!m_first->isChecked());
    QCOMPARE(toggled.count(), 1);
    QVERIFY(!m_touch->isLocked());
}

void tst_kstabbar::radioSlidOffChoosesNothing()
{
    m_touch->press(m_second, QPoint(20, 20));
    m_touch->move(m_second, QPoint(20, 200));
    QVERIFY(!m_second->isDown());
    m_touch->lift(m_second, QPoint(20, 200));
    QVERIFY(m_first->isChecked());
}

void tst_kstabbar::radioSecondFingerAndCancel()
{
    auto touch = QTest::touchEvent(m_second, m_touch->device(), false);
    touch.press(0, QPoint(20, 20), m_second).commit();
    touch.stationary(0).press(1, QPoint(60, 20), m_second).commit();
    touch.stationary(0).release(1, QPoint(60, 20), m_second).commit();
    QVERIFY(m_second->isDown());
    QVERIFY(!m_second->isChecked());
    m_touch->cancel(m_second);
    QVERIFY(!m_second->isDown());
    touch.release(0, QPoint(20, 20), m_second).commit();
    QVERIFY(!m_second->isChecked());
    m_touch->tap(m_second, QPoint(20, 20));
    QVERIFY(m_second->isChecked());
}

void tst_kstabbar::radioMouse()
{
    QTest::mouseClick(m_second, Qt::LeftButton, {}, QPoint(140, 45));
    QVERIFY(m_second->isChecked());
}

void tst_kstabbar::radioDisabled()
{
    m_second->setEnabled(false);
    m_touch->tap(m_second, QPoint(20, 20));
    QVERIFY(!m_second->isChecked());
    m_second->setEnabled(true);
    m_touch->press(m_second, QPoint(20, 20));
    m_second->setEnabled(false);
    m_second->setEnabled(true);
    m_touch->filter->unlock();
    QVERIFY(!m_second->isDown());
    m_touch->lift(m_second, QPoint(20, 20));
    m_touch->tap(m_second, QPoint(20, 20));
    QVERIFY(m_second->isChecked());
}

void tst_kstabbar::radioLooks()
{
    m_first->setText(QString());
    const QImage on = m_first->grab().toImage();
    m_second->setText(QString());
    const QImage off = m_second->grab().toImage();
    QVERIFY(on != off);
    m_touch->press(m_second, QPoint(20, 20));
    QVERIFY(m_second->grab().toImage() != off);
    m_touch->move(m_second, QPoint(20, 200));
    m_touch->lift(m_second, QPoint(20, 200));
    QCOMPARE(m_second->grab().toImage(), off);
    m_first->setEnabled(false);
    QVERIFY(m_first->grab().toImage() != on);
    m_first->setEnabled(true);
    m_first->setImagesPath(QStringLiteral(":/nowhere"));
    QVERIFY(!m_first->grab().isNull()); // the plain look
    QCOMPARE(m_first->sizeHint(), QSize(36, 36));
}

QTEST_MAIN(tst_kstabbar)
#include "tst_kstabbar.moc"
