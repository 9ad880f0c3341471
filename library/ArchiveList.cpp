#include "library/ArchiveList.h"

#include "canvas/CanvasScene.h"
#include "canvas/SaveOutage.h"
#include "document/Archive.h"
#include "document/ArchiveController.h"
#include "document/ArchiveOrder.h"
#include "library/ArchiveItem.h"
#include "library/FocusArchiveCommand.h"
#include "library/IEditContext.h"
#include "library/ListMessages.h"
#include "library/MoveArchiveCommand.h"
#include "support/FolderLookup.h"
#include "support/IPathManagerEx.h"
#include "support/LeftoverSweep.h"
#include "support/LogManager.h"
#include "support/SystemInfo.h"

#include <QDir>
#include <QFileInfo>
#include <QLabel>
#include <QWheelEvent>
#include <string>

namespace
{

const int ITEMS_IN_VIEW = 6;    // more items than this make the list scroll to the selection
const int EFFECTIVE_LEFT = 38;  // right of the scroll bar
const int LABEL_FONT_SIZE = 13; // points

// Removes half-written files of killed processes from the title folders, before anything is read.
void sweepTitleFolders()
{
    const std::string root = FolderLookup::multiByte(&IPathManagerEx::getTitleResourcesPath);
    if (!root.empty())
        LeftoverSweep::sweepWithChildren(root);
}

void showName(const ListedFolder& folder, QLabel* label)
{
    if (label)
        label->setText(folder.name());
}

// Makes the list emit what its option menu does.
void relaySignals(const TitleMenuActions& actions, ArchiveList& list)
{
    using Actions = TitleMenuActions;
    using List = ArchiveList;
    QObject::connect(&actions, &Actions::deleteCommandSignal, &list, &List::deleteCommandSignal);
    QObject::connect(&actions, &Actions::pasteCommandSignal, &list, &List::pasteCommandSignal);
    QObject::connect(&actions, &Actions::addUserSignal, &list, &List::addUserSignal);
    QObject::connect(&actions, &Actions::startTemplatePicker, &list, &List::startTemplatePicker);
    QObject::connect(&actions, &Actions::startUserTemplatePicker, &list, &List::startUserTemplatePicker);
    QObject::connect(&actions, &Actions::archiveListMenuShow, &list, &List::archiveListMenuShow);
    QObject::connect(&actions, &Actions::signalStartPasteArchive, &list, &List::signalStartPasteArchive);
    QObject::connect(&actions, &Actions::menuAboutToClose, &list, &List::slotMenuAboutToClose);
}

} // namespace

ArchiveList::ArchiveList(QLabel* folderLabel, bool autoInit, QWidget* parent)
    : KSScrollViewerWidget(parent)
    , m_controller(std::make_unique<ArchiveController>())
    , m_folder(*m_controller)
    , m_titles(*this)
    , m_actions(std::make_unique<TitleMenuActions>(this, m_titles, *m_controller))
    , m_folderLabel(folderLabel)
{
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
    relaySignals(*m_actions, *this);
    SaveOutage::instance(); // the order may be saved from now on
    sweepTitleFolders();
    m_controller->reCreateOrderXml();
    if (autoInit)
        initArchiveList();
}

ArchiveList::~ArchiveList() = default;

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
    connect(&m_titles, &ListedTitles::contentsRequested, this, &ArchiveList::signalAddArchiveData);
    connect(&m_titles, &ListedTitles::unreadableRemoved, m_actions.get(), &TitleMenuActions::rowsRemoved);
    connect(&m_titles, &ListedTitles::unreadableRemoved, this, [this](const QList<int>& rows) {
        m_moveSource = ListedTitles::rowAfterRemoval(m_moveSource, rows);
    });
    connect(&m_loader, &TitleLoader::loaded, this, &ArchiveList::getArchiveListSuccessed);
    connect(this, &ArchiveList::signalAddArchiveData, this, &ArchiveList::slotAddArchiveData,
            Qt::QueuedConnection);
    connect(this, &ArchiveList::signalAddOneArchiveData, this, &ArchiveList::slotAddOneArchiveData,
            Qt::QueuedConnection);
}

void ArchiveList::initArchiveList()
{
    m_folder.setPath(m_folder.lastUsed());
    m_folder.reportStart();
    LOG_DEBUG_OPERATE(L"ArchiveList", 200,
                      L"ArchiveList_initArchiveList() Path:" + m_folder.path().toStdWString());
    initArchiveListData();
}

void ArchiveList::initArchiveListData()
{
    if (!m_folder.isOpen())
        return;
    showName(m_folder, m_folderLabel);
    m_loader.end();
    m_folder.prepareOrder();
    m_loader.load(m_folder.path());
}

void ArchiveList::getArchiveListSuccessed(QList<Archive*> archivesList)
{
    m_titles.clear();
    m_titles.add(archivesList);
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
    showName(m_folder, m_folderLabel);
    m_folder.prepareOrder();
    m_titles.add(m_folder.path());
    m_folder.reportStart();
}

void ArchiveList::slotAddArchiveData()
{
    for (ArchiveItem* item : m_titles.beginToComplete())
        Q_EMIT signalAddOneArchiveData(item);
}

void ArchiveList::slotAddOneArchiveData(ArchiveItem* item)
{
    m_titles.complete(item);
}

int ArchiveList::getItemIndex(ArchiveItem* item) const
{
    return getIndexOfWidgetItem(item);
}

void ArchiveList::selectArchive(int index)
{
    ArchiveItem* item = m_titles.readableItem(index);
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
    m_folder.lock();
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

void ArchiveList::saveArchiveListOrder()
{
    const QList<ArchiveOrder*> order = m_titles.order();
    m_folder.saveOrder(order, m_titles.fileNames());
    qDeleteAll(order);
}

void ArchiveList::refreshBaseItem(QString archiveFilePath, QImage leftImage)
{
    LOG_DEBUG_OPERATE(L"ArchiveList", 200, L"refreshBaseItem " + archiveFilePath.toStdWString());
    ArchiveItem* item = m_titles.findItem(archiveFilePath);
    if (!item)
        return;
    Archive archive;
    if (m_controller->getOneArchive(archiveFilePath, &archive))
        item->updateArchiveData(&archive);
    item->updateContents(leftImage);
}

// Ends what the operator does with the titles, which are no longer listed.
void ArchiveList::clearOldArchiveList()
{
    m_titles.clear();
    m_selection = TitleSelection();
    m_actions->setOperationPosition(-1);
    m_draggedItem.clear();
    m_moveSource = -1;
    m_moving = false;
    m_longHold = false;
}

void ArchiveList::cleanArchiveList()
{
    m_loader.end();
    clearOldArchiveList();
    m_folder.close();
    if (m_folderLabel)
        m_folderLabel->clear();
}

void ArchiveList::synchronizationFolderFile()
{
    if (!m_folder.isOpen())
        return;
    if (!isEmpty() && m_folder.isOrderDamaged())
        saveArchiveListOrder();
    m_folder.removeUnlisted();
}

// --- Opening folders ------------------------------------------------------------------------------------

void ArchiveList::openFolder(const QString& path)
{
    m_loader.end();
    m_controller->setLastFolderPath(path);
    setDefaultItemState(getSelectedArchive());
    clearOperationItemState(getCurrentOperationArchive());
    m_folder.reportEnd();
    m_folder.setPath(path);
    clearOldArchiveList();
    initArchiveListRefreshData();
}

void ArchiveList::refreshArchiveList(QString path)
{
    openFolder(path);
    m_titles.requestContents();
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
    m_titles.requestContents();

    const bool isFound = selectTitle(path + QLatin1Char('/') + fileName);
    if (IEditContext::isCreateNewNow()) {
        if (checkArchiveListIsFull())
            ListMessages::post(MessageDef::MESSAGE_LIST_FULL_ON_CREATE, ListMessages::limitText());
        else
            Q_EMIT startTemplatePicker();
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
    const int index = m_titles.find(path);
    if (index < 0 || !m_titles.isReadable(index))
        return false;
    selectArchive(index);
    return true;
}

void ArchiveList::refreshArchiveListForChangeFolderName(QString before, QString after)
{
    LOG_DEBUG_OPERATE(L"ArchiveList", 200,
                      L"ArchiveList_refreshArchiveListForChangeFolderName() Enter Before:" +
                          before.toStdWString() + L" After:" + after.toStdWString());
    if (QDir::cleanPath(before) !=
        QDir::cleanPath(m_folder.path())) // the path in a request may end with a "/"
        return;
    m_loader.end();
    m_controller->setLastFolderPath(after);
    if (m_mainScene)
        m_mainScene->folderRenamed(before, after);
    const int selected = getItemIndex(getSelectedArchive());
    const QString fileName = QFileInfo(titlePath(selected)).fileName();
    setDefaultItemState(getSelectedArchive());
    m_folder.setPath(after);
    clearOldArchiveList();
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

bool ArchiveList::checkDiskSpaceIsFull() const
{
    return SystemInfo::getInstance()->getDiskRemainSize(m_folder.path().toStdWString()) <
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

void ArchiveList::setMainScene(CanvasScene* mainScene)
{
    m_mainScene = mainScene;
    m_actions->setMainScene(mainScene);
}

void ArchiveList::setSystemLanFont(QString family)
{
    m_actions->setMenuFont(family);
    ArchiveItem::setSystemFontFamily(family);
    for (ArchiveItem* item : m_titles.items()) // includes items that are not listed and may return
        item->updateRightChild();
}

void ArchiveList::translateText()
{
    m_actions->translateText();
    // The label of a closed folder stays empty.
    if (m_folderLabel && !m_folder.isOpen() && !m_folderLabel->text().isEmpty())
        m_folderLabel->setText(tr("Folder"));
}

// --- Move mode: titles are dragged by their handles to another place ------------------------------------

void ArchiveList::moveButtonClicked(bool isMoveMode)
{
    m_moveMode = isMoveMode;
    if (isMoveMode)
        m_titles.finishCheck();
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
    m_draggedItem = HeldArchiveItem(qobject_cast<ArchiveItem*>(item));
    clearOperationItemState(getCurrentOperationArchive());
    setOperationItemState(m_draggedItem);
    m_moveSource = index;
    m_moving = true;
}

void ArchiveList::slotItemDrop()
{
    m_moving = false;
    saveArchiveListOrder();
    m_folder.reportOrder();
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
