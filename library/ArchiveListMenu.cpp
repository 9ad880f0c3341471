// What the operator does to titles through the option menu of the list.
#include "canvas/CanvasScene.h"
#include "document/Archive.h"
#include "document/ArchiveController.h"
#include "library/ArchiveItem.h"
#include "library/ArchiveList.h"
#include "library/ArchiveMenu.h"
#include "library/DeleteArchiveCommand.h"
#include "library/IEditContext.h"
#include "library/ListMessages.h"
#include "library/PasteArchiveCommand.h"
#include "library/TitleReports.h"
#include "support/FolderLookup.h"
#include "support/IPathManagerEx.h"
#include "support/LogManager.h"
#include "support/SystemInfo.h"
#include "touchui/ITitlerAPPEventFilterController.h"

#include <QFileInfo>
#include <QLabel>
#include <QWheelEvent>
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

bool ArchiveList::checkArchiveListIsFull()
{
    if (mReadAtOnce < ListMessages::TITLE_LIMIT)
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
    if (mMoveMode != 0)
        return;
    mLongHold = true;
    showOptionMenu(item, pos, scrollArea);
    setFlickAbility(false);
}

void ArchiveList::itemRightPressedEvent(KSBaseItemWidget* item, QPoint pos, KSScrollViewerWidget* scrollArea)
{
    if (mMoveMode == 0)
        showOptionMenu(item, pos, scrollArea);
}

void ArchiveList::createOptionMenu()
{
    if (mMenu)
        return;
    mMenu = std::make_unique<ArchiveMenu>(this);
    connect(mMenu.get(), &QMenu::triggered, this, &ArchiveList::selectOptionMenuItem);
    connect(mMenu.get(), &KSMenu::signalMenuAboutToClose, this, &ArchiveList::slotMenuAboutToClose);
}

void ArchiveList::showOptionMenu(KSBaseItemWidget* pressed, QPoint pos, KSScrollViewerWidget* scrollArea)
{
    createOptionMenu();
    auto* item = qobject_cast<ArchiveItem*>(pressed);
    if (item) {
        mOperationPosition = getItemIndex(item);
        mPressPosition = mOperationPosition;
        clearOperationItemState(mOperationItem);
        setOperationItemState(item);
    } else {
        mOperationPosition = count() - 1;
    }
    mMenu->enableFor(item != nullptr, mCopyArchive != nullptr);
    mMenu->setFont(mMenuFont);

    // In the lower part of the list the menu opens upwards, so that it stays on the screen.
    const QPoint anchor = item ? item->mapToGlobal(pos) : scrollArea->mapToGlobal(pos);
    const QRect upper(QPoint(0, 0), QPoint(width(), 4 * (height() / 7) - 1));
    mMenu->setBalloonAlignment(upper.contains(mapFromGlobal(anchor)) ? MenuPlacement::Below
                                                                     : MenuPlacement::Above);
    mMenu->popup(anchor);
    sendTitlerAppEvent(true);
    Q_EMIT archiveListMenuShow();
}

void ArchiveList::sendTitlerAppEvent(bool open)
{
    if (!mEventController) {
        mEventController = ITitlerAPPEventFilterController::getInstance();
        if (!mEventController)
            return;
        connect(mEventController, &ITitlerAPPEventFilterController::signalRestoreOriginal, this,
                &ArchiveList::slotHideOptionMenu);
    }
    mEventController->sendAPPEvent(APPEventDefine::LOCKTYPE_OBJECT, open);
}

bool ArchiveList::IsOptionMenuShowing() const
{
    return mMenu && mMenu->isVisible();
}

void ArchiveList::slotHideOptionMenu()
{
    if (IsOptionMenuShowing())
        mMenu->close(); // and with it slotMenuAboutToClose
}

void ArchiveList::slotMenuAboutToClose()
{
    sendTitlerAppEvent(false);
    clearOperationItemState(mOperationItem);
}

void ArchiveList::wheelEvent(QWheelEvent* event)
{
    slotHideOptionMenu();
    KSScrollViewerWidget::wheelEvent(event);
}

void ArchiveList::selectOptionMenuItem(QAction* action)
{
    const auto* entry = qobject_cast<ArchiveAction*>(action);
    if (!entry)
        return;
    LOG_USER_OPERATE(L"Thumbnail", 200,
                     logText(entry->getActionType()) + std::to_wstring(mOperationPosition) + L" Thumbnail");
    switch (entry->getActionType()) {
    case ArchiveAction::ACTION_CREATE:
        setOperationItemState(mOperationItem);
        exeCreateArchive();
        break;
    case ArchiveAction::ACTION_COPY:
        exeCopyArchive();
        break;
    case ArchiveAction::ACTION_PASTE:
        exePasteArchive();
        break;
    case ArchiveAction::ACTION_DELETE:
        setOperationItemState(mOperationItem);
        exeDeleteArchive();
        break;
    case ArchiveAction::ACTION_ADD_USER:
        exeAddUserArchive();
        break;
    }
}

void ArchiveList::exeCreateArchive()
{
    if (checkArchiveListIsFull())
        ListMessages::post(MessageDef::MESSAGE_LIST_FULL_ON_CREATE, ListMessages::limitText());
    else if (checkDiskSpaceIsFull())
        ListMessages::post(MessageDef::MESSAGE_DISK_FULL_ON_CREATE, tr("File"));
    else
        Q_EMIT startTemplatePicker();
}

void ArchiveList::createArchiveFromTemplate(Archive* temp)
{
    if (!temp)
        return;
    // The picker also opens over a full list, to show the template that has just been saved.
    if (checkArchiveListIsFull()) {
        ListMessages::post(MessageDef::MESSAGE_LIST_FULL_ON_CREATE, ListMessages::limitText());
        return;
    }
    std::unique_ptr<Archive> archive = mFiles.createFromTemplate(mCurrentPath, *temp);
    if (!archive) {
        if (!mCurrentPath.isEmpty()) // the disk refused
            ListMessages::post(MessageDef::MESSAGE_DISK_FULL_ON_CREATE, tr("File"));
        return;
    }
    IEditContext* context = IEditContext::instance();
    if (mOperationPosition == -1 && context && context->isCreateNew())
        mOperationPosition = count() - 1;
    emitPasteCommand(std::move(archive));
}

void ArchiveList::emitPasteCommand(std::unique_ptr<Archive> archive)
{
    finishCheck();
    mSelectedPosition = getItemIndex(mSelectedItem);
    Archive* record = mItems.own(std::move(archive));
    Q_EMIT pasteCommandSignal(new PasteArchiveCommand(this, record, mOperationPosition, mSelectedPosition));
}

void ArchiveList::clearCopyArchive()
{
    mCopyArchive.reset();
    mCopyPictures = TitlePictures();
    mCopyDecoder = {};
    mCopyBackground.reset();
}

void ArchiveList::decodeCopyBackground()
{
    const QString path = mCopyArchive->getFullPathOfBgResource();
    if (path.isEmpty())
        return;
    mCopyBackground = BackgroundPicture::find(path);
    if (!mCopyBackground)
        mCopyDecoder = std::async(std::launch::async, [path] { return BackgroundPicture::decode(path); });
}

void ArchiveList::exeCopyArchive()
{
    if (!mOperationItem || !mOperationItem->getArchiveData())
        return;
    clearCopyArchive();
    mCopyArchive = std::make_unique<Archive>(*mOperationItem->getArchiveData());
    mCopyPictures = TitleFileOperations::loadPictures(*mCopyArchive);
    decodeCopyBackground();
    setOperationItemState(mOperationItem); // the border stays on
}

void ArchiveList::exePasteArchive()
{
    if (checkArchiveListIsFull()) {
        ListMessages::post(MessageDef::MESSAGE_LIST_FULL_ON_PASTE, ListMessages::limitText());
        return;
    }
    if (checkDiskSpaceIsFull()) {
        ListMessages::post(MessageDef::MESSAGE_DISK_FULL_ON_PASTE);
        return;
    }
    if (!mCopyArchive)
        return;
    std::unique_ptr<Archive> archive = mFiles.createFromCopy(mCurrentPath, *mCopyArchive, mCopyPictures);
    if (!archive) {
        if (!mCurrentPath.isEmpty())
            ListMessages::post(MessageDef::MESSAGE_DISK_FULL_ON_PASTE);
        return;
    }
    if (mCopyDecoder.valid())
        mCopyBackground = BackgroundPicture::load(mCopyDecoder.get());
    emitPasteCommand(std::move(archive));
    Q_EMIT signalStartPasteArchive();
}

void ArchiveList::exeDeleteArchive()
{
    if (!mOperationItem)
        return;
    clearOperationItemState(mOperationItem);
    finishCheck();
    const int position = getItemIndex(mOperationItem);
    if (position < 0)
        return;
    mOperationPosition = position;
    mSelectedPosition = getItemIndex(mSelectedItem);
    Q_EMIT deleteCommandSignal(
        new DeleteArchiveCommand(this, mOperationItem, position, mOperationItem == mSelectedItem));
}

void ArchiveList::exeAddUserArchive()
{
    if (!mOperationItem || !mOperationItem->getArchiveData())
        return;
    const QString root = QString::fromStdWString(FolderLookup::wide(&IPathManagerEx::getTitlerTemplatesPath));
    const QString name = mController->getFreeNameInUserTemplate(root);
    const auto templates = static_cast<int>(mController->getFileOrder(root).size());
    // Without a free name, which can be so from 998 rows on, the template would become a file among the
    // folders.
    if (templates > ListMessages::TEMPLATE_LIMIT || name.isEmpty()) {
        ListMessages::post(MessageDef::MESSAGE_TEMPLATE_LIST_FULL, name);
        return;
    }
    if (checkDiskSpaceIsFull()) {
        ListMessages::post(MessageDef::MESSAGE_DISK_FULL_ON_TEMPLATE, name);
        return;
    }
    if (mSelectedItem && mSelectedItem == mOperationItem)
        waitForCanvas();
    const Archive source(*mOperationItem->getArchiveData());
    const std::unique_ptr<Archive> target = mFiles.createUserTemplate(root, name, source);
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

// The title on the canvas must have been written out before it can be copied. It stays selected, which is not
// a selection of the operator's: nothing is logged and nothing scrolls.
void ArchiveList::waitForCanvas()
{
    setDefaultItemState(mSelectedItem);
    if (mMainScene)
        mMainScene->waitForPictures();
    mSelectedItem->setStyleSheet(ArchiveItem::UN_OPERATE_AND_SELECT_STATE);
    mSelectedItem->setSelected(true);
}

void ArchiveList::setSystemLanFont(QString family)
{
    mMenuFont = QFont(family);
    mMenuFont.setPixelSize(MENU_FONT_SIZE);
    ArchiveItem::setSystemFontFamily(family);
    for (ArchiveItem* item : mItems.all()) // also those that may come back
        item->updateRightChild();
}

void ArchiveList::translateText()
{
    if (mMenu)
        mMenu->translateText();
    // A blank label is one of a folder that was closed.
    if (mFolderLabel && mCurrentPath.isEmpty() && !mFolderLabel->text().isEmpty())
        mFolderLabel->setText(tr("Folder"));
}
