#include "library/ArchiveList.h"

#include "canvas/SaveOutage.h"
#include "document/Archive.h"
#include "document/ArchiveController.h"
#include "document/ArchiveOrder.h"
#include "document/FolderOrder.h"
#include "document/FolderTitles.h"
#include "library/ArchiveCheckThread.h"
#include "library/ArchiveInitThread.h"
#include "library/ArchiveItem.h"
#include "library/ArchiveMenu.h"
#include "library/ArchiveRow.h"
#include "library/FocusArchiveCommand.h"
#include "library/ITitlerFolderReporter.h"
#include "library/ListMessages.h"
#include "support/ConfinedPath.h"
#include "support/FolderLookup.h"
#include "support/IPathManagerEx.h"
#include "support/LeftoverSweep.h"
#include "support/LogManager.h"

#include <QCoreApplication>
#include <QDir>
#include <QEvent>
#include <QFile>
#include <QFileInfo>
#include <QLabel>
#include <algorithm>
#include <string>
#include <unordered_set>
#include <utility>
#include <vector>

namespace
{

const int ITEMS_IN_VIEW = 6; // before the list scrolls to the selection
const int MOST_ITEMS = 120;  // more than an operator's folder has titles
const int ITEMS_KEPT = 60;   // when there are more than that: a few screens on both sides of the view
// Titles that are read before the list shows: as many as an operator can make.
constexpr std::size_t AT_ONCE = ListMessages::TITLE_LIMIT;
const int EFFECTIVE_LEFT = 38;  // the scroll bar lies before it
const int LOADER_POLL = 1;      // ms
const int LABEL_FONT_SIZE = 13; // points

// What a killed process left half-written in the title folders goes before anything is read from them.
void sweepTitleFolders()
{
    const std::string root = FolderLookup::multiByte(&IPathManagerEx::getTitleResourcesPath);
    if (!root.empty())
        LeftoverSweep::sweepWithChildren(root);
}

} // namespace

ArchiveList::ArchiveList(QLabel* folderLabel, bool autoInit, QWidget* parent)
    : KSScrollViewerWidget(parent)
    , mController(std::make_unique<ArchiveController>())
    , mFiles(*mController)
    , mItems(this)
    , mFolderLabel(folderLabel)
    , mMenuFont(QStringLiteral("KST"))
{
    mMenuFont.setPixelSize(MENU_FONT_SIZE);
    setScrollBarAutoShow(true);
    setItemsDragFlagAlignment(DRAGFLAG_RIGHT);
    setHEffectiveArea(EFFECTIVE_LEFT, ArchiveItem::WIDGET_WIDTH);
    if (mFolderLabel) {
        QFont font = mFolderLabel->font();
        font.setPointSize(LABEL_FONT_SIZE);
        mFolderLabel->setFont(font);
        mFolderLabel->setTextFormat(Qt::PlainText);
        mFolderLabel->setText(tr("Folder"));
    }
    initArchiveListConnect();
    SaveOutage::instance(); // from here on the order may be saved
    sweepTitleFolders();
    mController->reCreateOrderXml();
    if (autoInit)
        initArchiveList();
}

ArchiveList::~ArchiveList()
{
    endInitThread();
    clearOldArchiveList();
}

void ArchiveList::initArchiveListConnect()
{
    connect(this, &KSScrollViewerWidget::widgetItemPressed, this, [this] { mLongHold = false; });
    connect(this, &KSScrollViewerWidget::widgetItemReleased, this, &ArchiveList::itemReleasedEvent);
    connect(this, &KSScrollViewerWidget::widgetItemLongHold, this, &ArchiveList::itemLongHoldEvent);
    connect(this, &KSScrollViewerWidget::widgetItemPressedAndHold, this,
            &ArchiveList::itemPressedAndHoldEvent);
    connect(this, &KSScrollViewerWidget::widgetItemRightPressed, this, &ArchiveList::itemRightPressedEvent);
    connect(this, &KSScrollViewerWidget::signalFlick, this, &ArchiveList::itemFlickEvent);
    connect(this, &KSScrollViewerWidget::signalDragOneItem, this, &ArchiveList::slotDragOneItem);
    connect(this, &KSScrollViewerWidget::signalItemDrop, this, &ArchiveList::slotItemDrop);
    connect(this, &ArchiveList::signalStartMove, this, &KSScrollViewerWidget::slotStartDrag);
    connect(this, &ArchiveList::signalItemsCanDrag, this, &KSScrollViewerWidget::slotItemsCanDrag);
    connect(this, &KSScrollViewerWidget::signalVisibleItemsChange, this, [this] {
        if (mItems.all().size() > MOST_ITEMS && !std::exchange(mGiveBackRequested, true))
            QMetaObject::invokeMethod(this, &ArchiveList::giveBackItems, Qt::QueuedConnection);
    });
    connect(this, &ArchiveList::signalAddArchiveData, this, &ArchiveList::slotAddArchiveData,
            Qt::QueuedConnection);
    connect(this, &ArchiveList::signalAddOneArchiveData, this, &ArchiveList::slotAddOneArchiveData,
            Qt::QueuedConnection);
}

void ArchiveList::initArchiveList()
{
    const QString last = mController->getLastFolderPath();
    const auto folders = mController->getFolderList();
    if (!last.isEmpty() && QDir(last).exists() &&
        ConfinedPath::isBelow(&IPathManagerEx::getTitleResourcesPath, last.toStdString()))
        mCurrentPath = last;
    else if (!folders.isEmpty())
        mCurrentPath = QString::fromStdString(folders.front());

    ITitlerFolderReporter* reporter = ITitlerFolderReporter::instance();
    if (reporter && !mCurrentPath.isEmpty())
        reporter->editFolderStartStatus(mCurrentPath);
    LOG_DEBUG_OPERATE(L"ArchiveList", 200,
                      L"ArchiveList_initArchiveList() Path:" + mCurrentPath.toStdWString());
    initArchiveListData();
}

void ArchiveList::initArchiveListData()
{
    if (mCurrentPath.isEmpty())
        return;
    setFolderLabel();
    endInitThread();
    prepareOrder();
    mInitThread = std::make_unique<ArchiveInitThread>(mCurrentPath);
    connect(mInitThread.get(), &ArchiveInitThread::threadGetArchiveListFinished, this,
            &ArchiveList::getArchiveListSuccessed, Qt::BlockingQueuedConnection);
    mInitThread->start(QThread::InheritPriority);
}

// The loader may be waiting for this thread to take its titles: they are let in and thrown away.
void ArchiveList::endInitThread()
{
    if (!mInitThread)
        return;
    mInitThread->cancel();
    mIgnoreLoaded = true;
    while (!mInitThread->wait(LOADER_POLL))
        QCoreApplication::sendPostedEvents(this, QEvent::MetaCall);
    mIgnoreLoaded = false;
    mInitThread.reset();
}

void ArchiveList::getArchiveListSuccessed(QList<Archive*> archivesList)
{
    if (mIgnoreLoaded) {
        qDeleteAll(archivesList);
        return;
    }
    clearOldArchiveList();
    std::vector<std::unique_ptr<ScrollViewerRow>> rows;
    for (Archive* archive : archivesList)
        rows.push_back(std::make_unique<ArchiveRow>(*this, std::unique_ptr<Archive>(archive)));
    addRows(std::move(rows), -1);
    if (isEmpty())
        Q_EMIT startTemplatePicker();
    else
        selectArchive(0);
}

ArchiveItem* ArchiveList::createBaseItem(Archive* archive)
{
    return mItems.make(archive);
}

ArchiveItem* ArchiveList::createPasteUndoItem(Archive* archive, ArchiveItem* item)
{
    if (!item)
        item = createBaseItem(archive);
    item->initArchiveItemChildWidget();
    return item;
}

void ArchiveList::initArchiveListRefreshData()
{
    setFolderLabel();
    prepareOrder();
    readFolder();
    if (ITitlerFolderReporter* reporter = ITitlerFolderReporter::instance())
        reporter->editFolderStartStatus(mCurrentPath);
}

// Which rows are titles depends on their files. Those of a long folder are checked by and by; one title at
// least is known.
void ArchiveList::readFolder()
{
    const auto titles =
        std::make_shared<const FolderTitles>(mCurrentPath.toStdString(), FolderTitles::WithoutOrder::ByName);
    std::vector<std::unique_ptr<ScrollViewerRow>> rows;
    rows.reserve(titles->count());
    std::size_t next = 0;
    while (rows.empty() && next < titles->count()) {
        const std::size_t end = std::min(next + AT_ONCE, titles->count());
        for (std::unique_ptr<Archive>& record : titles->read(next, end - next)) {
            if (record)
                rows.push_back(std::make_unique<ArchiveRow>(*this, titles, next, std::move(record)));
            ++next;
        }
    }
    mReadAtOnce = static_cast<int>(rows.size());
    for (std::size_t number = next; number < titles->count(); ++number)
        rows.push_back(std::make_unique<ArchiveRow>(*this, titles, number, nullptr));
    addRows(std::move(rows), -1);
    if (next == titles->count())
        return;
    mCheck = std::make_unique<ArchiveCheckThread>(titles, next);
    connect(mCheck.get(), &ArchiveCheckThread::unreadableFound, this, &ArchiveList::removeUnreadable,
            Qt::QueuedConnection);
}

void ArchiveList::finishCheck()
{
    if (!mCheck)
        return;
    mCheck->begin();
    mCheck->wait();
    removeUnreadable();
    mCheck.reset();
}

// A title that is shown has been read.
void ArchiveList::removeUnreadable()
{
    const QSet<std::size_t> found = mCheck ? mCheck->takeUnreadable() : QSet<std::size_t>();
    QList<int> gone;
    QList<ArchiveItem*> items;
    for (int i = 0; i < count(); ++i) {
        const ArchiveRow* row = archiveRow(i);
        ArchiveItem* item = madeItem(i);
        if (!row || !(row->isUnreadable() || (!item && found.contains(row->number()))))
            continue;
        gone.append(i);
        if (item)
            items.append(item);
    }
    if (gone.isEmpty())
        return;
    for (int* position :
         {&mOperationPosition, &mSelectedPosition, &mPressPosition, &mMoveSource, &mMoveDestination})
        *position -=
            static_cast<int>(std::lower_bound(gone.cbegin(), gone.cend(), *position) - gone.cbegin());
    removeRows(gone);
    for (ArchiveItem* item : std::as_const(items))
        mItems.take(item);
}

ArchiveRow* ArchiveList::archiveRow(int index) const
{
    return static_cast<ArchiveRow*>(row(index)); // the list adds no others
}

ArchiveItem* ArchiveList::madeItem(int index) const
{
    return qobject_cast<ArchiveItem*>(madeWidgetItem(index));
}

// The file may have gone since it was checked.
ArchiveItem* ArchiveList::readableItem(int index)
{
    if (index < 0)
        return nullptr;
    for (;;) {
        ArchiveItem* item = archiveItem(index);
        const ArchiveRow* row = archiveRow(index);
        if (!item || !row || !row->isUnreadable())
            return item;
        removeUnreadable();
        index = qMin(index, count() - 1);
    }
}

QString ArchiveList::titlePath(int index) const
{
    if (const ArchiveRow* row = archiveRow(index))
        return QString::fromStdString(row->path());
    const ArchiveItem* item = madeItem(index);
    return item ? item->getArchiveDataPath() : QString();
}

int ArchiveList::findTitle(const QString& path) const
{
    const std::string wanted = path.toStdString();
    for (int i = 0; i < count(); ++i) {
        const ArchiveRow* row = archiveRow(i);
        if (row ? row->path() == wanted : titlePath(i) == path)
            return i;
    }
    return -1;
}

ArchiveItem* ArchiveList::findItem(const QString& path) const
{
    ArchiveItem* item = mItems.find(path);
    return item ? item : archiveItem(findTitle(path));
}

ArchiveItem* ArchiveList::makeItem(ArchiveRow& row)
{
    std::unique_ptr<Archive> record = row.takeRecord();
    if (!record) {
        // Without a path nothing can be saved over what could not be read.
        record = std::make_unique<Archive>();
        QMetaObject::invokeMethod(this, &ArchiveList::removeUnreadable, Qt::QueuedConnection);
    }
    ArchiveItem* item = createBaseItem(mItems.own(std::move(record)));
    requestContents();
    return item;
}

void ArchiveList::requestContents()
{
    if (!std::exchange(mContentsRequested, true))
        Q_EMIT signalAddArchiveData();
}

void ArchiveList::slotAddArchiveData()
{
    mContentsRequested = false;
    for (ArchiveItem* item : mItems.beginToComplete())
        Q_EMIT signalAddOneArchiveData(item);
    beginCheck();
}

void ArchiveList::slotAddOneArchiveData(ArchiveItem* item)
{
    mItems.complete(item);
    beginCheck();
}

// The first screen comes before the titles that nobody looks at.
void ArchiveList::beginCheck()
{
    if (mCheck && mItems.isComplete())
        mCheck->begin();
}

// Called after a long folder has been scrolled. What is far from view goes first.
void ArchiveList::giveBackItems()
{
    mGiveBackRequested = false;
    std::vector<std::pair<int, ArchiveItem*>> made; // by their distance from view
    for (int i = 0; i < count(); ++i) {
        if (ArchiveItem* item = madeItem(i))
            made.emplace_back(qMax(firstVisibleItem() - i, i - lastVisibleItem()), item);
    }
    std::sort(made.begin(), made.end());
    for (; static_cast<qsizetype>(made.size()) > ITEMS_KEPT; made.pop_back()) {
        ArchiveItem* item = made.back().second;
        const bool isNeeded =
            item == mSelectedItem || item == mOperationItem || item == mDraggedItem || item->isHeld();
        ArchiveRow* row = archiveRow(getItemIndex(item));
        if (!isNeeded && giveBackWidgetItem(item))
            row->putBack(mItems.take(item));
    }
}

void ArchiveList::prepareOrder()
{
    mCleanUp = mController->prepareOrder(mCurrentPath) ? CleanUp::Allowed : CleanUp::Withheld;
}

void ArchiveList::setFolderLabel()
{
    if (mFolderLabel)
        mFolderLabel->setText(mCurrentPath.section(QLatin1Char('/'), -1, -1, QString::SectionSkipEmpty));
}

ArchiveItem* ArchiveList::getCurrentOperationArchive() const
{
    return mOperationItem;
}

ArchiveItem* ArchiveList::getSelectedArchive() const
{
    return mSelectedItem;
}

ArchiveItem* ArchiveList::archiveItem(int index) const
{
    return qobject_cast<ArchiveItem*>(getWidgetItem(index));
}

int ArchiveList::getItemIndex(ArchiveItem* item) const
{
    return getIndexOfWidgetItem(item);
}

void ArchiveList::selectArchive(int index)
{
    ArchiveItem* item = readableItem(index);
    if (mSelectedItem != item)
        setDefaultItemState(mSelectedItem);
    if (item) {
        setSelectItemState(item);
        saveLastArchivePathAndNotifyCanvasUpdate(item);
    } else {
        mSelectedItem.clear();
        Q_EMIT signalUpdateCanvas(nullptr);
    }
}

void ArchiveList::selectOperationArchive(int index)
{
    if (ArchiveItem* item = archiveItem(index)) {
        if (mOperationItem != item)
            clearOperationItemState(mOperationItem);
        setOperationItemState(item);
    }
}

void ArchiveList::setSelectItemState(ArchiveItem* item)
{
    if (!item)
        return;
    mSelectedItem = item;
    LOG_USER_OPERATE(L"Thumbnail", 200,
                     L"Select  the " + std::to_wstring(getItemIndex(item)) + L" Thumbnail");
    moveCurrentArchiveItemVisble();
    item->setStyleSheet(ArchiveItem::UN_OPERATE_AND_SELECT_STATE);
    item->setSelected(true);
}

void ArchiveList::setDefaultItemState(ArchiveItem* item)
{
    if (!item)
        return;
    item->setStyleSheet(ArchiveItem::UN_OPERATE_AND_UN_SELECT_STATE);
    item->setSelected(false);
    Q_EMIT itemSetDefaultState();
}

void ArchiveList::setOperationItemState(ArchiveItem* item)
{
    if (!item)
        return;
    mOperationItem = item;
    item->setStyleSheet(item == mSelectedItem ? ArchiveItem::OPERATE_AND_SELECT_STATE
                                              : ArchiveItem::OPERATE_AND_UN_SELECT_STATE);
}

void ArchiveList::clearOperationItemState(ArchiveItem* item)
{
    if (!item)
        return;
    item->setStyleSheet(item == mSelectedItem ? ArchiveItem::UN_OPERATE_AND_SELECT_STATE
                                              : ArchiveItem::UN_OPERATE_AND_UN_SELECT_STATE);
}

void ArchiveList::clearOldFlagState()
{
    clearOperationItemState(mOperationItem);
    mOperationItem.clear();
    mLongHold = false;
}

void ArchiveList::saveLastArchivePathAndNotifyCanvasUpdate(ArchiveItem* item)
{
    if (!item)
        return;
    mController->setLastArchivePath(item->getArchiveDataPath());
    Q_EMIT signalUpdateCanvas(item->getArchiveData());
}

void ArchiveList::moveCurrentArchiveItemVisble()
{
    const int selected = getItemIndex(mSelectedItem);
    if (count() <= ITEMS_IN_VIEW || selected < 0)
        return;
    const int last = lastVisibleItem();
    const bool isCut = mSelectedItem->geometry().bottom() > calculateVisibleRect().bottom();
    if (selected < firstVisibleItem())
        moveToWidgetItem(selected);
    else if (selected > last || (selected == last && isCut))
        moveToWidgetItem(selected - ITEMS_IN_VIEW);
}

void ArchiveList::itemReleasedEvent(KSBaseItemWidget* released, QPoint, KSScrollViewerWidget*)
{
    auto* item = qobject_cast<ArchiveItem*>(released);
    if (mMoveMode != 0)
        return;
    if (item && !mLongHold) {
        if (item == mSelectedItem) {
            if (item == mOperationItem)
                setSelectItemState(item);
        } else {
            ArchiveItem* old = mSelectedItem;
            setSelectItemState(item);
            setDefaultItemState(old);
            saveLastArchivePathAndNotifyCanvasUpdate(item);
            Q_EMIT focusCommandSignal(new FocusArchiveCommand(this, item, old));
        }
    }
    mLongHold = false;
}

QList<ArchiveOrder*> ArchiveList::getArchiveOrderList() const
{
    QList<ArchiveOrder*> orders;
    for (int i = 0; i < count(); ++i) {
        auto* order = new ArchiveOrder;
        order->setArchiveIndex(i);
        order->setArchivePath(QFileInfo(titlePath(i)).fileName().toStdString());
        orders.append(order);
    }
    return orders;
}

void ArchiveList::saveArchiveListOrder()
{
    std::unordered_set<std::string> known;
    for (const ArchiveItem* item : mItems.all()) // also those that only undo commands hold
        known.insert(QFileInfo(item->getArchiveDataPath()).fileName().toStdString());
    const QList<ArchiveOrder*> orders = getArchiveOrderList();
    if (!mController->saveListedOrder(mCurrentPath, orders, known))
        mCleanUp = CleanUp::Withheld;
    qDeleteAll(orders);
}

void ArchiveList::startPicker()
{
    Q_EMIT startTemplatePicker();
}

void ArchiveList::refreshBaseItem(QString archiveFilePath, QImage leftImage)
{
    LOG_DEBUG_OPERATE(L"ArchiveList", 200, L"refreshBaseItem " + archiveFilePath.toStdWString());
    ArchiveItem* item = findItem(archiveFilePath);
    if (!item)
        return;
    Archive archive;
    if (mController->getOneArchive(archiveFilePath, &archive))
        item->updateArchiveData(&archive);
    item->updateContents(leftImage);
}

void ArchiveList::setMainScene(CanvasScene* mainScene)
{
    mMainScene = mainScene;
}

void ArchiveList::clearOldArchiveList()
{
    mCheck.reset();
    removeAll();
    mItems.clear();
}

void ArchiveList::resetPositions()
{
    mSelectedItem.clear();
    mOperationItem.clear();
    mDraggedItem.clear();
    mOperationPosition = -1;
    mSelectedPosition = -1;
    mPressPosition = -1;
    mMoveSource = -1;
    mMoveDestination = -1;
    mMoving = false;
    mLongHold = false;
}

void ArchiveList::cleanArchiveList()
{
    endInitThread();
    clearOldArchiveList();
    resetPositions();
    mCurrentPath.clear();
    if (mFolderLabel)
        mFolderLabel->clear();
}

void ArchiveList::synchronizationFolderFile()
{
    if (mCurrentPath.isEmpty())
        return;
    if (!isEmpty() && orderIsDamaged())
        saveArchiveListOrder();
    if (mCleanUp == CleanUp::Allowed)
        mController->deleteUnusefulArchives(mCurrentPath);
}

// Whether the folder's order is not the list's: the disk has not taken it, or another program has harmed it.
bool ArchiveList::orderIsDamaged() const
{
    const std::string folder = mCurrentPath.toStdString();
    std::vector<ArchiveOrder> rows;
    return FolderOrder::isKept(folder) || FolderOrder::read(folder, rows) != FolderOrder::State::Whole ||
           rows.empty();
}
