#include "library/ArchiveList.h"

#include "document/Archive.h"
#include "document/ArchiveController.h"
#include "document/ArchiveOrder.h"
#include "document/TitleParser.h"
#include "library/ArchiveInitThread.h"
#include "library/ArchiveItem.h"
#include "library/ArchiveMenu.h"
#include "library/FocusArchiveCommand.h"
#include "library/ITitlerFolderReporter.h"
#include "library/SmallPictures.h"
#include "support/FolderLookup.h"
#include "support/IPathManagerEx.h"
#include "support/LeftoverSweep.h"
#include "support/LogManager.h"
#include "support/XmlFile.h"

#include <QCoreApplication>
#include <QDir>
#include <QEvent>
#include <QFile>
#include <QFileInfo>
#include <QLabel>
#include <string>
#include <tinyxml.h>

namespace
{

const int ITEMS_IN_VIEW = 6;    // before the list scrolls to the selection
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
    connect(this, &ArchiveList::signalAddArchiveData, this, &ArchiveList::slotAddArchiveData,
            Qt::QueuedConnection);
    connect(this, &ArchiveList::signalAddOneArchiveData, this, &ArchiveList::slotAddOneArchiveData,
            Qt::QueuedConnection);
}

void ArchiveList::initArchiveList()
{
    const QString last = mController->getLastFolderPath();
    const auto folders = mController->getFolderList();
    if (!last.isEmpty() && QDir(last).exists())
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
    addRecords(archivesList);
    if (isEmpty()) {
        Q_EMIT startTemplatePicker();
        return;
    }
    selectArchive(0);
    Q_EMIT signalAddArchiveData();
}

void ArchiveList::addRecords(const QList<Archive*>& archives)
{
    mArchives = archives;
    QStringList pictures;
    for (const Archive* archive : mArchives)
        pictures.append(archive->getFullPathOfThumbnailSmall());
    QList<KSBaseItemWidget*> items;
    for (Archive* archive : mArchives)
        items.append(createBaseItem(archive));
    addWidgetItems(&items, -1);
    mSmallPictures = std::make_unique<SmallPictures>(pictures, ArchiveItem::PICTURE_SIZE);
}

ArchiveItem* ArchiveList::createBaseItem(Archive* archive)
{
    auto* item = new ArchiveItem(archive, ArchiveItem::LIST_ITEM, this);
    mAllItems.append(item);
    return item;
}

ArchiveItem* ArchiveList::createPasteUndoItem(Archive* archive, ArchiveItem* item)
{
    if (!item)
        item = createBaseItem(archive);
    item->initArchiveItemChildWidget();
    return item;
}

void ArchiveList::slotAddArchiveData()
{
    for (int i = 0; i < count(); ++i)
        Q_EMIT signalAddOneArchiveData(archiveItem(i));
}

void ArchiveList::slotAddOneArchiveData(ArchiveItem* item)
{
    // The folder may have changed while the call was queued.
    const qsizetype index = mAllItems.indexOf(item);
    if (index < 0)
        return;
    // The first items are those of the records, in their order.
    if (!item->hasChildWidgets())
        item->initArchiveItemChildWidget(mSmallPictures ? mSmallPictures->take(index) : QImage());
    if (mSmallPictures && index + 1 == mSmallPictures->count())
        mSmallPictures.reset();
    // Queued calls come before updates: what is on screen does not wait for the rest of a long folder.
    if (getItemIndex(item) == lastVisibleItem())
        viewport()->repaint();
}

void ArchiveList::initArchiveListRefreshData()
{
    setFolderLabel();
    addRecords(mController->getArchiveList(mCurrentPath));
    if (ITitlerFolderReporter* reporter = ITitlerFolderReporter::instance())
        reporter->editFolderStartStatus(mCurrentPath);
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

ArchiveItem* ArchiveList::findItem(const QString& path) const
{
    for (ArchiveItem* item : mAllItems) {
        if (item->getArchiveDataPath() == path)
            return item;
    }
    return nullptr;
}

void ArchiveList::selectArchive(int index)
{
    ArchiveItem* item = archiveItem(index);
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
        order->setArchivePath(QFileInfo(archiveItem(i)->getArchiveDataPath()).fileName().toStdString());
        orders.append(order);
    }
    return orders;
}

void ArchiveList::saveArchiveListOrder()
{
    const QList<ArchiveOrder*> orders = getArchiveOrderList();
    mController->saveArchiveListOrder(mCurrentPath, orders);
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
    removeAll();
    mSmallPictures.reset();
    // Those that undo commands still hold, too: the commands see it. The touch that leads here may be on its
    // way to another finger's item, which must be there to get it.
    for (ArchiveItem* item : std::as_const(mAllItems))
        item->discard();
    mAllItems.clear();
    qDeleteAll(mArchives);
    mArchives.clear();
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
    // Without an order, which a full disk did not take, or with a torn one the clean-up would count every
    // title as deleted. The next start makes one from what the folder holds.
    const QString order = mCurrentPath + QLatin1Char('/') + QLatin1String(TitleParser::ORDER_FILEPATH);
    TiXmlDocument document;
    const auto isReadable = [&] {
        return XmlFile::load(order.toStdString(), document) && document.RootElement();
    };
    const auto namesTitles = [&] { return isReadable() && document.RootElement()->FirstChildElement(); };
    if (!isEmpty() && !namesTitles())
        saveArchiveListOrder();
    if (isEmpty() ? isReadable() : namesTitles())
        mController->deleteUnusefulArchives(mCurrentPath);
}
