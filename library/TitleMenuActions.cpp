#include "library/TitleMenuActions.h"

#include "canvas/CanvasScene.h"
#include "document/Archive.h"
#include "document/ArchiveController.h"
#include "library/ArchiveItem.h"
#include "library/ArchiveList.h"
#include "library/ArchiveMenu.h"
#include "library/DeleteArchiveCommand.h"
#include "library/IEditContext.h"
#include "library/ListMessages.h"
#include "library/ListedTitles.h"
#include "library/PasteArchiveCommand.h"
#include "library/TitleReports.h"
#include "library/TitleSelection.h"
#include "support/FolderLookup.h"
#include "support/IPathManagerEx.h"
#include "support/LogManager.h"
#include "touchui/ITitlerAPPEventFilterController.h"

#include <QFileInfo>
#include <string>
#include <utility>

namespace
{

std::wstring logText(ArchiveAction::ARCHIVE_ACTION_TYPE type)
{
    switch (type) {
    case ArchiveAction::ACTION_CREATE:
        return L"Select  Create New in the ";
    case ArchiveAction::ACTION_COPY:
        return L"Select Copy in the ";
    case ArchiveAction::ACTION_PASTE:
        return L"Select Paste in the ";
    case ArchiveAction::ACTION_DELETE:
        return L"Select Delete in the ";
    case ArchiveAction::ACTION_ADD_USER:
        return L"Select Add User in the ";
    }
    return {};
}

} // namespace

TitleMenuActions::TitleMenuActions(ArchiveList* list, ListedTitles& titles, ArchiveController& controller)
    : m_list(list), m_titles(titles), m_controller(controller), m_files(controller)
{
    setMenuFont(QStringLiteral("KST"));
}

TitleMenuActions::~TitleMenuActions() = default;

// --- The menu -------------------------------------------------------------------------------------------

void TitleMenuActions::createOptionMenu()
{
    if (m_menu)
        return;
    m_menu = std::make_unique<ArchiveMenu>(m_list);
    connect(m_menu.get(), &QMenu::triggered, this, &TitleMenuActions::selectOptionMenuItem);
    connect(m_menu.get(), &KSMenu::signalMenuAboutToClose, this, &TitleMenuActions::menuAboutToClose);
}

void TitleMenuActions::showOptionMenu(ArchiveItem* item, const QPoint& pos, QWidget* area)
{
    createOptionMenu();
    if (item) {
        m_operationPosition = m_list->getItemIndex(item);
        m_list->clearOperationItemState(m_list->getCurrentOperationArchive());
        m_list->setOperationItemState(item);
    } else {
        m_operationPosition = m_list->count() - 1;
    }
    m_menu->enableFor(item != nullptr, !m_clipboard.isEmpty());
    m_menu->setFont(m_menuFont);

    // In the lower part of the list the menu opens upwards, so that it fits on the screen.
    const QPoint anchor = item ? item->mapToGlobal(pos) : area->mapToGlobal(pos);
    const QRect upper(QPoint(0, 0), QPoint(m_list->width(), 4 * (m_list->height() / 7) - 1));
    m_menu->setBalloonAlignment(upper.contains(m_list->mapFromGlobal(anchor)) ? MenuPlacement::Below
                                                                              : MenuPlacement::Above);
    m_menu->popup(anchor);
    sendTitlerAppEvent(true);
    Q_EMIT archiveListMenuShow();
}

void TitleMenuActions::setMenuFont(const QString& family)
{
    m_menuFont = QFont(family);
    m_menuFont.setPixelSize(MENU_FONT_SIZE);
}

void TitleMenuActions::sendTitlerAppEvent(bool open)
{
    if (!m_eventController) {
        m_eventController = ITitlerAPPEventFilterController::getInstance();
        if (!m_eventController)
            return;
        connect(m_eventController, &ITitlerAPPEventFilterController::signalRestoreOriginal, this,
                &TitleMenuActions::hideMenu);
    }
    m_eventController->sendAPPEvent(APPEventDefine::LOCKTYPE_OBJECT, open);
}

bool TitleMenuActions::isMenuShowing() const
{
    return m_menu && m_menu->isVisible();
}

void TitleMenuActions::hideMenu()
{
    if (isMenuShowing())
        m_menu->close(); // also emits menuAboutToClose()
}

void TitleMenuActions::translateText()
{
    if (m_menu)
        m_menu->translateText();
}

void TitleMenuActions::rowsRemoved(const QList<int>& rows)
{
    m_operationPosition = ListedTitles::rowAfterRemoval(m_operationPosition, rows);
}

// --- What its entries do --------------------------------------------------------------------------------

void TitleMenuActions::selectOptionMenuItem(QAction* action)
{
    const auto* entry = qobject_cast<ArchiveAction*>(action);
    if (!entry)
        return;
    LOG_USER_OPERATE(L"Thumbnail", 200,
                     logText(entry->getActionType()) + std::to_wstring(m_operationPosition) + L" Thumbnail");
    switch (entry->getActionType()) {
    case ArchiveAction::ACTION_CREATE:
        m_list->setOperationItemState(m_list->getCurrentOperationArchive());
        exeCreateArchive();
        break;
    case ArchiveAction::ACTION_COPY:
        exeCopyArchive();
        break;
    case ArchiveAction::ACTION_PASTE:
        exePasteArchive();
        break;
    case ArchiveAction::ACTION_DELETE:
        m_list->setOperationItemState(m_list->getCurrentOperationArchive());
        exeDeleteArchive();
        break;
    case ArchiveAction::ACTION_ADD_USER:
        exeAddUserArchive();
        break;
    }
}

void TitleMenuActions::exeCreateArchive()
{
    if (m_list->checkArchiveListIsFull())
        ListMessages::post(MessageDef::MESSAGE_LIST_FULL_ON_CREATE, ListMessages::limitText());
    else if (m_list->checkDiskSpaceIsFull())
        ListMessages::post(MessageDef::MESSAGE_DISK_FULL_ON_CREATE, ArchiveList::tr("File"));
    else
        Q_EMIT startTemplatePicker();
}

void TitleMenuActions::createArchiveFromTemplate(Archive* temp)
{
    if (!temp)
        return;
    // The picker can also be opened while the list is full, to show the template that was just saved.
    if (m_list->checkArchiveListIsFull()) {
        ListMessages::post(MessageDef::MESSAGE_LIST_FULL_ON_CREATE, ListMessages::limitText());
        return;
    }
    std::unique_ptr<Archive> archive = m_files.createFromTemplate(m_list->getCurrentPath(), *temp);
    if (!archive) {
        if (!m_list->getCurrentPath().isEmpty()) // the disk refused the files
            ListMessages::post(MessageDef::MESSAGE_DISK_FULL_ON_CREATE, ArchiveList::tr("File"));
        return;
    }
    if (m_operationPosition == -1 && IEditContext::isCreateNewNow())
        m_operationPosition = m_list->count() - 1;
    emitPasteCommand(std::move(archive));
}

void TitleMenuActions::emitPasteCommand(std::unique_ptr<Archive> archive)
{
    m_titles.finishCheck();
    const int selected = m_list->getItemIndex(m_list->getSelectedArchive());
    Archive* record = m_titles.own(std::move(archive));
    Q_EMIT pasteCommandSignal(new PasteArchiveCommand(m_list, record, m_operationPosition, selected));
}

void TitleMenuActions::exeCopyArchive()
{
    ArchiveItem* item = m_list->getCurrentOperationArchive();
    if (!item || !item->getArchiveData())
        return;
    m_clipboard.copy(*item->getArchiveData());
    m_list->setOperationItemState(item); // the border stays
}

void TitleMenuActions::exePasteArchive()
{
    if (m_list->checkArchiveListIsFull()) {
        ListMessages::post(MessageDef::MESSAGE_LIST_FULL_ON_PASTE, ListMessages::limitText());
        return;
    }
    if (m_list->checkDiskSpaceIsFull()) {
        ListMessages::post(MessageDef::MESSAGE_DISK_FULL_ON_PASTE);
        return;
    }
    if (m_clipboard.isEmpty())
        return;
    const QString folder = m_list->getCurrentPath();
    std::unique_ptr<Archive> archive = m_clipboard.paste(m_files, folder);
    if (!archive) {
        if (!folder.isEmpty())
            ListMessages::post(MessageDef::MESSAGE_DISK_FULL_ON_PASTE);
        return;
    }
    emitPasteCommand(std::move(archive));
    Q_EMIT signalStartPasteArchive();
}

void TitleMenuActions::exeDeleteArchive()
{
    ArchiveItem* item = m_list->getCurrentOperationArchive();
    if (!item)
        return;
    m_list->clearOperationItemState(item);
    m_titles.finishCheck();
    // The check may have removed the title.
    item = m_list->getCurrentOperationArchive();
    const int position = m_list->getItemIndex(item);
    if (position < 0)
        return;
    m_operationPosition = position;
    Q_EMIT deleteCommandSignal(
        new DeleteArchiveCommand(m_list, item, position, item == m_list->getSelectedArchive()));
}

// Blocks until the pictures of the selected title are written. The canvas makes them when the title is
// deselected, so that is done for a moment. This is not a selection by the operator: nothing is logged and
// the list does not scroll.
void TitleMenuActions::waitForCanvas()
{
    m_list->setDefaultItemState(m_list->getSelectedArchive());
    if (m_scene)
        m_scene->waitForPictures();
    TitleSelection::showSelected(m_list->getSelectedArchive());
}

void TitleMenuActions::exeAddUserArchive()
{
    const ArchiveItem* item = m_list->getCurrentOperationArchive();
    if (!item || !item->getArchiveData())
        return;
    const QString root = QString::fromStdWString(FolderLookup::wide(&IPathManagerEx::getTitlerTemplatesPath));
    const QString name = m_controller.getFreeNameInUserTemplate(root);
    const auto templates = static_cast<int>(m_controller.getFileOrder(root).size());
    // Without a free name the template would be saved in the root folder itself. There may be none from 998
    // rows on.
    if (templates > ListMessages::TEMPLATE_LIMIT || name.isEmpty()) {
        ListMessages::post(MessageDef::MESSAGE_TEMPLATE_LIST_FULL, name);
        return;
    }
    if (m_list->checkDiskSpaceIsFull()) {
        ListMessages::post(MessageDef::MESSAGE_DISK_FULL_ON_TEMPLATE, name);
        return;
    }
    if (item == m_list->getSelectedArchive())
        waitForCanvas();
    const Archive source(*item->getArchiveData());
    const std::unique_ptr<Archive> target = m_files.createUserTemplate(root, name, source);
    if (!target) {
        if (!root.isEmpty())
            ListMessages::post(MessageDef::MESSAGE_DISK_FULL_ON_TEMPLATE, name);
        return;
    }
    TitleReports::titleChanged(FileManagerDefine::TITLE_TEMPLATE_ADDED,
                               QFileInfo(QString::fromStdString(target->getPath())).path());
    Q_EMIT addUserSignal(QFileInfo(QString::fromStdString(target->getName())).path());
    Q_EMIT startUserTemplatePicker();
}
