// Rows of a list, their order and places, the list's scroll bar, wheel and keys; what a row is made of.
#include "ScrollViewerFixture.h"
#include "tests/support/Patience.h"

#include "TouchDevice.h"
#include "touchui/KSScrollBar.h"

#include <QGraphicsEffect>
#include <QLabel>
#include <QScreen>
#include <QSignalSpy>
#include <QVBoxLayout>
#include <QWheelEvent>

using Names = QStringList;

class tst_ksscrollviewerwidget_layout : public QObject
{
    Q_OBJECT
private Q_SLOTS:
    void initTestCase();
    void init();
    void cleanup();

    void emptyList();
    void rowsInTheirOrder();
    void addingNonsense();
    void removing();
    void removedRowCanComeBack();
    void swapping();
    void relayoutKeepsThePlace();
    void growingRow();
    void marginsAndSpacing();
    void barShowsWhenNeeded();
    void barSides();
    void barsGoTogether();
    void barStaysInItsPlace();
    void scrolledIsWhatWouldBePainted();
    void moving_data();
    void moving();
    void lastVisible();
    void visibleRange();
    void finding();
    void insertPlaces();
    void wheelGoesByRows();
    void wheelAtTheLowerEnd();
    void keysAreEaten();
    void separators();
    void barStyleGrowsOnce();
    void minitrimStatus();
    void outlivesItsRows();

    void children();
    void wholeChild();
    void childLayout();
    void handlePlaces_data();
    void handlePlaces();
    void liftedLook();
    void styles();
    void rowLosesItsFocus();
    void mousePassesThrough();
    void barPictures_data();
    void barPictures();
    void barSwallows();

private:
    void wheel(int delta);

    TouchDevice m_device;
    std::unique_ptr<ScrollViewerFixture> m;
};

void tst_ksscrollviewerwidget_layout::initTestCase()
{
    Q_INIT_RESOURCE(UILibrary);
}

void tst_ksscrollviewerwidget_layout::init()
{
    m = std::make_unique<ScrollViewerFixture>(m_device);
}

void tst_ksscrollviewerwidget_layout::cleanup()
{
    m.reset();
}

void tst_ksscrollviewerwidget_layout::wheel(int delta)
{
    const QPoint pos(200, 200);
    QWheelEvent event(pos, m->m_list->mapToGlobal(pos), QPoint(), QPoint(0, delta), Qt::NoButton,
                      Qt::NoModifier, Qt::NoScrollPhase, false);
    QCoreApplication::sendEvent(m->m_list->viewport(), &event);
}

void tst_ksscrollviewerwidget_layout::emptyList()
{
    QVERIFY(m->m_list->isEmpty());
    QCOMPARE(m->m_list->count(), 0);
    QCOMPARE(m->maximum(), 0);
    QCOMPARE(m->m_list->getVScrollBar()->maximum(), 0);
    QCOMPARE(m->m_list->widget()->height(), 0);
    QCOMPARE(m->m_list->firstVisibleItem(), -1);
    QCOMPARE(m->m_list->lastVisibleItem(), -1);
    m->m_list->removeAll();
    m->m_list->removeWidgetItem(0);
    m->m_list->removeWidgetItem(nullptr);
    m->m_list->moveToWidgetItem(0);
    m->m_list->setLastVisibleItem(0);
    m->m_list->swap(0, 1);
    wheel(-120);
    QCOMPARE(m->value(), 0);
}

void tst_ksscrollviewerwidget_layout::rowsInTheirOrder()
{
    m->fill(20);
    QCOMPARE(m->m_list->widget()->height(), 20 * ScrollViewerFixture::ROW - 4);
    QCOMPARE(m->maximum(), 20 * ScrollViewerFixture::ROW - 4 - ScrollViewerFixture::HEIGHT);
    QCOMPARE(m->m_list->verticalScrollBar()->pageStep(), ScrollViewerFixture::HEIGHT + 4);
    QCOMPARE(m->m_list->getVScrollBar()->pageStep(), ScrollViewerFixture::HEIGHT + 4);
    for (int i = 0; i < 20; ++i) {
        QCOMPARE(m->m_list->getWidgetItem(i)->y(), i * ScrollViewerFixture::ROW);
        QCOMPARE(m->m_list->getWidgetItem(i)->width(), ScrollViewerFixture::WIDTH - 38);
        QCOMPARE(m->m_list->getIndexOfWidgetItem(m->m_list->getWidgetItem(i)), i);
    }
    m->m_list->addWidgetItem(new Row(QStringLiteral("a")), 1);
    m->m_list->addWidgetItem(new Row(QStringLiteral("b")), -1);
    m->m_list->addWidgetItem(new Row(QStringLiteral("c")), 1000);
    QCOMPARE(m->order().mid(0, 3), (Names{"0", "a", "1"}));
    QCOMPARE(m->order().mid(20), (Names{"19", "b", "c"}));
    QCOMPARE(m->m_list->getWidgetItem(2)->y(), 2 * ScrollViewerFixture::ROW);
}

void tst_ksscrollviewerwidget_layout::addingNonsense()
{
    m->fill(3);
    m->m_list->addWidgetItem(nullptr, 0);
    m->m_list->addWidgetItem(m->m_list->getWidgetItem(1), 0);
    m->m_list->addWidgetItems(nullptr, 0);
    QList<KSBaseItemWidget*> mixed{nullptr, m->m_list->getWidgetItem(0), new Row(QStringLiteral("n"))};
    m->m_list->addWidgetItems(&mixed, 1);
    QCOMPARE(m->order(), (Names{"0", "n", "1", "2"}));
    QVERIFY(!m->m_list->getWidgetItem(-1));
    QVERIFY(!m->m_list->getWidgetItem(4));
    QCOMPARE(m->m_list->getIndexOfWidgetItem(nullptr), -1);
}

void tst_ksscrollviewerwidget_layout::removing()
{
    m->fill(10);
    KSBaseItemWidget* gone = m->m_list->getWidgetItem(2);
    m->m_list->removeWidgetItem(gone);
    QVERIFY(gone->isHidden());
    m->m_list->removeWidgetItem(0);
    m->m_list->removeWidgetItems(2, 3);
    QCOMPARE(m->order(), (Names{"1", "3", "7", "8", "9"}));
    m->m_list->removeWidgetItems(m->m_list->getWidgetItem(3), 100);
    QCOMPARE(m->order(), (Names{"1", "3", "7"}));
    m->m_list->removeWidgetItems(1, 0);
    m->m_list->removeWidgetItems(-1, 2);
    m->m_list->removeWidgetItem(gone);
    QCOMPARE(m->m_list->count(), 3);
    m->m_list->removeAll();
    QVERIFY(m->m_list->isEmpty());
    QCOMPARE(m->maximum(), 0);
}

void tst_ksscrollviewerwidget_layout::removedRowCanComeBack()
{
    m->fill(3);
    KSBaseItemWidget* row = m->m_list->getWidgetItem(1);
    m->m_list->removeWidgetItem(row);
    m->m_list->addWidgetItem(row, 2);
    QCOMPARE(m->order(), (Names{"0", "2", "1"}));
    QVERIFY(row->isVisible());
    m->tap(100, 250);
    QCOMPARE(m->takeLog(), (Names{"pressed 1", "released 1", "clicked 1"}));
}

void tst_ksscrollviewerwidget_layout::swapping()
{
    m->fill(4);
    m->m_list->swap(0, 3);
    m->m_list->swap(m->m_list->getWidgetItem(1), m->m_list->getWidgetItem(2));
    m->m_list->swap(1, 1);
    m->m_list->swap(1, 9);
    QCOMPARE(m->order(), (Names{"3", "2", "1", "0"}));
    QCOMPARE(m->m_list->getWidgetItem(0)->y(), 0);
}

void tst_ksscrollviewerwidget_layout::relayoutKeepsThePlace()
{
    m->fill(20);
    m->m_list->slotSetScrollBarValue(730);
    m->m_list->addWidgetItem(new Row(QStringLiteral("new")), 0);
    QCOMPARE(m->value(), 730);
    m->m_list->slotHandleItemSizeChange();
    QCOMPARE(m->value(), 730);
    m->m_list->resize(m->m_list->size());
    m->m_list->setSize(ScrollViewerFixture::WIDTH, 400);
    QCOMPARE(m->value(), 730);
    QCOMPARE(m->m_list->getVScrollBar()->value(), 730);
    m->m_list->removeWidgetItems(2, 100);
    QCOMPARE(m->value(), 0);
}

void tst_ksscrollviewerwidget_layout::growingRow()
{
    m->fill(3);
    m->m_list->getWidgetItem(0)->setFixedHeight(300);
    QTRY_COMPARE(m->m_list->getWidgetItem(1)->y(), 304);
    QCOMPARE(m->maximum(), 3 * ScrollViewerFixture::ROW - 4 + 200 - ScrollViewerFixture::HEIGHT);
}

void tst_ksscrollviewerwidget_layout::marginsAndSpacing()
{
    m->fill(3);
    m->m_list->setMargins(1, 20, 3, 40);
    m->m_list->setSpacingBetweenItems(10);
    QCOMPARE(m->m_list->widget()->height(), 20 + 40 + 300 + 20);
    QCOMPARE(m->m_list->getWidgetItem(2)->y(), 20 + 2 * 110);
    m->m_list->setSpacingBetweenItemAndScrollbar(26);
    QCOMPARE(m->m_list->getSpacingBetweenItemAndScrollbar(), 26);
    QCOMPARE(m->m_list->getWidgetItem(0)->mapTo(m->m_list, QPoint()).x(), 26 + 32 + 1);
}

void tst_ksscrollviewerwidget_layout::barShowsWhenNeeded()
{
    m->fill(3);
    KSScrollBar* bar = m->m_list->getVScrollBar();
    QVERIFY(!bar->isVisible());
    m->m_list->setScrollBarAutoShow(false);
    QVERIFY(bar->isVisible());
    m->m_list->setScrollBarAutoShow(true);
    QVERIFY(!bar->isVisible());
    m->fill(3);
    QVERIFY(bar->isVisible());
}

void tst_ksscrollviewerwidget_layout::barSides()
{
    m->fill(10);
    KSScrollBar* bar = m->m_list->getVScrollBar();
    const QWidget* row = m->m_list->getWidgetItem(0);
    QCOMPARE(m->m_list->getVScrollBarAlignment(), Qt::Alignment(Qt::AlignLeft));
    QCOMPARE(bar->pos(), QPoint(0, 0));
    QCOMPARE(bar->size(), QSize(32, ScrollViewerFixture::HEIGHT));
    QCOMPARE(row->mapTo(m->m_list, QPoint()), QPoint(38, 0));
    m->m_list->setVScrollBarAlignment(Qt::AlignRight);
    QCOMPARE(bar->pos(), QPoint(ScrollViewerFixture::WIDTH - 32, 0));
    QCOMPARE(row->mapTo(m->m_list, QPoint()), QPoint(0, 0));
    m->m_list->setVScrollBarAlignment(Qt::AlignTop);
    QCOMPARE(m->m_list->getVScrollBarAlignment(), Qt::Alignment(Qt::AlignRight));
    m->m_list->setSize(300, 300);
    QCOMPARE(bar->pos(), QPoint(300 - 32, 0));
}

void tst_ksscrollviewerwidget_layout::barsGoTogether()
{
    m->fill(20);
    m->m_list->getVScrollBar()->setValue(300);
    QCOMPARE(m->value(), 300);
    m->m_list->verticalScrollBar()->setValue(500);
    QCOMPARE(m->m_list->getVScrollBar()->value(), 500);
    m->m_list->slotSetScrollBarValue(1000000);
    QCOMPARE(m->value(), m->maximum());
    m->m_list->slotSetScrollBarValue(-5);
    QCOMPARE(m->m_list->getVScrollBar()->value(), 0);
}

// What is moved on the screen must be what a full painting gives.
// Also while nothing is shown, when the viewport does not scroll.
void tst_ksscrollviewerwidget_layout::barStaysInItsPlace()
{
    m->fill(20);
    const QRect place = m->m_list->getVScrollBar()->geometry();
    const auto scroll = [this](int value) { m->m_list->slotSetScrollBarValue(value); };
    scroll(m->maximum());
    QCOMPARE(m->m_list->getVScrollBar()->geometry(), place);
    m->m_window.hide();
    scroll(0);
    scroll(300);
    QCOMPARE(m->m_list->getVScrollBar()->geometry(), place);
    m->m_window.show();
    QVERIFY(QTest::qWaitForWindowExposed(&m->m_window, PATIENCE_MS));
    QCOMPARE(m->m_list->getVScrollBar()->geometry(), place);
    m->m_list->setUpdatesEnabled(false);
    scroll(m->maximum());
    m->m_list->setUpdatesEnabled(true);
    QCOMPARE(m->m_list->getVScrollBar()->geometry(), place);
}

void tst_ksscrollviewerwidget_layout::scrolledIsWhatWouldBePainted()
{
    QWidget above(&m->m_window); // floats over a part of the list, as a lifted row does
    above.setGeometry(300, 250, 120, 60);
    above.setStyleSheet(QStringLiteral("background: rgb(200, 0, 0)"));
    above.hide();
    for (int i = 0; i < 20; ++i) {
        auto* row = new Row(QString::number(i));
        row->setStyleSheet(QStringLiteral("QPushButton { background: rgb(%1, 80, 40) }").arg(10 * i + 40));
        row->setText(QString::number(i));
        m->m_list->addWidgetItem(row, -1);
    }
    const auto onScreen = [this] {
        return m->m_window.screen()
            ->grabWindow(m->m_window.winId())
            .toImage()
            .convertToFormat(QImage::Format_RGB32);
    };
    const auto painted = [this] {
        return m->m_window.grab().toImage().convertToFormat(QImage::Format_RGB32);
    };
    for (const bool covered : {false, true}) {
        above.setVisible(covered);
        above.raise();
        for (const int value : {0, 24, 130, 131, 900, 876, 1500, 20, 0}) {
            m->m_list->slotSetScrollBarValue(value);
            QCOMPARE(m->value(), value);
            QTRY_VERIFY2(onScreen() == painted(), qPrintable(QString::number(value)));
            QVERIFY(!onScreen().isNull());
        }
    }
}

void tst_ksscrollviewerwidget_layout::moving_data()
{
    QTest::addColumn<int>("index");
    QTest::addColumn<int>("value");
    QTest::newRow("first") << 0 << 0;
    QTest::newRow("third") << 3 << 3 * ScrollViewerFixture::ROW;
    QTest::newRow("last") << 19 << 20 * ScrollViewerFixture::ROW - 4 - ScrollViewerFixture::HEIGHT;
    QTest::newRow("below") << -1 << 77;
    QTest::newRow("beyond") << 20 << 77;
}

void tst_ksscrollviewerwidget_layout::moving()
{
    QFETCH(int, index);
    m->fill(20);
    m->m_list->slotSetScrollBarValue(77);
    m->m_list->moveToWidgetItem(index);
    QTEST(m->value(), "value");
}

void tst_ksscrollviewerwidget_layout::lastVisible()
{
    m->fill(20);
    m->m_list->setLastVisibleItem(10);
    QCOMPARE(m->value(), 10 * ScrollViewerFixture::ROW + 100 - ScrollViewerFixture::HEIGHT);
    m->m_list->setLastVisibleItem(m->m_list->getWidgetItem(1));
    QCOMPARE(m->value(), 0);
    m->m_list->setLastVisibleItem(20);
    m->m_list->setLastVisibleItem(nullptr);
    QCOMPARE(m->value(), 0);
}

void tst_ksscrollviewerwidget_layout::visibleRange()
{
    m->fill(20);
    QSignalSpy changes(m->m_list, &KSScrollViewerWidget::signalVisibleItemsChange);
    QCOMPARE(m->m_list->firstVisibleItem(), 0);
    QCOMPARE(m->m_list->lastVisibleItem(), 4);
    m->m_list->slotSetScrollBarValue(10);
    QCOMPARE(changes.count(), 0);
    m->m_list->slotSetScrollBarValue(100); // the gap below the first row is left of it
    QCOMPARE(changes.count(), 1);
    QCOMPARE(m->m_list->firstVisibleItem(), 1);
    QCOMPARE(m->m_list->lastVisibleItem(), 5);
    QCOMPARE(m->m_list->calculateVisibleRect(), QRect(-38, 100, 400, 500));
}

void tst_ksscrollviewerwidget_layout::finding()
{
    m->fill(20);
    m->m_list->slotSetScrollBarValue(ScrollViewerFixture::ROW);
    QCOMPARE(m->m_list->getWidgetItem(QPoint(100, 10)), m->m_list->getWidgetItem(1));
    QVERIFY(!m->m_list->getWidgetItem(QPoint(100, 101)));
    QVERIFY(!m->m_list->getWidgetItem(QPoint(10, 10)));
    QCOMPARE(m->m_list->getWidgetItems(QRect(100, 0, 10, 150)).size(), 2);
    QCOMPARE(m->m_list->getItemsIntersectRect(QRect(0, 0, 10, 150)).constFirst(),
             m->m_list->getWidgetItem(0));
    QCOMPARE(m->m_list->getWidgetItems(18, 5).size(), 2);
    QVERIFY(m->m_list->getWidgetItems(-3, 5).isEmpty());
    QVERIFY(m->m_list->getWidgetItems(3, -5).isEmpty());
}

void tst_ksscrollviewerwidget_layout::insertPlaces()
{
    m->fill(3);
    QCOMPARE(m->m_list->getInsertPos(QPoint(100, 10)), 0);
    QCOMPARE(m->m_list->getInsertPos(QPoint(100, 60)), 1);
    QCOMPARE(m->m_list->getInsertPos(QPoint(100, 160)), 2);
    QCOMPARE(m->m_list->getInsertPos(QPoint(100, 499)), 3);
}

void tst_ksscrollviewerwidget_layout::wheelGoesByRows()
{
    m->fill(20);
    QSignalSpy changes(m->m_list, &KSScrollViewerWidget::signalVisibleItemsChange);
    wheel(-120);
    QCOMPARE(m->value(), ScrollViewerFixture::ROW);
    wheel(-120);
    QCOMPARE(m->value(), 2 * ScrollViewerFixture::ROW);
    wheel(120);
    QCOMPARE(m->value(), ScrollViewerFixture::ROW);
    wheel(120);
    QCOMPARE(m->value(), 0);
    changes.clear();
    wheel(120);
    QCOMPARE(m->value(), 0);
    QCOMPARE(changes.count(), 1);
}

void tst_ksscrollviewerwidget_layout::wheelAtTheLowerEnd()
{
    m->fill(20);
    m->m_list->slotSetScrollBarValue(m->maximum());
    const int first = m->m_list->firstVisibleItem();
    wheel(-120);
    QCOMPARE(m->value(), m->maximum());
    // The row that is cut above comes in whole, no further.
    QVERIFY(m->m_list->getWidgetItem(first)->mapTo(m->m_list, QPoint()).y() < 0);
    wheel(120);
    QCOMPARE(m->value(), first * ScrollViewerFixture::ROW);
}

void tst_ksscrollviewerwidget_layout::keysAreEaten()
{
    m->fill(20);
    for (int key :
         {Qt::Key_Down, Qt::Key_Right, Qt::Key_PageDown, Qt::Key_Up, Qt::Key_Left, Qt::Key_PageUp}) {
        QTest::keyClick(m->m_list, static_cast<Qt::Key>(key));
        QCOMPARE(m->value(), 0);
    }
}

void tst_ksscrollviewerwidget_layout::separators()
{
    const auto gap = [this] { return m->m_window.grab().toImage().pixelColor(100 + 200, 100 + 102); };
    m->fill(3);
    const QColor line = gap();
    QVERIFY(line != QColor(51, 51, 51));
    QCOMPARE(m->m_window.grab().toImage().pixelColor(300, 100 + 2 * ScrollViewerFixture::ROW + 102),
             QColor(51, 51, 51)); // none below the last one
    m->m_list->setHasSeparator(false);
    QVERIFY(!m->m_list->getHasSeparator());
    QCOMPARE(gap(), QColor(51, 51, 51));
}

void tst_ksscrollviewerwidget_layout::barStyleGrowsOnce()
{
    const QString before = KSScrollViewerWidget::s_scrollBarStyle;
    m->m_list->slotChangeScrollBarStyle(0, 0);
    const QString once = KSScrollViewerWidget::s_scrollBarStyle;
    QVERIFY(once.startsWith(before) && once.endsWith(QStringLiteral("width: 20px}")));
    m->m_list->slotChangeScrollBarStyle(3, 3);
    QCOMPARE(KSScrollViewerWidget::s_scrollBarStyle, once);
    m->m_list->slotChangeScrollBarStyle(0, 9);
    QVERIFY(KSScrollViewerWidget::s_scrollBarStyle.endsWith(QStringLiteral("width: 14px}")));
    KSScrollViewerWidget::s_scrollBarStyle = before;
}

void tst_ksscrollviewerwidget_layout::minitrimStatus()
{
    QVERIFY(m->m_list->setMinitrimStatus(false));
    QVERIFY(!m->m_list->setMinitrimStatus(true));
}

void tst_ksscrollviewerwidget_layout::outlivesItsRows()
{
    m->fill(10);
    QPointer<KSBaseItemWidget> row = m->m_list->getWidgetItem(3);
    delete row;
    QCOMPARE(m->m_list->count(), 9);
    QCOMPARE(m->m_list->getWidgetItem(3)->objectName(), QStringLiteral("4"));
    QTRY_COMPARE(m->m_list->getWidgetItem(3)->y(), 3 * ScrollViewerFixture::ROW);
    row = m->m_list->getWidgetItem(0);
    delete m->m_list;
    QVERIFY(!row);
}

void tst_ksscrollviewerwidget_layout::children()
{
    QWidget parent;
    KSBaseItemWidget item(&parent);
    auto* left = new QWidget;
    auto* right = new QWidget;
    auto* third = new QWidget;
    item.setChild(left, CHILD_LEFT);
    item.setChild(right, CHILD_RIGHT);
    item.setChild(third, CHILD_THIRD);
    QCOMPARE(item.getLeftChild(), left);
    QCOMPARE(item.getRightChild(), right);
    QCOMPARE(item.getThirdChild(), third);
    QCOMPARE(item.getChild(CHILD_RIGHT), right);
    QVERIFY(left->testAttribute(Qt::WA_TransparentForMouseEvents));
    QCOMPARE(left->parentWidget(), &item);
    const QPointer<QWidget> watched = left;
    item.setChild(new QWidget, CHILD_LEFT);
    QVERIFY(!watched);
    item.setChild(nullptr, CHILD_LEFT);
    QVERIFY(!item.getLeftChild());
    QCOMPARE(item.getRightChild(), right);
}

void tst_ksscrollviewerwidget_layout::wholeChild()
{
    KSBaseItemWidget item;
    const QPointer<QWidget> right = new QWidget;
    item.setChild(new QWidget, CHILD_LEFT);
    item.setChild(right, CHILD_RIGHT);
    auto* whole = new QWidget;
    item.setChild(whole, CHILD_WHOLE);
    QVERIFY(!right);
    QCOMPARE(item.getLeftChild(), whole);
    QCOMPARE(item.getRightChild(), whole);
    QCOMPARE(item.getThirdChild(), whole);
    item.setChild(new QWidget, CHILD_RIGHT);
    QVERIFY(item.getRightChild() != whole);
    QVERIFY(!item.getThirdChild());
}

void tst_ksscrollviewerwidget_layout::childLayout()
{
    KSBaseItemWidget item;
    item.setFixedSize(300, 100);
    auto* left = new QLabel(QStringLiteral("left"));
    auto* right = new QLabel(QStringLiteral("right"));
    item.setChild(left, CHILD_LEFT);
    item.setChild(right, CHILD_RIGHT);
    item.setSpace(8, 5);
    item.createWidget();
    item.show();
    item.layout()->activate();
    QCOMPARE(left->x(), 5);
    QCOMPARE(right->geometry().right(), 294);
    QCOMPARE(right->x() - left->geometry().right() - 1, 8);
}

void tst_ksscrollviewerwidget_layout::handlePlaces_data()
{
    QTest::addColumn<int>("alignment");
    QTest::addColumn<int>("height");
    QTest::addColumn<QRect>("area");
    QTest::addColumn<QPoint>("handle");
    QTest::newRow("left") << int(DRAGFLAG_LEFT) << 139 << QRect(0, 48, 36, 42) << QPoint(6, 58);
    QTest::newRow("right") << int(DRAGFLAG_RIGHT) << 139 << QRect(469, 48, 36, 42) << QPoint(483, 58);
    QTest::newRow("even height") << int(DRAGFLAG_LEFT) << 100 << QRect(0, 28, 36, 42) << QPoint(6, 38);
    QTest::newRow("none") << int(DRAGFLAG_NONE) << 139 << QRect() << QPoint(0, 58);
}

void tst_ksscrollviewerwidget_layout::handlePlaces()
{
    QFETCH(int, alignment);
    QFETCH(int, height);
    QFETCH(QPoint, handle);
    KSBaseItemWidget item;
    item.resize(505, height);
    item.show();
    item.setDragFlagAlignment(static_cast<DragFlagAlignment>(alignment));
    item.setDragFlag(true);
    QTEST(item.getDragArea(), "area");
    QCOMPARE(item.getDragFlagAlignment(), static_cast<DragFlagAlignment>(alignment));
    const QLabel* label = item.findChild<QLabel*>();
    QCOMPARE(label->pos(), handle);
    QVERIFY(label->isVisible());
    item.setDragFlag(false);
    QVERIFY(label->isHidden());
}

void tst_ksscrollviewerwidget_layout::liftedLook()
{
    KSBaseItemWidget item;
    item.resize(505, 139);
    const QImage before = item.grab().toImage();
    QVERIFY(!item.graphicsEffect());
    item.setPopup(true);
    QVERIFY(item.graphicsEffect());
    QVERIFY(item.grab().toImage() != before);
    item.setPopup(false);
    QVERIFY(!item.graphicsEffect());
    QCOMPARE(item.grab().toImage(), before);
}

void tst_ksscrollviewerwidget_layout::styles()
{
    KSBaseItemWidget item;
    item.resize(100, 50);
    QCOMPARE(item.grab().toImage().pixelColor(50, 25), QColor(51, 51, 51));
    item.setSelectedStyle();
    QCOMPARE(item.grab().toImage().pixelColor(50, 25), QColor(0, 129, 255));
    item.setNormalStyle();
    QCOMPARE(item.grab().toImage().pixelColor(50, 25), QColor(51, 51, 51));
    QVERIFY(!item.clone());
}

void tst_ksscrollviewerwidget_layout::rowLosesItsFocus()
{
    m->fill(5);
    QSignalSpy lost(m->m_list->getWidgetItem(1), &KSBaseItemWidget::signalLostFocus);
    m->tap(100, 150);
    QVERIFY(m->m_list->getWidgetItem(1)->hasFocusFlag());
    m->tap(100, 150);
    QCOMPARE(lost.count(), 0);
    m->tap(100, 50);
    QCOMPARE(lost.count(), 1);
    m->tap(100, 50);
    QCOMPARE(lost.count(), 1);
    m->tap(100, 150);
    m->m_list->getWidgetItem(1)->setPopup(true);
    m->tap(100, 50);
    QCOMPARE(lost.count(), 1);
    m->m_list->getWidgetItem(1)->setPopup(false);
    QTest::mouseClick(&m->m_window, Qt::LeftButton, Qt::NoModifier, QPoint(10, 10));
    QCOMPARE(lost.count(), 2);
}

void tst_ksscrollviewerwidget_layout::mousePassesThrough()
{
    m->fill(5);
    QSignalSpy clicked(m->m_list->getWidgetItem(1), &QAbstractButton::clicked);
    QTest::mouseClick(m->m_list->getWidgetItem(1), Qt::LeftButton);
    QCOMPARE(m->takeLog(), (Names{"pressed 1", "released 1", "clicked 1"}));
    QTest::mouseDClick(m->m_list->getWidgetItem(1), Qt::LeftButton);
    m->clock.advance(2000);
    QCOMPARE(clicked.count(), 0);
}

void tst_ksscrollviewerwidget_layout::barPictures_data()
{
    QTest::addColumn<bool>("vertical");
    QTest::newRow("vertical") << true;
    QTest::newRow("horizontal") << false;
}

void tst_ksscrollviewerwidget_layout::barPictures()
{
    QFETCH(bool, vertical);
    KSScrollBar bar(vertical ? Qt::Vertical : Qt::Horizontal);
    bar.resize(vertical ? QSize(32, 400) : QSize(400, 32));
    bar.setRange(0, 1000);
    bar.setPageStep(500);
    bar.show();
    const QPoint middle = bar.handleRect().center();
    const QImage rest = bar.grab().toImage();
    QVERIFY(rest.pixelColor(middle) != QColor(51, 51, 51));
    QTest::mousePress(&bar, Qt::LeftButton, Qt::NoModifier, middle);
    const QImage pressed = bar.grab().toImage();
    QVERIFY(pressed != rest);
    QTest::mouseRelease(&bar, Qt::LeftButton, Qt::NoModifier, middle);
    QCOMPARE(bar.grab().toImage(), rest);
    bar.setValue(1000);
    QVERIFY(bar.grab().toImage() != rest);
}

void tst_ksscrollviewerwidget_layout::barSwallows()
{
    m->fill(20);
    KSScrollBar* bar = m->m_list->getVScrollBar();
    QContextMenuEvent menu(QContextMenuEvent::Mouse, QPoint(5, 5), bar->mapToGlobal(QPoint(5, 5)));
    QVERIFY(QCoreApplication::sendEvent(bar, &menu));
    QWheelEvent event(QPoint(5, 5), bar->mapToGlobal(QPoint(5, 5)), QPoint(), QPoint(0, -120), Qt::NoButton,
                      Qt::NoModifier, Qt::NoScrollPhase, false);
    QCoreApplication::sendEvent(bar, &event);
    QCOMPARE(m->value(), ScrollViewerFixture::ROW);
    QKeyEvent page(QEvent::KeyRelease, Qt::Key_PageDown, Qt::NoModifier);
    QCoreApplication::sendEvent(bar, &page);
    QVERIFY(!page.isAccepted());
}

QTEST_MAIN(tst_ksscrollviewerwidget_layout)
#include "tst_ksscrollviewerwidget_layout.moc"
