// Requests, closing and undo of the window.
#include "app/TitlerWindow.h"

#include "app/EditContextController.h"
#include "app/EditTitlerController.h"
#include "app/LossDescription.h"
#include "app/SavingNotice.h"
#include "app/ShowMessageController.h"
#include "app/SystemSetupInfoController.h"
#include "app/ToolsBar.h"
#include "canvas/CanvasScene.h"
#include "canvas/GraphicsView.h"
#include "canvas/SaveOutage.h"
#include "library/ArchiveList.h"
#include "library/FolderPicker.h"
#include "library/TemplatePicker.h"
#include "panel/TextToolsPanel.h"
#include "support/ConfinedPath.h"
#include "support/FileSyncQueue.h"
#include "support/IPathManagerEx.h"
#include "support/LogManager.h"
#include "support/RefusedWrites.h"
#include "touchui/KSInputContext.h"

#include <QAction>
#include <QApplication>
#include <QCloseEvent>
#include <QFileInfo>
#include <QTimer>
#include <QUndoCommand>
#include <algorithm>
#include <string>
#include <utility>
#include <vector>

namespace
{

constexpr int SYNC_DEADLINE = 10000; // ms
constexpr std::size_t MOST_LOGGED = 20;
constexpr int LOG_NUMBER = 400;
constexpr int FOCUS_COMMAND_ID = 1;
constexpr int CANVAS_CHECKER = 2;

bool isBelowTitles(const QString& path)
{
    return ConfinedPath::isBelow(&IPathManagerEx::getTitleResourcesPath, path.toStdString());
}

void logPath(const char* what, const std::string& path)
{
    LOG_DEBUG_OPERATE(L"TitlerWindow", LOG_NUMBER,
                      (QString::fromLatin1(what) + QString::fromStdString(path)).toStdWString());
}

} // namespace

void TitlerWindow::showTitlerWindow(titler_paramter paramter)
{
    if (!isHidden())
        return;
    mQuestion = Question::None;
    show();
    activateWindow();
    raise();
    if (mShowMessageController) {
        mShowMessageController->changeTopWindow(MessageDefine::TOP_WINDOW_TITLER);
        mShowMessageController->setMessageMainWindow(this);
    }
    mCanvasScene->setModuleInfo(m_emModuleInfo);
    mTextToolsPanel->setModuleInfo(m_emModuleInfo);
    mTextToolsPanel->initTextToolsPanel();
    mTemplatePicker->setModuleInfo(m_emModuleInfo);

    mToolsBar->setFolderButtonEnabled(true);
    initFolderPicker();
    m_bEditByMain = paramter.mode == _titler_paramter::CREATE_OR_EDIT;
    if (paramter.mode == _titler_paramter::CREATE_OR_EDIT) {
        mToolsBar->setFolderButtonEnabled(false);
        mFolderPicker->setDuplicateButtonEnabled(false);
        mFolderPicker->setCreateFolderButtonEnabled(false);
        refreshArchiveList(QString::fromStdWString(paramter.path));
    } else if (paramter.mode == _titler_paramter::SUB_PANEL) {
        EditContextController::getInstance()->setITitlerNoCallBack();
        mFolderPicker->updateTreeView();
        showFolderDialog();
    }

    if (m_bHasMessage) {
        m_bHasMessage = false;
        if (mShowMessageController)
            mShowMessageController->postMessage(MessageDef::MESSAGE_FONT_MISSING, m_strMessage);
    }
    if (mSystemSetupInfoController)
        mSystemSetupInfoController->getInputLanguage();
    changeFontComboxItem(m_emModuleInfo);
}

void TitlerWindow::refreshArchiveList(QString path)
{
    if (path.isEmpty()) {
        mFolderPicker->updateTreeView();
        showFolderDialog();
        return;
    }
    const QFileInfo info(path);
    const qsizetype slash = path.lastIndexOf(QLatin1Char('/'));
    if (!info.exists())
        hide();
    else if (!isBelowTitles(path) || (!info.isDir() && !isBelowTitles(path.left(slash))))
        refuseRequest(path);
    else if (info.isDir())
        mArchiveList->refreshArchiveList(path);
    else
        mArchiveList->refreshArchiveListInFile(path.left(slash), path.mid(slash + 1));
    markOpenFolder();
}

// As for a path that does not exist: what lies there is not ours to change or to clean up.
void TitlerWindow::refuseRequest(const QString& path)
{
    ConfinedPath::logRefusal(L"a request asks for what lies outside: ", path.toStdString());
    hide();
}

void TitlerWindow::closeTitlerWindow()
{
    mArchiveList->stopArchiveListTapAndHoldTimer();
    if (archiveListIsMoveMode())
        slotCancelArchiveListMoveMode(); // what is being dragged gets its place while the folder is open
    mArchiveList->slotHideOptionMenu();
    const QString path = mArchiveList->getCurrentPath();
    saveCurrentTitle();
    clearUndoStack();
    mTextToolsPanel->setSignalValue(false);
    mArchiveList->synchronizationFolderFile();
    mTextToolsPanel->initTextToolsPanel();
    if (!path.isEmpty() && mEditTitlerController)
        mEditTitlerController->editFolderEndStatus(path);
    mToolsBar->resetToDefaultState();
    resetCanvasBackground();
    waitUntilSaved();
    if (asksAboutUnsavedWork())
        return;

    if (m_bEditByMain && EditContextController::getInstance()->isMainNeedMsg()) {
        if (mShowMessageController)
            mShowMessageController->postMessage(MessageDef::MESSAGE_CONFIRM_CLOSE);
        EditContextController::getInstance()->setITitlerNoCallBack();
        return;
    }
    closeTitlerMainWindow();
}

void TitlerWindow::resetCanvasBackground()
{
    QAction checker(nullptr);
    checker.setData(CANVAS_CHECKER);
    mCanvasScene->slotShowCanvasBG(&checker);
}

void TitlerWindow::closeTitlerMainWindow()
{
    const QString path = mArchiveList->getCurrentPath();
    if (m_bRealClose) {
        close();
    } else {
        mTemplatePicker->reject(); // an answered message may come while it is open
        mFolderPicker->setCurrentFolderName(QString());
        mToolsBar->hideCanvasMenu(); // a window of its own
        hide();
        mCanvasScene->clearCanvas();
        mArchiveList->cleanArchiveList();
        mArchiveList->clearCopyArchive();
    }
    m_bFolderDialogFromWindow = false;
    if (mInputContext)
        mInputContext->simpleCloseSoftKeyBoardWindow();
    EditContextController::getInstance()->sentITitlerCallBack(path.toStdWString());
    EditContextController::getInstance()->setITitlerNoCallBack();
    if (mShowMessageController)
        mShowMessageController->changeTopWindow(MessageDefine::TOP_WINDOW_MAIN);
    // All files are in their place; the disk may take longer, but nobody waits for it.
    QTimer::singleShot(SYNC_DEADLINE, this, &TitlerWindow::logUnsynced);
}

// Whether work is in memory only: then the operator is asked, and the answer goes on from here.
bool TitlerWindow::asksAboutUnsavedWork()
{
    mQuestion = Question::None;
    for (const RefusedWrites::File& file : RefusedWrites::forgetVanished())
        logPath("gone with its folder: ", file.path);
    if (SaveOutage::instance()->retry() || !mShowMessageController)
        return false;
    mQuestion = Question::LoseUnsavedWork;
    mShowMessageController->postMessage(MessageDef::MESSAGE_CONFIRM_CLOSE,
                                        LossDescription::of(RefusedWrites::files()));
    return true;
}

void TitlerWindow::giveUpUnsavedWork()
{
    if (SaveOutage::instance()->retry())
        return;
    for (const RefusedWrites::File& file : RefusedWrites::files()) {
        logPath("lost, not saved: ", file.path);
        RefusedWrites::forget(file.path);
    }
    SaveOutage::instance()->retry(); // which ends it
}

void TitlerWindow::logUnsynced()
{
    const std::vector<std::string> paths = FileSyncQueue::unsynced();
    for (std::size_t i = 0; i < std::min(paths.size(), MOST_LOGGED); ++i)
        logPath("not yet on the disk: ", paths[i]);
    if (paths.size() > MOST_LOGGED)
        logPath("not yet on the disk, more files: ", std::to_string(paths.size() - MOST_LOGGED));
}

void TitlerWindow::continueCloseTitler(MessageDefine::tagCloseParam param)
{
    if (isHidden() || param.messageId != MessageDef::MESSAGE_CONFIRM_CLOSE)
        return;
    if (std::exchange(mQuestion, Question::None) == Question::LoseUnsavedWork) {
        if (param.closeType != MessageDefine::CLOSE_OK) {
            // The session goes on; the folder was already given free.
            const QString path = mArchiveList->getCurrentPath();
            if (!path.isEmpty() && mEditTitlerController)
                mEditTitlerController->editFolderStartStatus(path);
            return;
        }
        giveUpUnsavedWork();
    }
    closeTitlerMainWindow();
}

void TitlerWindow::setRealClose(bool realClose)
{
    m_bRealClose = realClose;
}

bool TitlerWindow::dataSaveIsFinished()
{
    return mCanvasScene->isEditFinish();
}

void TitlerWindow::waitUntilSaved()
{
    if (!dataSaveIsFinished()) {
        if (isVisible())
            mSavingNotice->showAtOnce();
        if (!mCanvasScene->waitForPictures())
            logPath("pictures are still being written", {});
        mSavingNotice->hide();
    }
    // The thread that writes the pictures reports them by way of this thread's events. Siblings hear of them
    // before they hear of what follows, and before the process is gone.
    if (mEditTitlerController)
        QCoreApplication::sendPostedEvents(mEditTitlerController, QEvent::MetaCall);
}

void TitlerWindow::saveCurrentTitle()
{
    mGraphicsView->cancelTouch(); // an object that is being dragged is saved at its old place
    mCanvasScene->leaveTitle();
}

void TitlerWindow::slotPowerOff()
{
    endProcess();
}

void TitlerWindow::endProcess()
{
    if (m_bEnding)
        return;
    m_bEnding = true;
    mFolderPicker->done(QDialog::Rejected); // a dialog with no Cancel would refuse the end
    saveCurrentTitle();
    waitUntilSaved();
    giveUpUnsavedWork();
    if (mInputContext && !KSInputContext::isSoftKeyboardClosed())
        mInputContext->simpleCloseSoftKeyBoardWindow(); // it would stay up without this process
    close();
    QApplication::closeAllWindows();
    QCoreApplication::quit();
}

// A window manager's close is the operator's Close: the process lives on.
void TitlerWindow::closeEvent(QCloseEvent* event)
{
    if (m_bRealClose || m_bEnding) {
        QMainWindow::closeEvent(event);
        QCoreApplication::quit();
        return;
    }
    event->ignore();
    closeTitlerWindow();
}

// A change of the selected title at a clean stack leaves the stack clean.
void TitlerWindow::pushUndoStack(QUndoCommand* subUndoCommand)
{
    if (mUndoStack.isClean() && subUndoCommand->id() == FOCUS_COMMAND_ID) {
        delete subUndoCommand;
        return;
    }
    mUndoStack.push(subUndoCommand);
}

void TitlerWindow::clearUndoStack()
{
    mUndoStack.clear();
    if (ArchiveItem* item = mArchiveList->getCurrentOperationArchive())
        mArchiveList->clearOperationItemState(item);
}

void TitlerWindow::slotStartPasteArchive()
{
    mCanvasScene->createThumnailPicture();
}

void TitlerWindow::slotNewTextButtonClicked()
{
    mCanvasScene->slotInsertNewTextItem();
}

void TitlerWindow::pressDelectButton()
{
    mCanvasScene->deleteSelectedItems();
    if (mInputContext)
        mInputContext->dummyCloseSoftKeyBoardWindow();
}

// The checker shows the window's own picture behind the canvas.
void TitlerWindow::slotCanvasButtonClicked(QAction*)
{
    update();
}

void TitlerWindow::setHasMessageToShowInformation(bool isNeedShow, QString defaultFont)
{
    m_bHasMessage = isNeedShow;
    m_strMessage = std::move(defaultFont);
}

void TitlerWindow::listWidgetReleasedEvent(KSBaseItemWidget*, QPoint, KSScrollViewerWidget*)
{
    hideSoftWareWithOutDeleteEmptyItems();
}

void TitlerWindow::hideSoftWareWithDeleteEmptyItems()
{
    leaveTextEditing(true);
}

void TitlerWindow::hideSoftWareWithOutDeleteEmptyItems()
{
    leaveTextEditing(false);
}

void TitlerWindow::leaveTextEditing(bool deleteEmptyItems)
{
    const bool isEditing = mCanvasScene->itemIsEditorInteraction();
    if (isEditing || mCanvasScene->itemIsSelectionMode()) {
        if (isEditing)
            mCanvasScene->clearItemsSelectionAndFocus();
        else
            mCanvasScene->clearItemsSelectionMode();
        if (deleteEmptyItems)
            slotDeleteEmptyItems();
        mCanvasScene->disableTextPropertyArea();
        if (isEditing && deleteEmptyItems)
            LOG_DEBUG_OPERATE(L"TitlerWindow", 200, L"hideSoftWareWithDeleteEmptyItems");
    }
    if (mInputContext)
        mInputContext->dummyCloseSoftKeyBoardWindow();
}
