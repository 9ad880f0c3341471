// Pages of scroll bars, the list of items and the tree.
#include "gallery/GalleryPages.h"

#include "gallery/SampleTree.h"
#include "touchui/KSBaseItemWidget.h"
#include "touchui/KSScrollBar.h"
#include "touchui/KSScrollViewerWidget.h"
#include "touchui/KSTreeModel.h"
#include "touchui/KSTreeView.h"

#include <QHeaderView>
#include <QLabel>

namespace
{

const QSize PAGE(960, 640);
constexpr int ITEM_WIDTH = 320;
constexpr int ITEM_HEIGHT = 90;

// A list item that shows its name.
class NamedItem : public KSBaseItemWidget
{
public:
    explicit NamedItem(const QString& name)
    {
        setObjectName(name);
        setFixedSize(ITEM_WIDTH, ITEM_HEIGHT);
        auto* label = new QLabel(name);
        label->setStyleSheet(
            QStringLiteral("background: transparent; color: rgb(220, 220, 220); font-size: 24px;"));
        label->setAlignment(Qt::AlignCenter);
        setChild(label, CHILD_WHOLE);
        createWidget();
    }
    KSBaseItemWidget* clone() override { return new NamedItem(objectName()); }
};

KSScrollViewerWidget* viewer(const GalleryPage& page, const QPoint& place, int items)
{
    auto* list = new KSScrollViewerWidget(page.window.get());
    list->setSize(32 + 6 + ITEM_WIDTH, 560);
    list->move(place);
    QList<KSBaseItemWidget*> rows;
    for (int i = 1; i <= items; ++i)
        rows.append(new NamedItem(QStringLiteral("Title %1").arg(i)));
    list->addWidgetItems(&rows, -1);
    list->setHEffectiveArea(0, 32 + 6 + ITEM_WIDTH);
    QObject::connect(
        list, &KSScrollViewerWidget::signalFlick, list,
        [](KSBaseItemWidget*, QPoint, KSScrollViewerWidget*, bool& willFlick) { willFlick = true; });
    return list;
}

KSScrollBar* scrollBar(const GalleryPage& page, Qt::Orientation orientation, const QRect& place, int maximum)
{
    auto* bar = new KSScrollBar(orientation, page.window.get());
    bar->setGeometry(place);
    bar->setRange(0, maximum);
    bar->setPageStep(100);
    bar->setValue(maximum / 3);
    return bar;
}

} // namespace

GalleryPage GalleryPages::scrollBars()
{
    GalleryPage page(QStringLiteral("scrollbars"), PAGE);
    page.caption(QPoint(20, 12), QStringLiteral("at rest, held, long, short, nothing to scroll"));
    scrollBar(page, Qt::Vertical, QRect(20, 50, 32, 400), 200);
    KSScrollBar* upright = scrollBar(page, Qt::Vertical, QRect(90, 50, 32, 400), 200);
    scrollBar(page, Qt::Vertical, QRect(160, 50, 32, 400), 20);
    scrollBar(page, Qt::Vertical, QRect(230, 50, 32, 400), 20000);
    scrollBar(page, Qt::Vertical, QRect(300, 50, 32, 400), 0);
    scrollBar(page, Qt::Horizontal, QRect(400, 60, 500, 32), 200);
    KSScrollBar* flat = scrollBar(page, Qt::Horizontal, QRect(400, 130, 500, 32), 200);
    scrollBar(page, Qt::Horizontal, QRect(400, 200, 500, 32), 20);
    scrollBar(page, Qt::Horizontal, QRect(400, 270, 500, 32), 20000);
    page.pose = [upright, flat](Fingers& fingers) {
        fingers.pressWidget(0, upright, upright->handleRect().center());
        fingers.pressWidget(1, flat, flat->handleRect().center());
    };
    return page;
}

GalleryPage GalleryPages::scrollViewer()
{
    GalleryPage page(QStringLiteral("viewer"), PAGE);
    page.caption(QPoint(20, 12), QStringLiteral("one selected, one lifted look"));
    KSScrollViewerWidget* plain = viewer(page, QPoint(20, 40), 20);
    plain->getWidgetItem(1)->setSelectedStyle();
    plain->getWidgetItem(3)->setPopup(true);
    page.caption(QPoint(500, 12), QStringLiteral("to be rearranged, bar at the right"));
    KSScrollViewerWidget* movable = viewer(page, QPoint(500, 40), 20);
    movable->setVScrollBarAlignment(Qt::AlignRight);
    movable->setItemsDragFlagAlignment(DRAGFLAG_RIGHT);
    for (int i = 0; i < movable->count(); ++i)
        movable->getWidgetItem(i)->setDragFlagAlignment(DRAGFLAG_RIGHT);
    movable->slotItemsCanDrag(true);
    page.pose = [plain, movable](Fingers&) {
        plain->moveToWidgetItem(0);
        movable->moveToWidgetItem(5);
    };
    return page;
}

GalleryPage GalleryPages::liftedItem()
{
    GalleryPage page(QStringLiteral("viewer_lifted"), PAGE);
    page.caption(QPoint(20, 12), QStringLiteral("an item under the finger, and the gap where it would drop"));
    KSScrollViewerWidget* list = viewer(page, QPoint(20, 40), 20);
    list->setItemsDragFlagAlignment(DRAGFLAG_RIGHT);
    for (int i = 0; i < list->count(); ++i)
        list->getWidgetItem(i)->setDragFlagAlignment(DRAGFLAG_RIGHT);
    list->slotItemsCanDrag(true);
    page.caption(QPoint(500, 12), QStringLiteral("empty, and nothing to scroll"));
    viewer(page, QPoint(500, 40), 0)->setSize(32 + 6 + ITEM_WIDTH, 200);
    viewer(page, QPoint(500, 300), 2)->setSize(32 + 6 + ITEM_WIDTH, 300);
    page.pose = [list](Fingers& fingers) {
        KSBaseItemWidget* item = list->getWidgetItem(1);
        fingers.pressWidget(0, item, item->getDragArea().center());
        list->slotShowPopupItem(); // as when the time of the long press has passed
        fingers.move(0, fingers.position(0) + QPoint(0, 150));
    };
    return page;
}

GalleryPage GalleryPages::tree()
{
    GalleryPage page(QStringLiteral("tree"), PAGE);
    const auto makeTree = [&page](const QRect& place, bool checkBoxes) {
        auto* view = new KSTreeView(page.window.get());
        view->setGeometry(place);
        auto* source = new SampleTree(view);
        auto* model = new KSTreeModel(source, 2, view);
        model->setHeaderData(0, Qt::Horizontal, QStringLiteral("Name"));
        model->setHeaderData(1, Qt::Horizontal, QStringLiteral("Date"));
        model->createDataItems();
        view->setModel(model);
        view->setCheckBoxVisible(checkBoxes);
        view->setColumnWidth(0, place.width() * 3 / 5);
        return view;
    };
    KSTreeView* checked = makeTree(QRect(20, 20, 520, 600), true);
    KSTreeView* folded = makeTree(QRect(580, 20, 360, 600), false);
    page.pose = [checked, folded](Fingers&) {
        QAbstractItemModel* model = checked->model();
        checked->expand(model->index(0, 0));
        checked->expand(model->index(1, 0));
        checked->changeCheckState(model->index(0, 0, model->index(0, 0)));
        checked->changeCheckState(model->index(1, 0));
        checked->setCurrentIndex(model->index(1, 0, model->index(0, 0)));
        folded->sortByColumn(0, Qt::DescendingOrder);
        folded->setCurrentIndex(folded->model()->index(1, 0));
    };
    return page;
}
