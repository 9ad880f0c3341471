// The touch tree under real fingers and the mouse, through the application's filter, and what it paints.
#include "TreeFixture.h"

#include "touchui/CustomTreeDelegete.h"
#include "touchui/KSAppEventFilter.h"
#include "touchui/KSScrollBar.h"
#include "touchui/KSToolTip.h"
#include "touchui/KSTreeHeaderView.h"
#include "touchui/KSTreeModel.h"
#include "touchui/KSTreeView.h"

#include <QApplication>
#include <QLineEdit>
#include <QPointingDevice>
#include <QSignalSpy>
#include <QTest>
#include <QVBoxLayout>

namespace
{

constexpr int ROW = 48;
const QColor BACKGROUND(51, 51, 51);

// Lets the tests see the ticks of the motion.
class ProbeTree : public KSTreeView
{
public:
    using KSTreeView::KSTreeView;
    int ticks = 0;
    int bottoms = 0;
    QList<int> offsets;

    void changeScrollBarValue(int offset) override
    {
        ++ticks;
        offsets.append(offset);
        KSTreeView::changeScrollBarValue(offset);
    }
};

class SelfEndingSource : public TreeSource
{
public:
    bool isControlSelfEnding() const override { return true; }
};

} // namespace

class TestTreeView : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void init();
    void cleanup();

    void opensWithoutMakingHiddenChildren();
    void tapSelectsOnRelease();
    void tapOnTheIndicatorOpensAndCloses();
    void tapBesideTheRowsSelectsNothing();
    void disabledRowIsNotSelected();
    void slidingOffTheIndicatorDoesNothing();
    void holdMakesCurrentAndTells();
    void movementCancelsTheHold();
    void dragScrollsAndSelectsNothing();
    void flickGlidesOnAndComesToRest();
    void flickIntoTheEndShowsTheLastRowWhole();
    void flickAtTheTopDiesAtOnce();
    void brakeSelectsNothing();
    void fiveRowsOfPixelsAreNoFlick();
    void secondFingerIsIgnored();
    void trackedFingerLiftsFirst();
    void otherWidgetIsLockedOut();
    void cancelledTouchSelectsNothing();
    void hidingEndsEverything();
    void mouseTapsAndScrolls();
    void shortListDoesNotScroll();
    void dragCreepsByTwo();
    void flickStepIsAtLeastAPixel();

    void tapOnTheHeaderSorts();
    void cancelOnTheHeaderSortsNothing();
    void sortKeepsTheCurrentRow();
    void keysDoNotMoveTheSelection();

    void editorOpensAndCommits();
    void editorCanBeReverted();
    void editorIgnoresRowsThatAreNotEditable();
    void selfEndingControlSurvivesTheLossOfFocus();
    void editorKeepsItsTextWhenTheRowChanges();
    void closingAStrangeEditorDoesNothing();
    void rowVanishesUnderTheEditor();

    void moveToSibling();
    void checkBoxesFollowEachOther();
    void checkedFolderChecksChildrenMadeLater();
    void checkBoxUnderTheFinger();
    void loadingMarksStep();
    void recordingMarks();
    void heldLongNameShowsABalloon();

    void designAttributes();
    void scrollBarsAreOurs();
    void paintsRowsToTheBottom();
    void paintsSelectionOverTheWholeRow();
    void paintsUnderAWindowStyleSheet();
    void operationFocusSurroundsTheEditedRow();

private:
    QPoint rowPoint(int row, int x = 300) const { return QPoint(x, row * ROW + ROW / 2); }
    void touchTap(const QPoint& point);
    void swipe(const QPoint& from, int distance, int steps);
    QImage shot();

    QPointingDevice* m_device = nullptr;
    std::unique_ptr<KSAppEventFilter> m_filter;
    std::unique_ptr<SelfEndingSource> m_source;
    std::unique_ptr<KSTreeModel> m_model;
    std::unique_ptr<ProbeTree> m_tree;
    QWidget* m_area = nullptr;
};

void TestTreeView::initTestCase()
{
    Q_INIT_RESOURCE(UILibrary);
    qRegisterMetaType<QLineEdit*>();
    m_device = QTest::createTouchDevice();
    m_device->setParent(this);
}

void TestTreeView::init()
{
    m_filter = std::make_unique<KSAppEventFilter>();
    m_filter->registerLockObject(m_filter.get(), nullptr, LOCKOBJECT_DEFAULTMUTEX, nullptr);
    qApp->installEventFilter(m_filter.get());
    m_source = std::make_unique<SelfEndingSource>();
    m_source->fill(40, 3);
    m_model = std::make_unique<KSTreeModel>(m_source.get(), 2);
    m_model->createDataItems();
    m_tree = std::make_unique<ProbeTree>();
    m_tree->setModel(m_model.get());
    m_tree->resize(802, 570);
    m_tree->header()->resizeSection(0, 520);
    m_tree->show();
    QVERIFY(QTest::qWaitForWindowExposed(m_tree.get()));
    m_area = m_tree->viewport();
}

void TestTreeView::cleanup()
{
    m_tree.reset();
    m_model.reset();
    m_source.reset();
    m_filter.reset();
}

void TestTreeView::touchTap(const QPoint& point)
{
    QTest::touchEvent(m_area, m_device).press(0, point, m_area);
    QTest::touchEvent(m_area, m_device).release(0, point, m_area);
}

// Leaves the finger up. The list lags behind the finger, so it glides.
void TestTreeView::swipe(const QPoint& from, int distance, int steps)
{
    QTest::touchEvent(m_area, m_device).press(0, from, m_area);
    for (int step = 1; step <= steps; ++step) {
        QTest::touchEvent(m_area, m_device).move(0, from + QPoint(0, distance * step / steps), m_area);
    }
    QTest::touchEvent(m_area, m_device).release(0, from + QPoint(0, distance), m_area);
}

QImage TestTreeView::shot()
{
    return m_tree->grab().toImage().convertToFormat(QImage::Format_RGB32);
}

void TestTreeView::opensWithoutMakingHiddenChildren()
{
    TreeSource source;
    source.fill(200, 99);
    KSTreeModel model(&source, 3);
    KSTreeView tree;
    tree.setModel(&model);
    model.createDataItems();
    tree.resize(802, 570);
    tree.show();
    QVERIFY(QTest::qWaitForWindowExposed(&tree));
    tree.grab();
    tree.scrollToBottom();
    tree.grab();
    QCOMPARE(source.installed, 200);
    tree.expand(model.index(199, 0));
    tree.grab();
    QCOMPARE(source.installed, 299);
}

void TestTreeView::tapSelectsOnRelease()
{
    QSignalSpy pressed(m_tree.get(), &QAbstractItemView::pressed);
    QSignalSpy clicked(m_tree.get(), &QAbstractItemView::clicked);
    QSignalSpy current(m_tree.get(), &KSTreeView::signalCurrentChangedByTouch);
    QTest::touchEvent(m_area, m_device).press(0, rowPoint(2), m_area);
    QVERIFY(!m_tree->currentIndex().isValid());
    QTest::touchEvent(m_area, m_device).release(0, rowPoint(2) + QPoint(3, 3), m_area);
    QCOMPARE(m_tree->currentIndex(), m_model->index(2, 0));
    QVERIFY(m_tree->selectionModel()->isRowSelected(2, QModelIndex()));
    QCOMPARE(pressed.count(), 1);
    QCOMPARE(clicked.count(), 1);
    QCOMPARE(current.count(), 1);
    QCOMPARE(current.at(0).at(0).toModelIndex(), m_model->index(2, 0));
    touchTap(rowPoint(4, 700)); // the date column
    QCOMPARE(m_tree->currentIndex(), m_model->index(4, 1));
}

void TestTreeView::tapOnTheIndicatorOpensAndCloses()
{
    const QModelIndex folder = m_model->index(1, 0);
    const QPoint indicator = m_tree->getIndicatorRect(folder).center();
    QTest::touchEvent(m_area, m_device).press(0, indicator, m_area);
    QVERIFY(m_tree->isIndicatorPressed(folder));
    QTest::touchEvent(m_area, m_device).release(0, indicator, m_area);
    QVERIFY(m_tree->isExpanded(folder));
    QVERIFY(!m_tree->isIndicatorPressed(folder));
    QVERIFY(!m_tree->currentIndex().isValid());
    const QModelIndex title = m_model->index(0, 0, folder);
    QVERIFY(m_tree->getIndicatorRect(title).isNull());
    touchTap(indicator);
    QVERIFY(!m_tree->isExpanded(folder));
}

void TestTreeView::tapBesideTheRowsSelectsNothing()
{
    m_model->removeRows(3, 37);
    touchTap(rowPoint(1));
    QSignalSpy pressed(m_tree.get(), &QAbstractItemView::pressed);
    touchTap(rowPoint(5));
    QCOMPARE(pressed.count(), 0);
    QCOMPARE(m_tree->currentIndex().row(), 1);
}

void TestTreeView::disabledRowIsNotSelected()
{
    m_model->setData(m_model->index(2, 0), false, KSVIEW::ItemEnableRole);
    touchTap(rowPoint(2));
    QVERIFY(!m_tree->currentIndex().isValid());
    touchTap(m_tree->getIndicatorRect(m_model->index(2, 0)).center());
    QVERIFY(!m_tree->isExpanded(m_model->index(2, 0)));
}

void TestTreeView::slidingOffTheIndicatorDoesNothing()
{
    const QModelIndex folder = m_model->index(1, 0);
    const QPoint indicator = m_tree->getIndicatorRect(folder).center();
    QTest::touchEvent(m_area, m_device).press(0, indicator, m_area);
    QTest::touchEvent(m_area, m_device).move(0, indicator + QPoint(60, 0), m_area);
    QVERIFY(!m_tree->isIndicatorPressed(folder));
    QTest::touchEvent(m_area, m_device).move(0, indicator, m_area);
    QTest::touchEvent(m_area, m_device).release(0, indicator, m_area);
    QVERIFY(!m_tree->isExpanded(folder));
    QVERIFY(!m_tree->currentIndex().isValid());
}

void TestTreeView::holdMakesCurrentAndTells()
{
    m_tree->setHoldInterval(30);
    QSignalSpy held(m_tree.get(), &KSTreeView::signalPressedAndHold);
    QSignalSpy pressed(m_tree.get(), &QAbstractItemView::pressed);
    QSignalSpy clicked(m_tree.get(), &QAbstractItemView::clicked);
    QTest::touchEvent(m_area, m_device).press(0, rowPoint(3), m_area);
    m_tree->allTimersReset();
    QTRY_COMPARE(held.count(), 1);
    QCOMPARE(held.at(0).at(0).toModelIndex(), m_model->index(3, 0));
    QCOMPARE(m_tree->currentIndex().row(), 3);
    QTest::touchEvent(m_area, m_device).release(0, rowPoint(3), m_area);
    QCOMPARE(pressed.count(), 1);
    QCOMPARE(clicked.count(), 0);
    QCOMPARE(held.count(), 1);
}

void TestTreeView::movementCancelsTheHold()
{
    m_tree->setHoldInterval(50);
    QSignalSpy held(m_tree.get(), &KSTreeView::signalPressedAndHold);
    // Sideways, so that no motion starts.
    QTest::touchEvent(m_area, m_device).press(0, rowPoint(3), m_area);
    QTest::touchEvent(m_area, m_device)
        .move(0, rowPoint(3) + QPoint(QApplication::startDragDistance() + 1, 0), m_area);
    QTest::qWait(120);
    QCOMPARE(held.count(), 0);
    QTest::touchEvent(m_area, m_device).release(0, rowPoint(3), m_area);
    QVERIFY(!m_tree->currentIndex().isValid());
}

void TestTreeView::dragScrollsAndSelectsNothing()
{
    QTest::touchEvent(m_area, m_device).press(0, rowPoint(8), m_area);
    QTest::touchEvent(m_area, m_device).move(0, rowPoint(8) + QPoint(0, -10), m_area);
    QTest::touchEvent(m_area, m_device).move(0, rowPoint(8) + QPoint(0, -210), m_area);
    QVERIFY(m_tree->hasFlicked());
    QVERIFY(!m_tree->isAutoFilck());
    // The list follows until it is within reach of the finger: the first movement does not count.
    QTRY_VERIFY(m_tree->isFlickEnd());
    QTRY_VERIFY(qAbs(m_tree->verticalScrollBar()->value() - 200) <= 10);
    const int value = m_tree->verticalScrollBar()->value();
    QTest::touchEvent(m_area, m_device).release(0, rowPoint(8) + QPoint(0, -210), m_area);
    QVERIFY(!m_tree->isAutoFilck());
    QCOMPARE(m_tree->verticalScrollBar()->value(), value);
    QVERIFY(!m_tree->currentIndex().isValid());
}

void TestTreeView::flickGlidesOnAndComesToRest()
{
    swipe(rowPoint(8), -30, 3);
    QVERIFY(m_tree->isAutoFilck());
    QTRY_VERIFY_WITH_TIMEOUT(!m_tree->isAutoFilck(), 10000);
    const int value = m_tree->verticalScrollBar()->value();
    QVERIFY2(value > 60, qPrintable(QString::number(value)));
    QVERIFY(value < m_tree->verticalScrollBar()->maximum());
    QVERIFY(!m_tree->currentIndex().isValid());
    // It slows down.
    QVERIFY(qAbs(m_tree->offsets.constLast()) < qAbs(m_tree->offsets.constFirst()));
}

void TestTreeView::flickIntoTheEndShowsTheLastRowWhole()
{
    swipe(rowPoint(10), -450, 3);
    QVERIFY(m_tree->isAutoFilck());
    QTRY_VERIFY_WITH_TIMEOUT(!m_tree->isAutoFilck(), 10000);
    QScrollBar* bar = m_tree->verticalScrollBar();
    QCOMPARE(bar->value(), bar->maximum());
    QCOMPARE(m_tree->visualRect(m_model->index(39, 0)).bottom(), m_area->height() - 1);
    touchTap(QPoint(300, m_area->height() - 10)); // no brake: nothing glides any more
    QCOMPARE(m_tree->currentIndex().row(), 39);
}

void TestTreeView::flickAtTheTopDiesAtOnce()
{
    swipe(rowPoint(1), 300, 2);
    QTRY_VERIFY(!m_tree->isAutoFilck());
    QCOMPARE(m_tree->verticalScrollBar()->value(), 0);
    QVERIFY(m_tree->ticks <= 3);
}

void TestTreeView::brakeSelectsNothing()
{
    QSignalSpy pressed(m_tree.get(), &QAbstractItemView::pressed);
    swipe(rowPoint(8), -60, 3);
    QVERIFY(m_tree->isAutoFilck());
    QTRY_VERIFY(m_tree->verticalScrollBar()->value() > 0);
    QTest::touchEvent(m_area, m_device).press(0, rowPoint(5), m_area);
    QVERIFY(!m_tree->isAutoFilck());
    const int value = m_tree->verticalScrollBar()->value();
    QTest::touchEvent(m_area, m_device).release(0, rowPoint(5), m_area);
    QTest::qWait(80); // two ticks, if there were any
    QCOMPARE(m_tree->verticalScrollBar()->value(), value);
    QVERIFY(!m_tree->currentIndex().isValid());
    QCOMPARE(pressed.count(), 0);
    touchTap(rowPoint(5));
    QCOMPARE(pressed.count(), 1);
}

void TestTreeView::fiveRowsOfPixelsAreNoFlick()
{
    m_tree->setStartPoint(QPoint(0, 0));
    for (const int y : {5, -5, 0}) {
        m_tree->setEndPoint(QPoint(50, y));
        QVERIFY(m_tree->isFlickEnd());
        QVERIFY(!m_tree->hasFlicked());
    }
    m_tree->setEndPoint(QPoint(0, -6));
    QVERIFY(!m_tree->isFlickEnd());
    QVERIFY(m_tree->hasFlicked());
    m_tree->stopFlick();
    QVERIFY(m_tree->hasFlicked());
    m_tree->setStartPoint(QPoint(0, -6));
    QVERIFY(!m_tree->hasFlicked());
}

void TestTreeView::secondFingerIsIgnored()
{
    auto touch = QTest::touchEvent(m_area, m_device, false);
    touch.press(0, rowPoint(2), m_area).commit();
    touch.stationary(0).press(1, rowPoint(6), m_area).commit();
    touch.stationary(0).move(1, rowPoint(1), m_area).commit();
    touch.stationary(0).release(1, rowPoint(1), m_area).commit();
    QVERIFY(!m_tree->hasFlicked());
    QVERIFY(!m_tree->currentIndex().isValid());
    touch.release(0, rowPoint(2), m_area).commit();
    QCOMPARE(m_tree->currentIndex().row(), 2);
}

void TestTreeView::trackedFingerLiftsFirst()
{
    auto touch = QTest::touchEvent(m_area, m_device, false);
    touch.press(0, rowPoint(2), m_area).commit();
    touch.stationary(0).press(1, rowPoint(6), m_area).commit();
    touch.release(0, rowPoint(2), m_area).stationary(1).commit();
    QCOMPARE(m_tree->currentIndex().row(), 2);
    touch.move(1, rowPoint(1), m_area).commit();
    touch.release(1, rowPoint(1), m_area).commit();
    QCOMPARE(m_tree->currentIndex().row(), 2);
    QVERIFY(!m_tree->hasFlicked());
    touchTap(rowPoint(4));
    QCOMPARE(m_tree->currentIndex().row(), 4);
}

void TestTreeView::otherWidgetIsLockedOut()
{
    QWidget* head = m_tree->header()->viewport();
    QSignalSpy sorted(m_tree->header(), &QHeaderView::sectionClicked);
    auto touch = QTest::touchEvent(m_tree.get(), m_device, false);
    touch.press(0, rowPoint(2), m_area).commit();
    touch.stationary(0).press(1, QPoint(100, 20), head).commit();
    touch.stationary(0).release(1, QPoint(100, 20), head).commit();
    QCOMPARE(sorted.count(), 0);
    touch.release(0, rowPoint(2), m_area).commit();
    QCOMPARE(m_tree->currentIndex().row(), 2);
}

void TestTreeView::cancelledTouchSelectsNothing()
{
    m_tree->setHoldInterval(40);
    QSignalSpy held(m_tree.get(), &KSTreeView::signalPressedAndHold);
    QTest::touchEvent(m_area, m_device).press(0, rowPoint(2), m_area);
    QTouchEvent cancel(QEvent::TouchCancel, m_device);
    QApplication::sendEvent(m_area, &cancel);
    QTest::qWait(100);
    QCOMPARE(held.count(), 0);
    QTest::touchEvent(m_area, m_device).release(0, rowPoint(2), m_area);
    QVERIFY(!m_tree->currentIndex().isValid());
    touchTap(rowPoint(2));
    QCOMPARE(m_tree->currentIndex().row(), 2);
}

void TestTreeView::hidingEndsEverything()
{
    m_tree->setHoldInterval(40);
    QSignalSpy held(m_tree.get(), &KSTreeView::signalPressedAndHold);
    swipe(rowPoint(8), -60, 3);
    QVERIFY(m_tree->isAutoFilck());
    m_tree->hide();
    QVERIFY(!m_tree->isAutoFilck());
    m_tree->show();
    QVERIFY(QTest::qWaitForWindowExposed(m_tree.get()));
    QTest::touchEvent(m_area, m_device).press(0, rowPoint(2), m_area);
    m_tree->hide();
    QTest::qWait(100);
    QCOMPARE(held.count(), 0);
    QTest::touchEvent(m_area, m_device).release(0, rowPoint(2), m_area);
}

void TestTreeView::mouseTapsAndScrolls()
{
    QTest::mouseClick(m_area, Qt::LeftButton, {}, rowPoint(3));
    QCOMPARE(m_tree->currentIndex().row(), 3);
    QTest::mouseClick(m_area, Qt::RightButton, {}, rowPoint(5));
    QCOMPARE(m_tree->currentIndex().row(), 3);
    QTest::mouseDClick(m_area, Qt::LeftButton, {}, rowPoint(4)); // does not release
    QTest::mouseRelease(m_area, Qt::LeftButton, {}, rowPoint(4));
    QCOMPARE(m_tree->currentIndex().row(), 4);
    QVERIFY(!m_tree->isExpanded(m_model->index(4, 0)));
    QTest::mousePress(m_area, Qt::LeftButton, {}, rowPoint(8));
    QTest::mouseMove(m_area, rowPoint(8) + QPoint(0, -20));
    QTest::mouseMove(m_area, rowPoint(8) + QPoint(0, -220));
    QTRY_VERIFY(m_tree->isFlickEnd());
    QTRY_VERIFY(qAbs(m_tree->verticalScrollBar()->value() - 200) <= 10);
    QTest::mouseRelease(m_area, Qt::LeftButton, {}, rowPoint(8) + QPoint(0, -220));
    QCOMPARE(m_tree->currentIndex().row(), 4);
    m_tree->verticalScrollBar()->setValue(0);
    QTest::mouseClick(m_area, Qt::LeftButton, {}, m_tree->getIndicatorRect(m_model->index(1, 0)).center());
    QVERIFY(m_tree->isExpanded(m_model->index(1, 0)));
}

void TestTreeView::shortListDoesNotScroll()
{
    m_model->removeRows(3, 37);
    swipe(rowPoint(1), -200, 3);
    QTRY_VERIFY(!m_tree->isAutoFilck());
    QCOMPARE(m_tree->verticalScrollBar()->value(), 0);
    touchTap(rowPoint(1));
    QCOMPARE(m_tree->currentIndex().row(), 1);
}

void TestTreeView::dragCreepsByTwo()
{
    m_tree->setStartPoint(QPoint(100, 100));
    m_tree->setEndPoint(QPoint(100, 100));
    QCOMPARE(m_tree->getDragDistance(), QPoint(0, 1));
    m_tree->setStartPoint(QPoint(100, 100));
    m_tree->setEndPoint(QPoint(110, 99));
    QCOMPARE(m_tree->getDragDistance(), QPoint(5, -1));
    m_tree->setStartPoint(QPoint(0, 0));
    m_tree->setEndPoint(QPoint(0, 5));
    QCOMPARE(m_tree->getDragDistance(), QPoint(0, 2));
}

void TestTreeView::flickStepIsAtLeastAPixel()
{
    m_tree->setStartPoint(QPoint(0, 0));
    m_tree->setEndPoint(QPoint(0, -4));
    for (int y = -4; y < 0; ++y) {
        QCOMPARE(m_tree->getFlickDistance().y(), y / 2);
    }
}

void TestTreeView::tapOnTheHeaderSorts()
{
    m_tree->setSortingEnabled(true);
    QCOMPARE(m_model->index(0, 0).data().toString(), QStringLiteral("Folder 000"));
    QWidget* head = m_tree->header()->viewport();
    for (const char* first : {"Folder 000", "Folder 039", "Folder 000"}) {
        QTest::touchEvent(head, m_device).press(0, QPoint(100, 20), head);
        QTest::touchEvent(head, m_device).release(0, QPoint(100, 20), head);
        QCOMPARE(m_model->index(0, 0).data().toString(), QLatin1String(first));
    }
    QTest::mouseClick(head, Qt::LeftButton, {}, QPoint(100, 20));
    QCOMPARE(m_model->index(0, 0).data().toString(), QStringLiteral("Folder 039"));
}

void TestTreeView::cancelOnTheHeaderSortsNothing()
{
    m_tree->setSortingEnabled(true);
    QWidget* head = m_tree->header()->viewport();
    QSignalSpy clicked(m_tree->header(), &QHeaderView::sectionClicked);
    QTest::touchEvent(head, m_device).press(0, QPoint(100, 20), head);
    QTouchEvent cancel(QEvent::TouchCancel, m_device);
    QApplication::sendEvent(head, &cancel);
    QCOMPARE(clicked.count(), 0);
    QTest::touchEvent(head, m_device).release(0, QPoint(100, 20), head);
    QTest::touchEvent(head, m_device).press(0, QPoint(100, 20), head);
    QTest::touchEvent(head, m_device).move(0, QPoint(600, 20), head); // off the section
    QTest::touchEvent(head, m_device).release(0, QPoint(600, 20), head);
    QCOMPARE(clicked.count(), 0);
    QCOMPARE(m_tree->header()->sortIndicatorSection(), -1);
}

void TestTreeView::sortKeepsTheCurrentRow()
{
    m_tree->expand(m_model->index(2, 0));
    m_tree->setCurrentIndex(m_model->index(1, 0, m_model->index(2, 0)));
    m_tree->setSortingEnabled(true);
    m_tree->sortByColumn(0, Qt::DescendingOrder);
    QCOMPARE(m_tree->currentIndex().parent().row(), 37);
    QCOMPARE(m_tree->currentIndex().data().toString(), QStringLiteral("Title 1"));
    QVERIFY(m_tree->isExpanded(m_model->index(37, 0)));
}

void TestTreeView::keysDoNotMoveTheSelection()
{
    m_tree->setCurrentIndex(m_model->index(5, 0));
    for (const int key : {Qt::Key_Space, Qt::Key_Home, Qt::Key_End, Qt::Key_Up, Qt::Key_Down, Qt::Key_Left,
                          Qt::Key_Right, Qt::Key_PageUp, Qt::Key_PageDown, Qt::Key_F}) {
        QTest::keyClick(m_tree.get(), static_cast<Qt::Key>(key));
        QCOMPARE(m_tree->currentIndex().row(), 5);
    }
    QVERIFY(!m_tree->isExpanded(m_model->index(5, 0)));
}

void TestTreeView::editorOpensAndCommits()
{
    QSignalSpy initialised(m_tree->treeDelegate(), &CustomTreeDelegete::signalLineEditInitialize);
    QSignalSpy committed(m_tree->treeDelegate(), &CustomTreeDelegete::signalLineEditCommitted);
    const QModelIndex folder = m_model->index(2, 0);
    Q_EMIT m_tree->editorEvent(folder);
    auto* editor = m_tree->findChild<QLineEdit*>();
    QVERIFY(editor != nullptr);
    QCOMPARE(initialised.count(), 1);
    QCOMPARE(m_tree->getRenameIndex(), folder);
    QCOMPARE(editor->text(), QStringLiteral("Folder 002"));
    QVERIFY(m_tree->visualRect(folder).contains(editor->geometry()));
    editor->setText(QStringLiteral("Renamed"));
    m_tree->closeEditorState(editor, QAbstractItemDelegate::NoHint);
    QCOMPARE(folder.data().toString(), QStringLiteral("Renamed"));
    QCOMPARE(committed.count(), 1);
    QCOMPARE(committed.at(0).at(0).toString(), QStringLiteral("Renamed"));
    QVERIFY(!m_tree->getRenameIndex().isValid());
    QTRY_VERIFY(m_tree->findChild<QLineEdit*>() == nullptr);
}

void TestTreeView::editorCanBeReverted()
{
    const QModelIndex folder = m_model->index(2, 0);
    Q_EMIT m_tree->editorEvent(folder);
    auto* editor = m_tree->findChild<QLineEdit*>();
    editor->setText(QStringLiteral("Renamed"));
    m_tree->closeEditorState(editor, QAbstractItemDelegate::RevertModelCache);
    QCOMPARE(folder.data().toString(), QStringLiteral("Folder 002"));
    QVERIFY(!m_tree->getRenameIndex().isValid());
}

void TestTreeView::editorIgnoresRowsThatAreNotEditable()
{
    QTest::ignoreMessage(QtWarningMsg, "edit: editing failed");
    Q_EMIT m_tree->editorEvent(m_model->index(2, 1));
    QVERIFY(m_tree->findChild<QLineEdit*>() == nullptr);
    QVERIFY(!m_tree->getRenameIndex().isValid());
}

void TestTreeView::selfEndingControlSurvivesTheLossOfFocus()
{
    Q_EMIT m_tree->editorEvent(m_model->index(2, 0));
    QPointer<QLineEdit> editor = m_tree->findChild<QLineEdit*>();
    editor->setText(QStringLiteral("Half a na"));
    m_tree->setFocus();
    QTest::keyClick(editor, Qt::Key_Return);
    QTest::keyClick(editor, Qt::Key_Escape);
    QCoreApplication::sendPostedEvents(nullptr, QEvent::DeferredDelete);
    QVERIFY(editor != nullptr);
    QCOMPARE(m_model->index(2, 0).data().toString(), QStringLiteral("Folder 002"));
    m_tree->closeEditorState(editor, QAbstractItemDelegate::NoHint);
}

void TestTreeView::editorKeepsItsTextWhenTheRowChanges()
{
    const QModelIndex folder = m_model->index(2, 0);
    Q_EMIT m_tree->editorEvent(folder);
    auto* editor = m_tree->findChild<QLineEdit*>();
    editor->selectAll();
    QTest::keyClicks(editor, QStringLiteral("typed"));
    m_model->setData(folder, QStringLiteral("from elsewhere"));
    QCOMPARE(editor->text(), QStringLiteral("typed"));
    m_tree->closeEditorState(editor, QAbstractItemDelegate::NoHint);
    QCOMPARE(folder.data().toString(), QStringLiteral("typed"));
}

void TestTreeView::closingAStrangeEditorDoesNothing()
{
    QLineEdit stranger;
    m_tree->closeEditorState(&stranger, QAbstractItemDelegate::NoHint);
    m_tree->closeEditorState(nullptr, QAbstractItemDelegate::NoHint);
    QCOMPARE(m_model->index(0, 0).data().toString(), QStringLiteral("Folder 000"));
}

void TestTreeView::rowVanishesUnderTheEditor()
{
    Q_EMIT m_tree->editorEvent(m_model->index(2, 0));
    QPointer<QLineEdit> editor = m_tree->findChild<QLineEdit*>();
    m_model->removeRow(2);
    QVERIFY(!m_tree->getRenameIndex().isValid());
    if (editor != nullptr) {
        m_tree->closeEditorState(editor, QAbstractItemDelegate::NoHint);
    }
    QCOMPARE(m_model->index(2, 0).data().toString(), QStringLiteral("Folder 003"));
}

void TestTreeView::moveToSibling()
{
    QVERIFY(!m_tree->moveToSibling(m_model->index(2, 0)));
    QVERIFY(m_tree->insertRows(40, 1, QModelIndex()));
    m_tree->setCurrentIndex(m_model->index(40, 0));
    QVERIFY(m_tree->moveToSibling(m_model->index(2, 0)));
    QCOMPARE(m_tree->currentIndex().row(), 3);
    QVERIFY(m_tree->moveToSibling(m_model->index(2, 0)));
    QCOMPARE(m_tree->currentIndex().row(), 3);
    QVERIFY(m_tree->moveToSibling(m_model->index(40, 0)));
    QCOMPARE(m_tree->currentIndex().row(), 40);
    QVERIFY(!m_tree->moveToSibling(m_model->index(0, 0, m_model->index(0, 0))));
    QVERIFY(!m_tree->moveToSibling(QModelIndex()));
}

void TestTreeView::checkBoxesFollowEachOther()
{
    m_source->checkable = true;
    m_model->createDataItems();
    const QModelIndex folder = m_model->index(1, 0);
    const auto state = [](const QModelIndex& index) { return index.data(Qt::CheckStateRole).toInt(); };
    QCOMPARE(m_model->rowCount(folder), 3);
    m_tree->changeCheckState(m_model->index(0, 0, folder));
    QCOMPARE(state(folder), static_cast<int>(Qt::PartiallyChecked));
    QCOMPARE(m_model->getOnOrPartialChildrenNumber(folder), 1);
    m_tree->changeCheckState(m_model->index(1, 0, folder));
    m_tree->changeCheckState(m_model->index(2, 0, folder));
    QCOMPARE(state(folder), static_cast<int>(Qt::Checked));
    m_tree->changeCheckState(folder);
    QCOMPARE(state(m_model->index(2, 0, folder)), static_cast<int>(Qt::Unchecked));
    QCOMPARE(m_model->getOnOrPartialChildrenNumber(folder), 0);
    m_tree->changeCheckState(folder);
    QCOMPARE(state(m_model->index(0, 0, folder)), static_cast<int>(Qt::Checked));
    QCOMPARE(m_model->getOnOrPartialChildrenNumber(folder), 3);
    m_model->setData(folder, false, KSVIEW::ItemEnableRole);
    m_tree->changeCheckState(folder);
    QCOMPARE(state(folder), static_cast<int>(Qt::Checked));
    m_tree->changeCheckState(QModelIndex());
}

void TestTreeView::checkedFolderChecksChildrenMadeLater()
{
    m_source->checkable = true;
    m_model->createDataItems();
    const QModelIndex folder = m_model->index(1, 0);
    m_tree->changeCheckState(folder);
    QVERIFY(!m_model->areChildrenMade(folder));
    QCOMPARE(m_model->index(2, 0, folder).data(Qt::CheckStateRole).toInt(), static_cast<int>(Qt::Checked));
}

void TestTreeView::checkBoxUnderTheFinger()
{
    m_source->checkable = true;
    m_model->createDataItems();
    const QModelIndex folder = m_model->index(1, 0);
    const QPoint box = m_tree->getCheckBoxRect(folder).center();
    QVERIFY(m_tree->getCheckBoxRectForTouch(folder).contains(m_tree->getCheckBoxRect(folder)));
    QCOMPARE(m_tree->getCheckBoxImageType(folder), KSTreeView::OffRest);
    QTest::touchEvent(m_area, m_device).press(0, box, m_area);
    QCOMPARE(m_tree->getCheckBoxImageType(folder), KSTreeView::OffPressed);
    QTest::touchEvent(m_area, m_device).release(0, box, m_area);
    QCOMPARE(m_tree->getCheckBoxImageType(folder), KSTreeView::OnRest);
    QVERIFY(!m_tree->currentIndex().isValid());
    QTest::touchEvent(m_area, m_device).press(0, box, m_area);
    QTest::touchEvent(m_area, m_device).move(0, box + QPoint(60, 0), m_area);
    QCOMPARE(m_tree->getCheckBoxImageType(folder), KSTreeView::OnRest);
    QTest::touchEvent(m_area, m_device).release(0, box, m_area);
    QCOMPARE(m_tree->getCheckBoxImageType(folder), KSTreeView::OnRest);
    m_tree->setCheckBoxVisible(false);
    QVERIFY(m_tree->getCheckBoxRect(folder).isNull());
    QVERIFY(m_tree->getCheckBoxRectForTouch(folder).isNull());
}

void TestTreeView::loadingMarksStep()
{
    QCOMPARE(m_tree->getLoadingImagePath(1), QStringLiteral(":/Views/Loading_Icon-01"));
    QCOMPARE(m_tree->getLoadingImagePath(8), QStringLiteral(":/Views/Loading_Icon-08"));
    QCOMPARE(m_tree->getLoadingImagePath(9), QStringLiteral(":/Views/Loading_Icon-01"));
    QCOMPARE(m_tree->getLoadingImagePath(0), QStringLiteral(":/Views/Loading_Icon-08"));
    const QModelIndex folder = m_model->index(1, 0);
    m_model->setData(folder, 8, KSVIEW::ItemLoadingRole);
    m_tree->slotUpdateLoadingIcon();
    QCOMPARE(folder.data(KSVIEW::ItemLoadingRole).toInt(), 1);
    QTRY_COMPARE(folder.data(KSVIEW::ItemLoadingRole).toInt(), 3); // by its own timer
    m_tree->clearAllLoadingState();
    QCOMPARE(folder.data(KSVIEW::ItemLoadingRole).toInt(), 0);
    m_tree->slotUpdateLoadingIcon();
    QCOMPARE(folder.data(KSVIEW::ItemLoadingRole).toInt(), 0);
}

void TestTreeView::recordingMarks()
{
    const QModelIndex folder = m_model->index(1, 0);
    const QRect cell = m_tree->visualRect(folder);
    QVERIFY(m_tree->getLayoutForFirstColumn(cell, folder).mark.isNull());
    m_model->setData(folder, true, KSVIEW::ItemRecordingRole);
    const auto layout = m_tree->getLayoutForFirstColumn(cell, folder);
    QVERIFY(cell.contains(layout.mark));
    QVERIFY(!layout.mark.intersects(layout.text));
    m_tree->clearRecording();
    QVERIFY(!m_model->isRecording(folder));
}

void TestTreeView::heldLongNameShowsABalloon()
{
    const QModelIndex folder = m_model->index(1, 0);
    QVERIFY(!m_tree->isTextElide(folder));
    m_model->setData(folder, QString(120, QLatin1Char('W')));
    QVERIFY(m_tree->isTextElide(folder));
    m_tree->setHoldInterval(30);
    QTest::touchEvent(m_area, m_device).press(0, rowPoint(1), m_area);
    QTRY_VERIFY(KSToolTip::isVisible());
    QTest::touchEvent(m_area, m_device).move(0, rowPoint(1) + QPoint(0, -4), m_area);
    QTest::touchEvent(m_area, m_device).move(0, rowPoint(1) + QPoint(0, -40), m_area);
    QVERIFY(!KSToolTip::isVisible());
    QTest::touchEvent(m_area, m_device).release(0, rowPoint(1) + QPoint(0, -40), m_area);
    KSToolTip::clearInstance();
}

void TestTreeView::designAttributes()
{
    for (int role = 0; role < KSVIEW::DesignAttributeCount; ++role) {
        const auto design = static_cast<KSVIEW::enumDesignAttributeRole>(role);
        QVERIFY(m_tree->getDesignAttribute(design).isValid());
    }
    QVERIFY(!m_tree->getDesignAttribute(KSVIEW::DesignAttributeCount).isValid());
    m_tree->setDesignAttribute(KSVIEW::DesignRowHeight, 60);
    QCOMPARE(m_tree->getDesignAttribute(KSVIEW::DesignRowHeight).toInt(), 60);
    QTRY_COMPARE(m_tree->visualRect(m_model->index(2, 0)).height(), 60);
    m_model->setData(m_model->index(2, 0), 90, KSVIEW::ItemHeightRole);
    m_tree->doItemsLayout();
    QCOMPARE(m_tree->visualRect(m_model->index(2, 0)).height(), 90);
}

void TestTreeView::scrollBarsAreOurs()
{
    QVERIFY(qobject_cast<KSScrollBar*>(m_tree->verticalScrollBar()) != nullptr);
    QVERIFY(qobject_cast<KSScrollBar*>(m_tree->horizontalScrollBar()) != nullptr);
    QVERIFY(m_tree->verticalScrollBar()->isVisible());
    QCOMPARE(m_tree->verticalScrollBar()->width(), 32);
    QVERIFY(qobject_cast<KSTreeHeaderView*>(m_tree->header()) != nullptr);
    m_model->removeRows(3, 37);
    QTRY_VERIFY(!m_tree->verticalScrollBar()->isVisible());
}

void TestTreeView::paintsRowsToTheBottom()
{
    m_model->removeRows(2, 38);
    QTRY_COMPARE(m_tree->getEmptyArea(), QRect(0, 2 * ROW, m_area->width(), m_area->height() - 2 * ROW));
    const QImage image = m_area->grab().toImage();
    const int x = image.width() - 5;
    // The rule under each row, drawn or empty, and the plain ground between.
    for (int row = 0; row < 6; ++row) {
        QVERIFY(image.pixelColor(x, row * ROW + ROW - 1) != BACKGROUND ||
                image.pixelColor(x, row * ROW + ROW - 2) != BACKGROUND);
        QCOMPARE(image.pixelColor(x, row * ROW + 10), BACKGROUND);
    }
    m_model->removeRows(0, 2);
    QCOMPARE(m_tree->getEmptyArea(), m_area->rect());
}

void TestTreeView::paintsSelectionOverTheWholeRow()
{
    m_tree->setCurrentIndex(m_model->index(2, 0));
    const QImage image = m_area->grab().toImage();
    for (const int x : {2, m_area->width() / 2, m_area->width() - 3}) {
        const QColor color = image.pixelColor(x, 2 * ROW + 6);
        QVERIFY2(color.blue() > 150 && color.red() < 70, qPrintable(color.name()));
        QCOMPARE(image.pixelColor(x, 3 * ROW + 6), BACKGROUND);
    }
}

void TestTreeView::paintsUnderAWindowStyleSheet()
{
    const QImage plain = shot();
    m_tree->setStyleSheet(QStringLiteral(" * {font-family:'KST';}"));
    QApplication::processEvents();
    const QImage styled = shot();
    // The rule under the header and the rows, the header's ground, the folder icon.
    for (const QPoint& point : {QPoint(790, 20), QPoint(700, 44 + ROW - 1), QPoint(54, 44 + ROW / 2)}) {
        QCOMPARE(styled.pixelColor(point), plain.pixelColor(point));
    }
}

void TestTreeView::operationFocusSurroundsTheEditedRow()
{
    Q_EMIT m_tree->editorEvent(m_model->index(2, 0));
    QImage image = m_area->grab().toImage();
    QCOMPARE(image.pixelColor(1, 2 * ROW + 1), QColor(0, 186, 230));
    m_tree->closeEditorState(m_tree->findChild<QLineEdit*>(), QAbstractItemDelegate::NoHint);
    image = m_area->grab().toImage();
    QVERIFY(image.pixelColor(1, 2 * ROW + 1) != QColor(0, 186, 230));
}

QTEST_MAIN(TestTreeView)
#include "tst_treeview.moc"
