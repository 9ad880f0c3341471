#include "library/ArchiveList.h"

#include "canvas/CanvasScene.h"
#include "canvas/SaveOutage.h"
#include "document/Archive.h"
#include "document/ArchiveController.h"
#include "document/ArchiveOrder.h"
#include "document/FolderOrder.h"
#include "library/ArchiveInitThread.h"
#include "library/ArchiveItem.h"
#include "library/ArchiveRow.h"
#include "library/FocusArchiveCommand.h"
#include "library/IEditContext.h"
#include "library/ITitlerFolderReporter.h"
#include "library/ListMessages.h"
#include "library/MoveArchiveCommand.h"
#include "support/ConfinedPath.h"
#include "support/FolderLookup.h"
#include "support/IPathManagerEx.h"
#include "support/LeftoverSweep.h"
#include "support/LogManager.h"
#include "support/SystemInfo.h"

#include <QCoreApplication>
#include <QDir>
#include <QEvent>
#include <QFile>
#include <QFileInfo>
#include <QLabel>
#include <QWheelEvent>
#include <algorithm>
#include <string>
#include <unordered_set>
#include <utility>
#include <vector>

namespace
{

const int ITEMS_IN_VIEW = 6;    // more items than this make the list scroll to the selection
const int MOST_ITEMS = 120;     // more titles than operators have in a folder
const int ITEMS_KEPT = 60;      // number to keep when there are more: a few screens on both sides of the view
const int EFFECTIVE_LEFT = 38;  // right of the scroll bar
const int LOADER_POLL = 1;      // ms
const int LABEL_FONT_SIZE = 13; // points

// Removes half-written files of killed processes from the title folders, before anything is read.
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
    , mItems(this)
    , mActions(std::make_unique<TitleMenuActions>(this, *mController))
    , mFolderLabel(folderLabel)
{
    setMenuFont(QStringLiteral("KST"));
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
    connectMenuActions();
    SaveOutage::instance(); // the order may be saved from now on
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
    connect(&mRows, &TitleRows::unreadableFound, this, &ArchiveList::removeUnreadable);
    connect(this, &ArchiveList::signalAddArchiveData, this, &ArchiveList::slotAddArchiveData,
            Qt::QueuedConnection);
    connect(this, &ArchiveList::signalAddOneArchiveData, this, &ArchiveList::slotAddOneArchiveData,
            Qt::QueuedConnection);
}

void ArchiveList::connectMenuActions()
{
    connect(mActions.get(), &TitleMenuActions::deleteCommandSignal, this, &ArchiveList::deleteCommandSignal);
    connect(mActions.get(), &TitleMenuActions::pasteCommandSignal, this, &ArchiveList::pasteCommandSignal);
    connect(mActions.get(), &TitleMenuActions::addUserSignal, this, &ArchiveList::addUserSignal);
    connect(mActions.get(), &TitleMenuActions::startTemplatePicker, this, &ArchiveList::startTemplatePicker);
    connect(mActions.get(), &TitleMenuActions::startUserTemplatePicker, this,
            &ArchiveList::startUserTemplatePicker);
    connect(mActions.get(), &TitleMenuActions::archiveListMenuShow, this, &ArchiveList::archiveListMenuShow);
    connect(mActions.get(), &TitleMenuActions::signalStartPasteArchive, this,
            &ArchiveList::signalStartPasteArchive);
    connect(mActions.get(), &TitleMenuActions::menuAboutToClose, this, &ArchiveList::slotMenuAboutToClose);
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

// Ends the loader. It may be blocked until this thread has taken its titles, so these are accepted and
// dropped.
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
    addRows(mRows.read(*this, mCurrentPath), -1);
    if (ITitlerFolderReporter* reporter = ITitlerFolderReporter::instance())
        reporter->editFolderStartStatus(mCurrentPath);
}

void ArchiveList::finishCheck()
{
    if (!mRows.isChecking())
        return;
    mRows.waitForCheck();
    removeUnreadable();
    mRows.endCheck();
}

// Removes the rows of unreadable titles. A row with an item was read successfully before and stays unless its
// own read failed.
void ArchiveList::removeUnreadable()
{
    const QSet<std::size_t> found = mRows.takeUnreadable();
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
    mActions->rowsRemoved(gone);
    mMoveSource -=
        static_cast<int>(std::lower_bound(gone.cbegin(), gone.cend(), mMoveSource) - gone.cbegin());
    removeRows(gone);
    for (ArchiveItem* item : std::as_const(items))
        mItems.take(item);
}

ArchiveRow* ArchiveList::archiveRow(int index) const
{
    return static_cast<ArchiveRow*>(row(index)); // all rows of this list are of this type
}

ArchiveItem* ArchiveList::madeItem(int index) const
{
    return qobject_cast<ArchiveItem*>(madeWidgetItem(index));
}

// Returns the item of the row or, if its file was deleted since the check, that of the next row.
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
        // A record without a path is never saved, so the unreadable file is not overwritten.
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

// Starts the check once the items on screen are complete.
void ArchiveList::beginCheck()
{
    if (mItems.isComplete())
        mRows.beginCheck();
}

// Gives back the items farthest from the view. Called after a long folder was scrolled.
void ArchiveList::giveBackItems()
{
    mGiveBackRequested = false;
    std::vector<std::pair<int, ArchiveItem*>> made; // sorted by distance from the view
    for (int i = 0; i < count(); ++i)
        if (ArchiveItem* item = madeItem(i))
            made.emplace_back(qMax(firstVisibleItem() - i, i - lastVisibleItem()), item);
    std::sort(made.begin(), made.end());
    for (; static_cast<qsizetype>(made.size()) > ITEMS_KEPT; made.pop_back()) {
        ArchiveItem* item = made.back().second;
        const bool isNeeded = item == getSelectedArchive() || item == getCurrentOperationArchive() ||
                              item == mDraggedItem || item->isHeld();
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
    if (getSelectedArchive() != item)
        setDefaultItemState(getSelectedArchive());
    if (item) {
        setSelectItemState(item);
        saveLastArchivePathAndNotifyCanvasUpdate(item);
    } else {
        mSelection.forgetSelected();
        Q_EMIT signalUpdateCanvas(nullptr);
    }
}

void ArchiveList::selectOperationArchive(int index)
{
    if (ArchiveItem* item = archiveItem(index)) {
        if (getCurrentOperationArchive() != item)
            clearOperationItemState(getCurrentOperationArchive());
        setOperationItemState(item);
    }
}

void ArchiveList::setSelectItemState(ArchiveItem* item)
{
    if (!item)
        return;
    mSelection.select(item);
    LOG_USER_OPERATE(L"Thumbnail", 200,
                     L"Select  the " + std::to_wstring(getItemIndex(item)) + L" Thumbnail");
    moveCurrentArchiveItemVisble();
    TitleSelection::showSelected(item);
}

void ArchiveList::setDefaultItemState(ArchiveItem* item)
{
    if (!item)
        return;
    TitleSelection::showDefault(item);
    Q_EMIT itemSetDefaultState();
}

void ArchiveList::clearOldFlagState()
{
    clearOperationItemState(getCurrentOperationArchive());
    mSelection.forgetOperation();
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
    const int selected = getItemIndex(getSelectedArchive());
    if (count() <= ITEMS_IN_VIEW || selected < 0)
        return;
    const int last = lastVisibleItem();
    const bool isCut = getSelectedArchive()->geometry().bottom() > calculateVisibleRect().bottom();
    if (selected < firstVisibleItem())
        moveToWidgetItem(selected);
    else if (selected > last || (selected == last && isCut))
        moveToWidgetItem(selected - ITEMS_IN_VIEW);
}

void ArchiveList::itemReleasedEvent(KSBaseItemWidget* released, QPoint, KSScrollViewerWidget*)
{
    auto* item = qobject_cast<ArchiveItem*>(released);
    if (mMoveMode)
        return;
    ArchiveItem* old = getSelectedArchive();
    if (item && !mLongHold) {
        if (item != old) {
            setSelectItemState(item);
            setDefaultItemState(old);
            saveLastArchivePathAndNotifyCanvasUpdate(item);
            Q_EMIT focusCommandSignal(new FocusArchiveCommand(this, item, old));
        } else if (item == getCurrentOperationArchive()) {
            setSelectItemState(item);
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
    for (const ArchiveItem* item : mItems.all()) // includes items that only undo commands hold
        known.insert(QFileInfo(item->getArchiveDataPath()).fileName().toStdString());
    const QList<ArchiveOrder*> orders = getArchiveOrderList();
    if (!mController->saveListedOrder(mCurrentPath, orders, known))
        mCleanUp = CleanUp::Withheld;
    qDeleteAll(orders);
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

void ArchiveList::clearOldArchiveList()
{
    mRows.endCheck();
    removeAll();
    mItems.clear();
}

void ArchiveList::resetPositions()
{
    mSelection = TitleSelection();
    mActions->setOperationPosition(-1);
    mDraggedItem.clear();
    mMoveSource = -1;
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

// Returns whether the order file does not match the list: its last write was refused, or another program has
// damaged it.
bool ArchiveList::orderIsDamaged() const
{
    const std::string folder = mCurrentPath.toStdString();
    std::vector<ArchiveOrder> rows;
    return FolderOrder::isKept(folder) || FolderOrder::read(folder, rows) != FolderOrder::State::Whole ||
           rows.empty();
}

// --- Opening folders ------------------------------------------------------------------------------------

void ArchiveList::openFolder(const QString& path)
{
    endInitThread();
    mController->setLastFolderPath(path);
    setDefaultItemState(getSelectedArchive());
    clearOperationItemState(getCurrentOperationArchive());
    // Each start notice needs an end notice, otherwise the old folder stays locked for the sibling processes.
    ITitlerFolderReporter* reporter = ITitlerFolderReporter::instance();
    if (reporter && !mCurrentPath.isEmpty())
        reporter->editFolderEndStatus(mCurrentPath);
    mCurrentPath = path;
    clearOldArchiveList();
    resetPositions();
    initArchiveListRefreshData();
}

void ArchiveList::refreshArchiveList(QString path)
{
    openFolder(path);
    requestContents();
    if (!isEmpty() && !IEditContext::isCreateNewNow()) {
        selectArchive(0);
    } else if (!checkArchiveListIsFull()) {
        Q_EMIT signalUpdateCanvas(nullptr);
        Q_EMIT startTemplatePicker();
    } else {
        selectArchive(0);
        ListMessages::post(MessageDef::MESSAGE_LIST_FULL_ON_CREATE, ListMessages::limitText());
    }
}

void ArchiveList::refreshArchiveListInFile(QString path, QString fileName)
{
    LOG_DEBUG_OPERATE(L"ArchiveList", 200, L" File:" + fileName.toStdWString());
    openFolder(path);
    requestContents();

    const bool isFound = selectTitle(path + QLatin1Char('/') + fileName);
    if (IEditContext::isCreateNewNow()) {
        offerTemplateOrReportFull();
    } else if (!isFound) {
        if (isEmpty()) {
            Q_EMIT signalUpdateCanvas(nullptr);
            Q_EMIT startTemplatePicker();
        } else {
            selectArchive(0);
        }
    }
}

bool ArchiveList::selectTitle(const QString& path)
{
    const int index = findTitle(path);
    if (index < 0)
        return false;
    archiveItem(index);
    if (ArchiveRow* row = archiveRow(index); row && row->isUnreadable()) {
        removeUnreadable();
        return false;
    }
    selectArchive(index);
    return true;
}

void ArchiveList::offerTemplateOrReportFull()
{
    if (checkArchiveListIsFull())
        ListMessages::post(MessageDef::MESSAGE_LIST_FULL_ON_CREATE, ListMessages::limitText());
    else
        Q_EMIT startTemplatePicker();
}

void ArchiveList::refreshArchiveListForChangeFolderName(QString before, QString after)
{
    LOG_DEBUG_OPERATE(L"ArchiveList", 200,
                      L"ArchiveList_refreshArchiveListForChangeFolderName() Enter Before:" +
                          before.toStdWString() + L" After:" + after.toStdWString());
    if (QDir::cleanPath(before) != QDir::cleanPath(mCurrentPath)) // the path in a request may end with a "/"
        return;
    endInitThread();
    mController->setLastFolderPath(after);
    if (mMainScene)
        mMainScene->folderRenamed(before, after);
    const int selected = getItemIndex(getSelectedArchive());
    const QString fileName = QFileInfo(titlePath(selected)).fileName();
    setDefaultItemState(getSelectedArchive());
    mCurrentPath = after;
    clearOldArchiveList();
    resetPositions();
    initArchiveListRefreshData();
    if (isEmpty()) {
        Q_EMIT startTemplatePicker();
        return;
    }
    // The position may change until all titles are read, the name does not.
    if (fileName.isEmpty() || !selectTitle(after + QLatin1Char('/') + fileName))
        selectArchive(qBound(0, selected, count() - 1));
}

// --- The option menu ------------------------------------------------------------------------------------

bool ArchiveList::checkArchiveListIsFull()
{
    if (mRows.readAtOnce() < ListMessages::TITLE_LIMIT)
        finishCheck();
    return count() > ListMessages::TITLE_LIMIT - 1;
}

bool ArchiveList::checkDiskSpaceIsFull() const
{
    return SystemInfo::getInstance()->getDiskRemainSize(mCurrentPath.toStdWString()) <
           LIMIT_REMAIN * KB_MILLION;
}

void ArchiveList::itemLongHoldEvent(KSBaseItemWidget* item, QPoint pos, KSScrollViewerWidget* scrollArea)
{
    if (mMoveMode)
        return;
    mLongHold = true;
    mActions->showOptionMenu(qobject_cast<ArchiveItem*>(item), pos, scrollArea);
    setFlickAbility(false);
}

void ArchiveList::itemRightPressedEvent(KSBaseItemWidget* item, QPoint pos, KSScrollViewerWidget* scrollArea)
{
    if (!mMoveMode)
        mActions->showOptionMenu(qobject_cast<ArchiveItem*>(item), pos, scrollArea);
}

void ArchiveList::slotMenuAboutToClose()
{
    mActions->sendTitlerAppEvent(false);
    clearOperationItemState(getCurrentOperationArchive());
}

void ArchiveList::wheelEvent(QWheelEvent* event)
{
    slotHideOptionMenu();
    KSScrollViewerWidget::wheelEvent(event);
}

// Deselects the title for a moment, so that the canvas makes its pictures before the title is copied. This is
// not a selection by the operator: nothing is logged and the list does not scroll.
void ArchiveList::waitForCanvas()
{
    setDefaultItemState(getSelectedArchive());
    if (mMainScene)
        mMainScene->waitForPictures();
    TitleSelection::showSelected(getSelectedArchive());
}

void ArchiveList::setMenuFont(const QString& family)
{
    QFont font(family);
    font.setPixelSize(MENU_FONT_SIZE);
    mActions->setMenuFont(font);
}

void ArchiveList::setSystemLanFont(QString family)
{
    setMenuFont(family);
    ArchiveItem::setSystemFontFamily(family);
    for (ArchiveItem* item : mItems.all()) // includes items that are not listed and may return
        item->updateRightChild();
}

void ArchiveList::translateText()
{
    mActions->translateText();
    // The label of a closed folder stays empty.
    if (mFolderLabel && mCurrentPath.isEmpty() && !mFolderLabel->text().isEmpty())
        mFolderLabel->setText(tr("Folder"));
}

// --- Move mode: titles are dragged by their handles to another place ------------------------------------

void ArchiveList::moveButtonClicked(bool isMoveMode)
{
    mMoveMode = isMoveMode;
    if (isMoveMode)
        finishCheck();
    Q_EMIT signalItemsCanDrag(isMoveMode);
    if (!isMoveMode)
        clearOperationItemState(getCurrentOperationArchive());
}

void ArchiveList::itemPressedAndHoldEvent(KSBaseItemWidget* item, QPoint pos, KSScrollViewerWidget*,
                                          bool& willMenuPopup)
{
    if (mMoveMode || !item)
        return;
    const QWidget* right = item->getRightChild();
    willMenuPopup = right && right->geometry().contains(pos);
}

// Lets a drag on an item scroll the list.
void ArchiveList::itemFlickEvent(KSBaseItemWidget* item, QPoint, KSScrollViewerWidget*, bool& willFlick)
{
    if (item)
        willFlick = true;
}

void ArchiveList::slotDragOneItem(KSBaseItemWidget* item, int index, KSScrollViewerWidget*)
{
    mDraggedItem = qobject_cast<ArchiveItem*>(item);
    clearOperationItemState(getCurrentOperationArchive());
    setOperationItemState(mDraggedItem);
    mMoveSource = index;
    mMoving = true;
}

void ArchiveList::slotItemDrop()
{
    mMoving = false;
    saveArchiveListOrder();
    if (ITitlerFolderReporter* reporter = ITitlerFolderReporter::instance())
        reporter->updateTitlerOrder(mCurrentPath);
    ArchiveItem* item = mDraggedItem;
    const int position = getItemIndex(item);
    if (position < 0)
        return;
    mActions->setOperationPosition(position);
    setOperationItemState(item);
    if (mMoveSource != position)
        Q_EMIT moveCommandSignal(new MoveArchiveCommand(this, item, mMoveSource, position, nullptr));
    mDraggedItem.clear();
}
