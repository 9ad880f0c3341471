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
    , m_controller(std::make_unique<ArchiveController>())
    , m_items(this)
    , m_actions(std::make_unique<TitleMenuActions>(this, *m_controller))
    , m_folderLabel(folderLabel)
{
    setMenuFont(QStringLiteral("KST"));
    setScrollBarAutoShow(true);
    setItemsDragFlagAlignment(DRAGFLAG_RIGHT);
    setHEffectiveArea(EFFECTIVE_LEFT, ArchiveItem::WIDGET_WIDTH);
    if (m_folderLabel) {
        QFont font = m_folderLabel->font();
        font.setPointSize(LABEL_FONT_SIZE);
        m_folderLabel->setFont(font);
        m_folderLabel->setTextFormat(Qt::PlainText);
        m_folderLabel->setText(tr("Folder"));
    }
    initArchiveListConnect();
    connectMenuActions();
    SaveOutage::instance(); // the order may be saved from now on
    sweepTitleFolders();
    m_controller->reCreateOrderXml();
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
    connect(this, &KSScrollViewerWidget::widgetItemPressed, this, [this] { m_longHold = false; });
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
        if (m_items.all().size() > MOST_ITEMS && !std::exchange(m_giveBackRequested, true))
            QMetaObject::invokeMethod(this, &ArchiveList::giveBackItems, Qt::QueuedConnection);
    });
    connect(&m_rows, &TitleRows::unreadableFound, this, &ArchiveList::removeUnreadable);
    connect(this, &ArchiveList::signalAddArchiveData, this, &ArchiveList::slotAddArchiveData,
            Qt::QueuedConnection);
    connect(this, &ArchiveList::signalAddOneArchiveData, this, &ArchiveList::slotAddOneArchiveData,
            Qt::QueuedConnection);
}

void ArchiveList::connectMenuActions()
{
    connect(m_actions.get(), &TitleMenuActions::deleteCommandSignal, this, &ArchiveList::deleteCommandSignal);
    connect(m_actions.get(), &TitleMenuActions::pasteCommandSignal, this, &ArchiveList::pasteCommandSignal);
    connect(m_actions.get(), &TitleMenuActions::addUserSignal, this, &ArchiveList::addUserSignal);
    connect(m_actions.get(), &TitleMenuActions::startTemplatePicker, this, &ArchiveList::startTemplatePicker);
    connect(m_actions.get(), &TitleMenuActions::startUserTemplatePicker, this,
            &ArchiveList::startUserTemplatePicker);
    connect(m_actions.get(), &TitleMenuActions::archiveListMenuShow, this, &ArchiveList::archiveListMenuShow);
    connect(m_actions.get(), &TitleMenuActions::signalStartPasteArchive, this,
            &ArchiveList::signalStartPasteArchive);
    connect(m_actions.get(), &TitleMenuActions::menuAboutToClose, this, &ArchiveList::slotMenuAboutToClose);
}

void ArchiveList::initArchiveList()
{
    const QString last = m_controller->getLastFolderPath();
    const auto folders = m_controller->getFolderList();
    if (!last.isEmpty() && QDir(last).exists() &&
        ConfinedPath::isBelow(&IPathManagerEx::getTitleResourcesPath, last.toStdString()))
        m_currentPath = last;
    else if (!folders.isEmpty())
        m_currentPath = QString::fromStdString(folders.front());

    ITitlerFolderReporter* reporter = ITitlerFolderReporter::instance();
    if (reporter && !m_currentPath.isEmpty())
        reporter->editFolderStartStatus(m_currentPath);
    LOG_DEBUG_OPERATE(L"ArchiveList", 200,
                      L"ArchiveList_initArchiveList() Path:" + m_currentPath.toStdWString());
    initArchiveListData();
}

void ArchiveList::initArchiveListData()
{
    if (m_currentPath.isEmpty())
        return;
    setFolderLabel();
    endInitThread();
    prepareOrder();
    m_initThread = std::make_unique<ArchiveInitThread>(m_currentPath);
    connect(m_initThread.get(), &ArchiveInitThread::threadGetArchiveListFinished, this,
            &ArchiveList::getArchiveListSuccessed, Qt::BlockingQueuedConnection);
    m_initThread->start(QThread::InheritPriority);
}

// Ends the loader. It may be blocked until this thread has taken its titles, so these are accepted and
// dropped.
void ArchiveList::endInitThread()
{
    if (!m_initThread)
        return;
    m_initThread->cancel();
    m_ignoreLoaded = true;
    while (!m_initThread->wait(LOADER_POLL))
        QCoreApplication::sendPostedEvents(this, QEvent::MetaCall);
    m_ignoreLoaded = false;
    m_initThread.reset();
}

void ArchiveList::getArchiveListSuccessed(QList<Archive*> archivesList)
{
    if (m_ignoreLoaded) {
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
    addRows(m_rows.read(*this, m_currentPath), -1);
    if (ITitlerFolderReporter* reporter = ITitlerFolderReporter::instance())
        reporter->editFolderStartStatus(m_currentPath);
}

void ArchiveList::finishCheck()
{
    if (!m_rows.isChecking())
        return;
    m_rows.waitForCheck();
    removeUnreadable();
    m_rows.endCheck();
}

// Removes the rows of unreadable titles. A row with an item was read successfully before and stays unless its
// own read failed.
void ArchiveList::removeUnreadable()
{
    const QSet<std::size_t> found = m_rows.takeUnreadable();
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
    m_actions->rowsRemoved(gone);
    m_moveSource -=
        static_cast<int>(std::lower_bound(gone.cbegin(), gone.cend(), m_moveSource) - gone.cbegin());
    removeRows(gone);
    for (ArchiveItem* item : std::as_const(items))
        m_items.take(item);
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
    ArchiveItem* item = m_items.find(path);
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
    ArchiveItem* item = createBaseItem(m_items.own(std::move(record)));
    requestContents();
    return item;
}

void ArchiveList::requestContents()
{
    if (!std::exchange(m_contentsRequested, true))
        Q_EMIT signalAddArchiveData();
}

void ArchiveList::slotAddArchiveData()
{
    m_contentsRequested = false;
    for (ArchiveItem* item : m_items.beginToComplete())
        Q_EMIT signalAddOneArchiveData(item);
    beginCheck();
}

void ArchiveList::slotAddOneArchiveData(ArchiveItem* item)
{
    m_items.complete(item);
    beginCheck();
}

// Starts the check once the items on screen are complete.
void ArchiveList::beginCheck()
{
    if (m_items.isComplete())
        m_rows.beginCheck();
}

// Gives back the items farthest from the view. Called after a long folder was scrolled.
void ArchiveList::giveBackItems()
{
    m_giveBackRequested = false;
    std::vector<std::pair<int, ArchiveItem*>> made; // sorted by distance from the view
    for (int i = 0; i < count(); ++i)
        if (ArchiveItem* item = madeItem(i))
            made.emplace_back(qMax(firstVisibleItem() - i, i - lastVisibleItem()), item);
    std::sort(made.begin(), made.end());
    for (; static_cast<qsizetype>(made.size()) > ITEMS_KEPT; made.pop_back()) {
        ArchiveItem* item = made.back().second;
        const bool isNeeded = item == getSelectedArchive() || item == getCurrentOperationArchive() ||
                              item == m_draggedItem || item->isHeld();
        ArchiveRow* row = archiveRow(getItemIndex(item));
        if (!isNeeded && giveBackWidgetItem(item))
            row->putBack(m_items.take(item));
    }
}

void ArchiveList::prepareOrder()
{
    lockFolder();
    m_cleanUp = m_controller->prepareOrder(m_currentPath) ? CleanUp::Allowed : CleanUp::Withheld;
}

// Takes the lock of the current folder unless it is held. The operator is not kept waiting for another
// program that has it: the list goes on and tries again with the next title.
void ArchiveList::lockFolder()
{
    m_folderLock.take(m_currentPath.toStdString(), FolderLock::Kind::Exclusive);
}

void ArchiveList::setFolderLabel()
{
    if (m_folderLabel)
        m_folderLabel->setText(m_currentPath.section(QLatin1Char('/'), -1, -1, QString::SectionSkipEmpty));
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
        m_selection.forgetSelected();
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
    m_selection.select(item);
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
    m_selection.forgetOperation();
    m_longHold = false;
}

void ArchiveList::saveLastArchivePathAndNotifyCanvasUpdate(ArchiveItem* item)
{
    if (!item)
        return;
    lockFolder();
    m_controller->setLastArchivePath(item->getArchiveDataPath());
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
    if (m_moveMode)
        return;
    ArchiveItem* old = getSelectedArchive();
    if (item && !m_longHold) {
        if (item != old) {
            setSelectItemState(item);
            setDefaultItemState(old);
            saveLastArchivePathAndNotifyCanvasUpdate(item);
            Q_EMIT focusCommandSignal(new FocusArchiveCommand(this, item, old));
        } else if (item == getCurrentOperationArchive()) {
            setSelectItemState(item);
        }
    }
    m_longHold = false;
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
    for (const ArchiveItem* item : m_items.all()) // includes items that only undo commands hold
        known.insert(QFileInfo(item->getArchiveDataPath()).fileName().toStdString());
    const QList<ArchiveOrder*> orders = getArchiveOrderList();
    if (!m_controller->saveListedOrder(m_currentPath, orders, known))
        m_cleanUp = CleanUp::Withheld;
    qDeleteAll(orders);
}

void ArchiveList::refreshBaseItem(QString archiveFilePath, QImage leftImage)
{
    LOG_DEBUG_OPERATE(L"ArchiveList", 200, L"refreshBaseItem " + archiveFilePath.toStdWString());
    ArchiveItem* item = findItem(archiveFilePath);
    if (!item)
        return;
    Archive archive;
    if (m_controller->getOneArchive(archiveFilePath, &archive))
        item->updateArchiveData(&archive);
    item->updateContents(leftImage);
}

void ArchiveList::clearOldArchiveList()
{
    m_rows.endCheck();
    removeAll();
    m_items.clear();
}

void ArchiveList::resetPositions()
{
    m_selection = TitleSelection();
    m_actions->setOperationPosition(-1);
    m_draggedItem.clear();
    m_moveSource = -1;
    m_moving = false;
    m_longHold = false;
}

void ArchiveList::cleanArchiveList()
{
    endInitThread();
    clearOldArchiveList();
    resetPositions();
    m_folderLock.release();
    m_currentPath.clear();
    if (m_folderLabel)
        m_folderLabel->clear();
}

void ArchiveList::synchronizationFolderFile()
{
    if (m_currentPath.isEmpty())
        return;
    if (!isEmpty() && orderIsDamaged())
        saveArchiveListOrder();
    if (m_cleanUp == CleanUp::Allowed)
        m_controller->deleteUnusefulArchives(m_currentPath);
}

// Returns whether the order file does not match the list: its last write was refused, or another program has
// damaged it.
bool ArchiveList::orderIsDamaged() const
{
    const std::string folder = m_currentPath.toStdString();
    std::vector<ArchiveOrder> rows;
    return FolderOrder::isKept(folder) || FolderOrder::read(folder, rows) != FolderOrder::State::Whole ||
           rows.empty();
}

// --- Opening folders ------------------------------------------------------------------------------------

void ArchiveList::openFolder(const QString& path)
{
    endInitThread();
    m_controller->setLastFolderPath(path);
    setDefaultItemState(getSelectedArchive());
    clearOperationItemState(getCurrentOperationArchive());
    // Each start notice needs an end notice, otherwise the old folder stays locked for the sibling processes.
    ITitlerFolderReporter* reporter = ITitlerFolderReporter::instance();
    if (reporter && !m_currentPath.isEmpty())
        reporter->editFolderEndStatus(m_currentPath);
    m_currentPath = path;
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
    if (QDir::cleanPath(before) != QDir::cleanPath(m_currentPath)) // the path in a request may end with a "/"
        return;
    endInitThread();
    m_controller->setLastFolderPath(after);
    if (m_mainScene)
        m_mainScene->folderRenamed(before, after);
    const int selected = getItemIndex(getSelectedArchive());
    const QString fileName = QFileInfo(titlePath(selected)).fileName();
    setDefaultItemState(getSelectedArchive());
    m_currentPath = after;
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
    if (m_rows.readAtOnce() < ListMessages::TITLE_LIMIT)
        finishCheck();
    return count() > ListMessages::TITLE_LIMIT - 1;
}

bool ArchiveList::checkDiskSpaceIsFull() const
{
    return SystemInfo::getInstance()->getDiskRemainSize(m_currentPath.toStdWString()) <
           LIMIT_REMAIN * KB_MILLION;
}

void ArchiveList::itemLongHoldEvent(KSBaseItemWidget* item, QPoint pos, KSScrollViewerWidget* scrollArea)
{
    if (m_moveMode)
        return;
    m_longHold = true;
    m_actions->showOptionMenu(qobject_cast<ArchiveItem*>(item), pos, scrollArea);
    setFlickAbility(false);
}

void ArchiveList::itemRightPressedEvent(KSBaseItemWidget* item, QPoint pos, KSScrollViewerWidget* scrollArea)
{
    if (!m_moveMode)
        m_actions->showOptionMenu(qobject_cast<ArchiveItem*>(item), pos, scrollArea);
}

void ArchiveList::slotMenuAboutToClose()
{
    m_actions->sendTitlerAppEvent(false);
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
    if (m_mainScene)
        m_mainScene->waitForPictures();
    TitleSelection::showSelected(getSelectedArchive());
}

void ArchiveList::setMenuFont(const QString& family)
{
    QFont font(family);
    font.setPixelSize(MENU_FONT_SIZE);
    m_actions->setMenuFont(font);
}

void ArchiveList::setSystemLanFont(QString family)
{
    setMenuFont(family);
    ArchiveItem::setSystemFontFamily(family);
    for (ArchiveItem* item : m_items.all()) // includes items that are not listed and may return
        item->updateRightChild();
}

void ArchiveList::translateText()
{
    m_actions->translateText();
    // The label of a closed folder stays empty.
    if (m_folderLabel && m_currentPath.isEmpty() && !m_folderLabel->text().isEmpty())
        m_folderLabel->setText(tr("Folder"));
}

// --- Move mode: titles are dragged by their handles to another place ------------------------------------

void ArchiveList::moveButtonClicked(bool isMoveMode)
{
    m_moveMode = isMoveMode;
    if (isMoveMode)
        finishCheck();
    Q_EMIT signalItemsCanDrag(isMoveMode);
    if (!isMoveMode)
        clearOperationItemState(getCurrentOperationArchive());
}

void ArchiveList::itemPressedAndHoldEvent(KSBaseItemWidget* item, QPoint pos, KSScrollViewerWidget*,
                                          bool& willMenuPopup)
{
    if (m_moveMode || !item)
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
    m_draggedItem = qobject_cast<ArchiveItem*>(item);
    clearOperationItemState(getCurrentOperationArchive());
    setOperationItemState(m_draggedItem);
    m_moveSource = index;
    m_moving = true;
}

void ArchiveList::slotItemDrop()
{
    m_moving = false;
    saveArchiveListOrder();
    if (ITitlerFolderReporter* reporter = ITitlerFolderReporter::instance())
        reporter->updateTitlerOrder(m_currentPath);
    ArchiveItem* item = m_draggedItem;
    const int position = getItemIndex(item);
    if (position < 0)
        return;
    m_actions->setOperationPosition(position);
    setOperationItemState(item);
    if (m_moveSource != position)
        Q_EMIT moveCommandSignal(new MoveArchiveCommand(this, item, m_moveSource, position, nullptr));
    m_draggedItem.clear();
}
