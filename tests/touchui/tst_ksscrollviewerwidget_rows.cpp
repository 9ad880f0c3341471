// Rows of a list whose widgets are made when they come into view, and taken away again.
#include "ScrollViewerFixture.h"
#include "tests/support/Patience.h"

#include "TouchDevice.h"

#include <QSignalSpy>

#include <vector>

using Names = QStringList;

namespace
{

// A row that makes a named widget and counts how often.
class NamedRow : public ScrollViewerRow
{
public:
    NamedRow(const QString& name, QStringList& made) : m_name(name), m_made(made) {}
    QSize size() const override { return QSize(ScrollViewerFixture::WIDTH, 100); }
    KSBaseItemWidget* makeWidget() override
    {
        m_made.append(m_name);
        return new Row(m_name);
    }

private:
    QString m_name;
    QStringList& m_made;
};

} // namespace

class tst_ksscrollviewerwidget_rows : public QObject
{
    Q_OBJECT
private Q_SLOTS:
    void initTestCase();
    void init();
    void cleanup();

    void onlyWhatIsInViewIsMade();
    void scrollingMakesTheNext();
    void askedForIsMadeInItsPlace();
    void tapOnALateRow();
    void rowsAmongItems();
    void givenBackAndMadeAnew();
    void whatIsNotGivenBack();
    void removedAboveTheView();
    void removedInAndBelowTheView();
    void allRemoved();
    void lateRowsCanBeDragged();
    void carriedPastRowsThatAreNotMade();
    void heightThatDiffersFromThePromise();

private:
    static constexpr int ROW = ScrollViewerFixture::ROW;

    void addRows(int count, int index = -1)
    {
        std::vector<std::unique_ptr<ScrollViewerRow>> rows;
        for (int i = 0; i < count; ++i)
            rows.push_back(std::make_unique<NamedRow>(QString::number(i), m_made));
        m->m_list->addRows(std::move(rows), index);
    }
    QString firstName() { return m->m_list->getWidgetItem(m->m_list->firstVisibleItem())->objectName(); }

    TouchDevice m_device;
    QStringList m_made;
    std::unique_ptr<ScrollViewerFixture> m;
};

void tst_ksscrollviewerwidget_rows::initTestCase()
{
    Q_INIT_RESOURCE(UILibrary);
}

void tst_ksscrollviewerwidget_rows::init()
{
    m = std::make_unique<ScrollViewerFixture>(m_device);
    m_made.clear();
}

void tst_ksscrollviewerwidget_rows::cleanup()
{
    m.reset();
}

void tst_ksscrollviewerwidget_rows::onlyWhatIsInViewIsMade()
{
    addRows(10000);
    QCOMPARE(m->m_list->count(), 10000);
    QCOMPARE(m->maximum(), 10000 * ROW - 4 - ScrollViewerFixture::HEIGHT);
    QCOMPARE(m_made, (Names{"0", "1", "2", "3", "4"}));
    QCOMPARE(m->m_list->findChildren<Row*>().size(), 5);
    QVERIFY(m->m_list->madeWidgetItem(4)->isVisible());
    QVERIFY(!m->m_list->madeWidgetItem(5));
    QVERIFY(m->m_list->row(5));
    QVERIFY(!m->m_list->row(10000));
    QVERIFY(!m->m_list->madeWidgetItem(-1));
}

void tst_ksscrollviewerwidget_rows::scrollingMakesTheNext()
{
    addRows(10000);
    m->m_list->slotSetScrollBarValue(10);
    QCOMPARE(m_made.size(), 5);
    m->m_list->slotSetScrollBarValue(ROW);
    QCOMPARE(m_made.size(), 6);
    m_made.clear();
    m->m_list->moveToWidgetItem(5000);
    QCOMPARE(m_made, (Names{"5000", "5001", "5002", "5003", "5004"}));
    QCOMPARE(m->value(), 5000 * ROW);
    QCOMPARE(m->m_list->madeWidgetItem(5000)->mapTo(m->m_list, QPoint()), QPoint(38, 0));
    m->m_list->setLastVisibleItem(9999);
    QCOMPARE(m->value(), m->maximum());
    QCOMPARE(m_made.constLast(), QStringLiteral("9999"));
}

void tst_ksscrollviewerwidget_rows::askedForIsMadeInItsPlace()
{
    addRows(1000);
    KSBaseItemWidget* item = m->m_list->getWidgetItem(700);
    QCOMPARE(item->objectName(), QStringLiteral("700"));
    QCOMPARE(item->y(), 700 * ROW);
    QCOMPARE(item->width(), ScrollViewerFixture::WIDTH - 38);
    QCOMPARE(m->m_list->getIndexOfWidgetItem(item), 700);
    QCOMPARE(m->m_list->getWidgetItem(700), item);
    QCOMPARE(m_made.count(QStringLiteral("700")), 1);
    QCOMPARE(m->m_list->getWidgetItems(500, 3).size(), 3);
    QCOMPARE(m_made.mid(6), (Names{"500", "501", "502"}));
}

void tst_ksscrollviewerwidget_rows::tapOnALateRow()
{
    addRows(1000);
    m->m_list->moveToWidgetItem(600);
    m->tap(100, 150);
    QCOMPARE(m->takeLog(), (Names{"pressed 601", "released 601", "clicked 601"}));
}

void tst_ksscrollviewerwidget_rows::rowsAmongItems()
{
    m->fill(2);
    addRows(1000, 1);
    QCOMPARE(m->m_list->count(), 1002);
    QCOMPARE(m->m_list->getWidgetItem(1)->objectName(), QStringLiteral("0"));
    QCOMPARE(m->m_list->getWidgetItem(1001)->objectName(), QStringLiteral("1"));
    QCOMPARE(m->m_list->getWidgetItem(1001)->y(), 1001 * ROW);
    m->m_list->removeWidgetItems(0, 1001);
    QCOMPARE(m->order(), Names{"1"});
}

void tst_ksscrollviewerwidget_rows::givenBackAndMadeAnew()
{
    addRows(1000);
    const QPointer<KSBaseItemWidget> before = m->m_list->getWidgetItem(2);
    m->m_list->moveToWidgetItem(500);
    QVERIFY(m->m_list->giveBackWidgetItem(before));
    QVERIFY(before->isHidden());
    QCOMPARE(m->m_list->getIndexOfWidgetItem(before), -1);
    delete before;
    QCOMPARE(m->m_list->count(), 1000);
    QCOMPARE(m->maximum(), 1000 * ROW - 4 - ScrollViewerFixture::HEIGHT);
    m->m_list->moveToWidgetItem(0);
    QCOMPARE(m_made.count(QStringLiteral("2")), 2);
    QVERIFY(m->m_list->getWidgetItem(2)->isVisible());
    QCOMPARE(m->m_list->getWidgetItem(2)->y(), 2 * ROW);
    m->tap(100, 2 * ROW + 50);
    QCOMPARE(m->takeLog(), (Names{"pressed 2", "released 2", "clicked 2"}));
}

void tst_ksscrollviewerwidget_rows::whatIsNotGivenBack()
{
    addRows(1000);
    m->fill(1);
    QVERIFY(!m->m_list->giveBackWidgetItem(nullptr));
    QVERIFY(!m->m_list->giveBackWidgetItem(m->m_list->getWidgetItem(0)));    // in view
    QVERIFY(!m->m_list->giveBackWidgetItem(m->m_list->getWidgetItem(1000))); // nothing could make it again
    m->press(100, 50);
    KSBaseItemWidget* pressed = m->m_list->getWidgetItem(0);
    m->m_list->moveToWidgetItem(500);
    QVERIFY(!m->m_list->giveBackWidgetItem(pressed));
    m->release(100, 50);
}

void tst_ksscrollviewerwidget_rows::removedAboveTheView()
{
    addRows(1000);
    m->m_list->slotSetScrollBarValue(500 * ROW + 30);
    QCOMPARE(firstName(), QStringLiteral("500"));
    m->m_list->removeRows({0, 1, 7, 300, 499});
    QCOMPARE(m->m_list->count(), 995);
    QCOMPARE(firstName(), QStringLiteral("500"));
    QCOMPARE(m->value(), 495 * ROW + 30);
    QCOMPARE(m->m_list->getWidgetItem(0)->objectName(), QStringLiteral("2"));
}

void tst_ksscrollviewerwidget_rows::removedInAndBelowTheView()
{
    addRows(1000);
    m->m_list->slotSetScrollBarValue(500 * ROW);
    const QPointer<KSBaseItemWidget> gone = m->m_list->getWidgetItem(502);
    m->m_list->removeRows({502, 900, 999});
    QVERIFY(gone->isHidden());
    QCOMPARE(m->value(), 500 * ROW);
    QCOMPARE(m->m_list->getWidgetItem(502)->objectName(), QStringLiteral("503"));
    QVERIFY(m->m_list->madeWidgetItem(504)); // came into view
    QCOMPARE(m->maximum(), 997 * ROW - 4 - ScrollViewerFixture::HEIGHT);
}

void tst_ksscrollviewerwidget_rows::allRemoved()
{
    addRows(1000);
    m->m_list->moveToWidgetItem(500);
    const QList<Row*> made = m->m_list->findChildren<Row*>();
    m->m_list->removeAll();
    QVERIFY(m->m_list->isEmpty());
    QCOMPARE(m->maximum(), 0);
    for (const Row* item : made)
        QVERIFY(item->isHidden());
    QCOMPARE(m_made.size(), 10);
}

void tst_ksscrollviewerwidget_rows::lateRowsCanBeDragged()
{
    m->m_list->setItemsDragFlagAlignment(DRAGFLAG_LEFT);
    addRows(1000);
    m->m_list->slotItemsCanDrag(true);
    m->m_list->moveToWidgetItem(400);
    QVERIFY(m->m_list->getWidgetItem(402)->hasDragFlag());
    QCOMPARE(m->m_list->getWidgetItem(402)->getDragFlagAlignment(), DRAGFLAG_LEFT);
    m->m_list->slotItemsCanDrag(false);
    m->m_list->moveToWidgetItem(600);
    QVERIFY(!m->m_list->getWidgetItem(602)->hasDragFlag());
}

void tst_ksscrollviewerwidget_rows::carriedPastRowsThatAreNotMade()
{
    m->m_list->setItemsDragFlagAlignment(DRAGFLAG_LEFT);
    addRows(40);
    m->m_list->slotItemsCanDrag(true);
    QSignalSpy dropped(m->m_list, &KSScrollViewerWidget::signalItemDrop);
    m->press(50, 50);
    m->clock.advance(50);
    QVERIFY(m->m_list->isDragging());
    m->move(50, 200);
    m->move(50, 495); // over the lower edge
    m->clock.advance(200 * 40);
    QCOMPARE(m->value(), m->maximum());
    m->release(50, 495);
    QCOMPARE(dropped.count(), 1);
    QCOMPARE(m->m_list->count(), 40);
    QCOMPARE(m->m_list->getWidgetItem(39)->objectName(), QStringLiteral("0"));
    QCOMPARE(m->m_list->getWidgetItem(0)->objectName(), QStringLiteral("1"));
    QCOMPARE(m->m_list->getWidgetItem(39)->y(), 39 * ROW);
}

void tst_ksscrollviewerwidget_rows::heightThatDiffersFromThePromise()
{
    class TallRow : public ScrollViewerRow
    {
    public:
        QSize size() const override { return QSize(10, 60); }
        KSBaseItemWidget* makeWidget() override { return new Row(QStringLiteral("tall")); }
    };
    std::vector<std::unique_ptr<ScrollViewerRow>> rows;
    rows.push_back(std::make_unique<TallRow>());
    m->m_list->addRows(std::move(rows), -1);
    m->fill(1);
    QCOMPARE(m->m_list->getWidgetItem(0)->height(), 100);
    QTRY_COMPARE(m->m_list->getWidgetItem(1)->y(), ROW);
}

QTEST_MAIN(tst_ksscrollviewerwidget_rows)
#include "tst_ksscrollviewerwidget_rows.moc"
