// The window's dealings with the folder picker.
#include "app/TitlerWindow.h"

#include "app/EditContextController.h"
#include "app/EditTitlerController.h"
#include "app/ShowMessageController.h"
#include "app/ToolsBar.h"
#include "canvas/CanvasScene.h"
#include "library/ArchiveList.h"
#include "library/FolderPicker.h"
#include "touchui/KSInputContext.h"

void TitlerWindow::connectForFolderPicker()
{
    connect(mFolderPicker, &FolderPicker::clearUndoCommandStack, this, &TitlerWindow::clearUndoStack);
    connect(mFolderPicker, &FolderPicker::signalCancelClicked, this, &TitlerWindow::slotCancelClicked);
    connect(mFolderPicker, &FolderPicker::changeFolderPath, mArchiveList, &ArchiveList::refreshArchiveList);
    connect(mFolderPicker, &FolderPicker::changeFolderFile, mArchiveList,
            &ArchiveList::refreshArchiveListInFile);
    connect(mFolderPicker, &FolderPicker::folderNameChange, mArchiveList,
            &ArchiveList::refreshArchiveListForChangeFolderName);
    connect(mFolderPicker, &FolderPicker::folderMoved, mCanvasScene, &CanvasScene::folderRenamed);
}

void TitlerWindow::connectForFolderNotices()
{
    connect(mEditTitlerController, &EditTitlerController::folderNameChangeFromFileManager, mFolderPicker,
            &FolderPicker::folderNameChanged);
    connect(mEditTitlerController, &EditTitlerController::folderDeleteFromFileManager, mFolderPicker,
            &FolderPicker::slotDeleteFolder);
}

// The buttons as a session begins with them.
void TitlerWindow::initFolderPicker()
{
    mFolderPicker->setDuplicateButtonEnabled(false);
    mFolderPicker->setCreateFolderButtonEnabled(true);
    mFolderPicker->setCancelButtonEnabled(true);
    mFolderPicker->showSoftKeyboard();
}

void TitlerWindow::showFolderDialog()
{
    if (mFolderPicker->isVisible())
        return;
    setOpacityMaskVisible(true);
    mFolderPicker->setWindowModality(Qt::WindowModal);
    mFolderPicker->raise();
    mFolderPicker->activateWindow();
    mFolderPicker->exec();
    setOpacityMaskVisible(false);
}

void TitlerWindow::openFolderDialog()
{
    mArchiveList->stopArchiveListTapAndHoldTimer();
    if (isHidden())
        return;
    m_bFolderDialogFromWindow = true;
    hideSoftWareWithDeleteEmptyItems();
    mCanvasScene->slotMakeSceneThumnail();
    mFolderPicker->setCancelButtonEnabled(!mArchiveList->isEmpty());
    mArchiveList->synchronizationFolderFile();
    clearUndoStack();
    mFolderPicker->updateTreeView();
    markOpenFolder();
    showFolderDialog();
    mToolsBar->setFolderButtonRest();
}

// The folder that is open cannot take a new name in the picker, and renames by others are followed.
void TitlerWindow::markOpenFolder()
{
    mFolderPicker->setCurrentFolderName(
        mArchiveList->getCurrentPath().section(QLatin1Char('/'), -1, -1, QString::SectionSkipEmpty));
}

void TitlerWindow::slotCancelClicked()
{
    if (!m_bFolderDialogFromWindow && m_bRealClose) {
        close();
    } else if (!m_bFolderDialogFromWindow) {
        mFolderPicker->setCurrentFolderName(QString());
        hide();
        if (mInputContext)
            mInputContext->simpleCloseSoftKeyBoardWindow();
    }
    m_bFolderDialogFromWindow = false;
    if (WINDOW_IS_SHOWN)
        return;
    EditContextController::getInstance()->setITitlerNoCallBack();
    if (mShowMessageController)
        mShowMessageController->changeTopWindow(MessageDefine::TOP_WINDOW_MAIN);
    const QString path = mArchiveList->getCurrentPath();
    if (!path.isEmpty() && mEditTitlerController)
        mEditTitlerController->editFolderEndStatus(path);
}
