// The combo box and its list.
#include "tests/fakes/ManualClock.h"
#include "tests/support/Patience.h"
#include "tests/touchui/TouchFixture.h"
#include "touchui/CustomComboBoxDelegate.h"
#include "touchui/CustomComboBoxView.h"
#include "touchui/ITitlerAPPEventFilterController.h"
#include "touchui/KSCombobox.h"
#include "touchui/KSEventProcessLockObject.h"
#include "touchui/TouchEventButton.h"

#include <QLineEdit>
#include <QPainter>
#include <QScrollBar>
#include <QSignalSpy>
#include <QStandardItemModel>
#include <QTest>
#include <QtMath>

class tst_kscombobox : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void init();
    void cleanup();
    void tapOpensAndTapChooses();
    void mouseOpensAndChooses();
    void listShowsOnlyWhenItCan();
    void event1001Closes();
    void processLockRemembersTheOpenList();
    void pressOutsideClosesAndPressesNothing();
    void disablingClosesTheList();
    void disabledRowKeepsTheListOpen();
    void switchedRows();
    void cancelAndSecondFinger();
    void width_data();
    void width();
    void longestRowIsWhole_data();
    void longestRowIsWhole();
    void cornersAreNotPartOfTheList();
    void placedUnderOrOverTheBox();
    void listFollowsTheFingerAndRunsOn();
    void flickIntoTheEndStops();
    void brakeChoosesNothing();
    void smallMoveIsATapLargerIsNot();
    void mouseDragsTheList();
    void keysOfTheList();
    void coloursAsRows();
    void editableBoxTakesTheTap();
    void looks();

private:
    QPoint rowPoint(int row) const
    {
        return m_box->listView()->visualRect(m_box->model()->index(row, 0)).center();
    }
    QWidget* list() const { return m_box->listView()->viewport(); }
    void fill(int count)
    {
        m_box->clear();
        for (int i = 0; i < count; ++i)
            m_box->addItem(QStringLiteral("Row %1").arg(i));
    }
    void open()
    {
        m_box->showPopup();
        QVERIFY(m_box->view()->isVisible());
        QVERIFY(QTest::qWaitForWindowExposed(m_box->listView()->window(), PATIENCE_MS));
    }

    std::unique_ptr<ManualClock> m_clock;
    std::unique_ptr<TouchFixture> m_touch;
    std::unique_ptr<QWidget> m_window;
    TouchEventButton* m_button = nullptr;
    KSCombobox* m_box = nullptr;
};

void tst_kscombobox::init()
{
    Q_INIT_RESOURCE(UILibrary);
    Q_INIT_RESOURCE(TitlerToolResource);
    m_clock = std::make_unique<ManualClock>();
    m_touch = std::make_unique<TouchFixture>();
    m_window = std::make_unique<QWidget>();
    m_window->setGeometry(0, 0, 800, 600);
    m_button = new TouchEventButton(QStringLiteral("under"), m_window.get());
    m_button->setGeometry(500, 500, 200, 80);
    m_box = new KSCombobox(m_window.get());
    m_box->setGeometry(20, 20, 200, 48);
    fill(5);
    m_window->show();
    QVERIFY(QTest::qWaitForWindowExposed(m_window.get(), PATIENCE_MS));
}

void tst_kscombobox::cleanup()
{
    m_window.reset();
    m_touch.reset();
    m_clock.reset();
}

void tst_kscombobox::tapOpensAndTapChooses()
{
    QSignalSpy popup(m_box, &KSCombobox::signalPopupShow);
    QSignalSpy shown(m_box, &KSCombobox::signalShowComboxList);
    QSignalSpy activated(m_box, &QComboBox::activated);
    m_touch->press(m_box, QPoint(30, 20));
    QVERIFY(m_box->view()->isVisible());
    m_touch->move(m_box, QPoint(31, 20));
    m_touch->lift(m_box, QPoint(31, 20));
    QVERIFY(m_box->view()->isVisible());
    QVERIFY(!m_touch->isLocked());
    QCOMPARE(popup.count(), 1);
    QCOMPARE(shown.count(), 1);
    QCOMPARE(shown.at(0).at(0).toBool(), true);
    m_touch->press(list(), rowPoint(3));
    QCOMPARE(m_box->listView()->pressedIndex().row(), 3);
    m_touch->lift(list(), rowPoint(3));
    QVERIFY(!m_box->view()->isVisible());
    QCOMPARE(m_box->currentIndex(), 3);
    QCOMPARE(activated.count(), 1);
    QCOMPARE(activated.at(0).at(0).toInt(), 3);
    QCOMPARE(shown.count(), 2);
    QCOMPARE(shown.at(1).at(0).toBool(), false);
    QVERIFY(!m_touch->isLocked());
}

void tst_kscombobox::mouseOpensAndChooses()
{
    QTest::mouseClick(m_box, Qt::LeftButton, {}, QPoint(30, 20));
    QVERIFY(m_box->view()->isVisible());
    QTest::mouseClick(list(), Qt::LeftButton, {}, rowPoint(2));
    QVERIFY(!m_box->view()->isVisible());
    QCOMPARE(m_box->currentIndex(), 2);
}

void tst_kscombobox::listShowsOnlyWhenItCan()
{
    QSignalSpy popup(m_box, &KSCombobox::signalPopupShow);
    QSignalSpy shown(m_box, &KSCombobox::signalShowComboxList);
    m_box->setPopupEnable(false);
    m_box->showPopup();
    QVERIFY(!m_box->view()->isVisible());
    m_box->setPopupEnable(true);
    m_box->clear();
    m_box->showPopup();
    QVERIFY(!m_box->view()->isVisible());
    QCOMPARE(popup.count(), 2);
    QCOMPARE(shown.count(), 0);
    fill(2);
    open();
    m_box->showPopup(); // again
    QCOMPARE(shown.count(), 1);
}

void tst_kscombobox::event1001Closes()
{
    QSignalSpy shown(m_box, &KSCombobox::signalShowComboxList);
    open();
    QEvent event(static_cast<QEvent::Type>(1001));
    QCoreApplication::sendEvent(m_box, &event);
    QVERIFY(!m_box->view()->isVisible());
    QCOMPARE(shown.count(), 2);
    QCoreApplication::sendEvent(m_box, &event); // and once more, closed
    QCOMPARE(shown.count(), 2);
}

void tst_kscombobox::processLockRemembersTheOpenList()
{
    auto* process = new KSEventProcessLockObject(m_touch->filter.get());
    m_touch->filter->registerLockObject(m_touch->filter.get(), process, LOCKOBJECT_PROCESS, nullptr);
    KSEventProcessLockObject::s_instance = process;
    open();
    process->slotRestoreAll(); // another process asks this one to give way
    QVERIFY(!m_box->view()->isVisible());
    process->slotRestoreAll();
    open();
    delete m_box; // with its list open
    process->slotRestoreAll();
}

void tst_kscombobox::pressOutsideClosesAndPressesNothing()
{
    QSignalSpy clicked(m_button, &QAbstractButton::clicked);
    QSignalSpy pressed(m_button, &QAbstractButton::pressed);
    open();
    m_touch->tap(m_button, QPoint(20, 20));
    QVERIFY(!m_box->view()->isVisible());
    QCOMPARE(pressed.count(), 0);
    m_touch->tap(m_button, QPoint(20, 20));
    QCOMPARE(clicked.count(), 1);
    // A tap on the box itself closes the list, too.
    open();
    m_touch->tap(m_box, QPoint(30, 20));
    QVERIFY(!m_box->view()->isVisible());
    m_touch->tap(m_box, QPoint(30, 20));
    QVERIFY(m_box->view()->isVisible());
    QVERIFY(!m_touch->isLocked());
}

void tst_kscombobox::disablingClosesTheList()
{
    open();
    m_box->setDisabled(true);
    QVERIFY(!m_box->view()->isVisible());
    m_box->showPopup();
    QVERIFY(!m_box->view()->isVisible());
    m_touch->tap(m_box, QPoint(30, 20));
    QVERIFY(!m_box->view()->isVisible());
    m_box->setEnabled(true);
    open();
    m_window->setEnabled(false); // through its parent
    QVERIFY(!m_box->view()->isVisible());
}

void tst_kscombobox::disabledRowKeepsTheListOpen()
{
    qobject_cast<QStandardItemModel*>(m_box->model())->item(1)->setEnabled(false);
    QSignalSpy activated(m_box, &QComboBox::activated);
    open();
    m_touch->tap(list(), rowPoint(1));
    QVERIFY(m_box->view()->isVisible());
    QCOMPARE(activated.count(), 0);
}

void tst_kscombobox::switchedRows()
{
    m_box->setItemData(2, true, KSCombobox::USB_ROLE);
    m_box->setUSBEnabled(false);
    QVERIFY(!(m_box->model()->index(2, 0).flags() & Qt::ItemIsEnabled));
    QVERIFY(m_box->model()->index(1, 0).flags() & Qt::ItemIsEnabled);
    m_box->setUSBEnabled(true);
    QVERIFY(m_box->model()->index(2, 0).flags() & Qt::ItemIsEnabled);
}

void tst_kscombobox::cancelAndSecondFinger()
{
    QSignalSpy activated(m_box, &QComboBox::activated);
    open();
    auto touch = QTest::touchEvent(list(), m_touch->device(), false);
    touch.press(0, rowPoint(0), list()).commit();
    touch.stationary(0).press(1, rowPoint(3), list()).commit();
    touch.stationary(0).release(1, rowPoint(3), list()).commit();
    QCOMPARE(activated.count(), 0);
    m_touch->cancel(list());
    QVERIFY(!m_box->listView()->pressedIndex().isValid());
    touch.release(0, rowPoint(0), list()).commit();
    QCOMPARE(activated.count(), 0);
    QVERIFY(m_box->view()->isVisible());
    m_box->hidePopup();
    m_touch->press(m_box, QPoint(30, 20));
    m_box->hidePopup();
    m_touch->cancel(m_box);
    m_touch->lift(m_box, QPoint(30, 20));
    m_touch->tap(m_box, QPoint(30, 20));
    QVERIFY(m_box->view()->isVisible());
}

void tst_kscombobox::width_data()
{
    QTest::addColumn<int>("box");
    QTest::addColumn<bool>("byText");
    QTest::addColumn<bool>("bar");
    QTest::addColumn<int>("expected");
    QTest::newRow("as wide as the box") << 100 << false << true << 100;
    QTest::newRow("narrow, with bar") << 100 << true << true << 276;
    QTest::newRow("text + 43, with bar") << 243 << true << true << 276;
    QTest::newRow("text + 44, with bar") << 244 << true << true << 244;
    QTest::newRow("narrow, without bar") << 100 << true << false << 244;
    QTest::newRow("text + 43, without bar") << 243 << true << false << 244;
    QTest::newRow("wide enough") << 500 << true << false << 500;
}

void tst_kscombobox::width()
{
    QFETCH(int, box);
    QFETCH(bool, byText);
    QFETCH(bool, bar);
    QTEST(KSCombobox::listWidth(box, 200, byText, bar), "expected");
}

void tst_kscombobox::longestRowIsWhole_data()
{
    QTest::addColumn<QString>("row");
    // Widths in fractions of a pixel, some to be rounded up and some down.
    for (const char* row :
         {"A longer row than the box", "A longer row than the bo", "A longer row than the b",
          "A longer row than the", "Nimbus Roman No9 L and more", "iiiiiiiiiiiiiiiiiiiiiiiiiiiiiiiiii"})
        QTest::newRow(row) << QString::fromLatin1(row);
}

void tst_kscombobox::longestRowIsWhole()
{
    QFETCH(QString, row);
    m_box->setListWidthByText(true);
    m_box->setItemText(1, row);
    open();
    const QFontMetrics metrics(m_box->font());
    const int room = list()->width() - 2 * CustomComboBoxDelegate::TEXT_MARGIN;
    QVERIFY2(metrics.elidedText(row, Qt::ElideRight, room) == row,
             qPrintable(QStringLiteral("%1 in %2, list %3")
                            .arg(QFontMetricsF(m_box->font()).horizontalAdvance(row))
                            .arg(room)
                            .arg(m_box->listView()->window()->width())));
}

// Without a compositor they would be black.
void tst_kscombobox::cornersAreNotPartOfTheList()
{
    for (const int rows : {5, 3}) {
        fill(rows);
        open();
        const QWidget* window = m_box->listView()->window();
        QVERIFY(!window->mask().contains(QPoint(0, 0)));
        QVERIFY(!window->mask().contains(QPoint(window->width() - 1, window->height() - 1)));
        QVERIFY(window->mask().contains(window->rect().center()));
        QCOMPARE(window->mask().boundingRect(), window->rect());
        m_box->hidePopup();
    }
}

void tst_kscombobox::placedUnderOrOverTheBox()
{
    const QPoint corner = m_box->mapToGlobal(QPoint(0, 0));
    open();
    QCOMPARE(m_box->listView()->window()->pos(), corner + QPoint(0, 48));
    QCOMPARE(m_box->listView()->window()->width(), m_box->width());
    m_box->hidePopup();
    m_box->setPopupUpper(true); // no room there
    open();
    QCOMPARE(m_box->listView()->window()->pos(), corner + QPoint(0, 48));
    m_box->hidePopup();
    m_box->move(20, 400);
    open();
    QCOMPARE(m_box->listView()->window()->geometry().bottom() + 1, m_box->mapToGlobal(QPoint(0, 0)).y());
    m_box->move(20, 410); // the list goes along
    QCOMPARE(m_box->listView()->window()->geometry().bottom() + 1, m_box->mapToGlobal(QPoint(0, 0)).y());
    m_box->hidePopup();
    // As wide as its longest text.
    m_box->setListWidthByText(true);
    m_box->addItem(QStringLiteral("A row that is a good deal longer than the box is wide"));
    open();
    QCOMPARE(m_box->listView()->window()->width(),
             qCeil(QFontMetricsF(m_box->font()).horizontalAdvance(m_box->itemText(5))) + 44);
}

void tst_kscombobox::listFollowsTheFingerAndRunsOn()
{
    fill(60);
    open();
    QScrollBar* bar = m_box->listView()->verticalScrollBar();
    QCOMPARE(bar->value(), 0);
    m_touch->press(list(), QPoint(50, 300));
    m_touch->move(list(), QPoint(50, 200));
    QVERIFY(!m_box->listView()->pressedIndex().isValid());
    m_clock->advance(33);
    QCOMPARE(bar->value(), 50); // half of the way at each tick
    m_clock->advance(33);
    QCOMPARE(bar->value(), 75);
    m_clock->advance(330);
    QVERIFY(bar->value() > 90 && bar->value() <= 105);
    m_touch->move(list(), QPoint(50, 20));
    m_touch->lift(list(), QPoint(50, 20));
    QVERIFY(m_box->listView()->isAutoFilck());
    const int left = bar->value();
    m_clock->advance(330);
    QVERIFY(bar->value() > left + 100);
    m_clock->advance(10000);
    QVERIFY(!m_box->listView()->isAutoFilck());
    QCOMPARE(m_clock->running(), 0);
    QVERIFY(m_box->view()->isVisible());
    QCOMPARE(m_box->currentIndex(), 0);
}

void tst_kscombobox::flickIntoTheEndStops()
{
    fill(14); // little more than what is shown
    open();
    QScrollBar* bar = m_box->listView()->verticalScrollBar();
    m_touch->press(list(), QPoint(50, 400));
    m_touch->move(list(), QPoint(50, 100));
    m_touch->lift(list(), QPoint(50, 20));
    for (int tick = 0; bar->value() < bar->maximum() && tick < 100; ++tick) {
        QVERIFY(m_box->listView()->isAutoFilck());
        m_clock->advance(33);
    }
    QCOMPARE(bar->value(), bar->maximum());
    QVERIFY(!m_box->listView()->isAutoFilck());
    // It is at rest: the next tap chooses.
    m_touch->tap(list(), rowPoint(13));
    QCOMPARE(m_box->currentIndex(), 13);
}

void tst_kscombobox::brakeChoosesNothing()
{
    fill(90);
    open();
    m_touch->press(list(), QPoint(50, 400));
    m_touch->move(list(), QPoint(50, 100));
    m_touch->lift(list(), QPoint(50, 50));
    QVERIFY(m_box->listView()->isAutoFilck());
    m_touch->tap(list(), QPoint(50, 100));
    QVERIFY(!m_box->listView()->isAutoFilck());
    QVERIFY(m_box->view()->isVisible());
    QCOMPARE(m_box->currentIndex(), 0);
    m_touch->tap(list(), QPoint(50, 100));
    QVERIFY(!m_box->view()->isVisible());
    QVERIFY(m_box->currentIndex() > 0);
}

void tst_kscombobox::smallMoveIsATapLargerIsNot()
{
    fill(60);
    open();
    const QPoint start = rowPoint(2);
    m_touch->press(list(), start);
    m_touch->move(list(), start + QPoint(0, 5));
    m_touch->lift(list(), start + QPoint(0, 5));
    QCOMPARE(m_box->currentIndex(), 2);
    open();
    m_touch->press(list(), rowPoint(3));
    m_touch->move(list(), rowPoint(3) + QPoint(0, 6));
    m_touch->move(list(), rowPoint(3));
    m_touch->lift(list(), rowPoint(3));
    QVERIFY(m_box->view()->isVisible());
    QCOMPARE(m_box->currentIndex(), 2);
    const QPoint sideways = rowPoint(3);
    m_touch->press(list(), sideways);
    m_touch->move(list(), sideways + QPoint(21, 0));
    m_touch->lift(list(), sideways + QPoint(21, 0));
    QVERIFY(m_box->view()->isVisible());
}

void tst_kscombobox::mouseDragsTheList()
{
    fill(60);
    open();
    QScrollBar* bar = m_box->listView()->verticalScrollBar();
    QTest::mousePress(list(), Qt::LeftButton, {}, QPoint(50, 300));
    QTest::mouseMove(list(), QPoint(50, 100));
    m_clock->advance(33);
    QCOMPARE(bar->value(), 100);
    QTest::mouseRelease(list(), Qt::LeftButton, {}, QPoint(50, 100));
    QVERIFY(m_box->view()->isVisible());
    QCOMPARE(m_box->currentIndex(), 0);
}

void tst_kscombobox::keysOfTheList()
{
    open();
    QWidget* popup = m_box->listView()->window();
    QTest::keyClick(popup, Qt::Key_Down);
    QTest::keyClick(popup, Qt::Key_Down);
    QTest::keyClick(popup, Qt::Key_Up);
    QTest::keyClick(popup, Qt::Key_Return);
    QCOMPARE(m_box->currentIndex(), 1);
    QVERIFY(!m_box->view()->isVisible());
    open();
    QTest::keyClick(popup, Qt::Key_Escape);
    QVERIFY(!m_box->view()->isVisible());
    QCOMPARE(m_box->currentIndex(), 1);
}

void tst_kscombobox::coloursAsRows()
{
    m_box->clear();
    m_box->addItems({QStringLiteral("#C80000"), QStringLiteral("plain")});
    m_box->setItemData(1, QColor(0, 200, 0), Qt::BackgroundRole);
    m_box->setColorPallete(true);
    open();
    const QImage look = list()->grab().toImage();
    QCOMPARE(look.pixelColor(rowPoint(0)), QColor(0xC8, 0, 0));
    QCOMPARE(look.pixelColor(rowPoint(1)), QColor(0, 200, 0));
    QCOMPARE(m_box->grab().toImage().pixelColor(30, 24), QColor(0xC8, 0, 0));
    QVERIFY(!CustomComboBoxDelegate::rowColor(QModelIndex()).isValid());
}

void tst_kscombobox::editableBoxTakesTheTap()
{
    m_box->setEditable(true);
    m_box->lineEdit()->setText(QStringLiteral("text"));
    m_touch->tap(m_box, m_box->lineEdit()->geometry().center());
    QVERIFY(!m_box->view()->isVisible());
    m_touch->tap(m_box, QPoint(m_box->width() - 8, 24)); // the arrow
    QVERIFY(m_box->view()->isVisible());
}

void tst_kscombobox::looks()
{
    const QImage rest = m_box->grab().toImage();
    m_box->setEnabled(false);
    const QImage disabled = m_box->grab().toImage();
    QVERIFY(rest != disabled);
    m_box->setEnabled(true);
    m_box->setCurrentIndex(4);
    QVERIFY(m_box->grab().toImage() != rest); // another text
    m_box->setBackgroundImagesPath(QStringLiteral(":/nowhere/Box"));
    QVERIFY(m_box->grab().toImage() != rest);
}

QTEST_MAIN(tst_kscombobox)
#include "tst_kscombobox.moc"
