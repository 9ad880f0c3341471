// All connections between the objects that the window owns, and to the controllers. No object of canvas,
// panel or library connects itself to another one.
#include "app/TitlerWindow.h"

#include "app/EditContextController.h"
#include "app/EditTitlerController.h"
#include "app/MoveMode.h"
#include "app/ShowMessageController.h"
#include "app/ShowTitlerController.h"
#include "app/SiblingLinks.h"
#include "app/SystemSetupInfoController.h"
#include "app/TitlerAPPEventFilterController.h"
#include "app/TitlerPowerController.h"
#include "app/ToolsBar.h"
#include "canvas/CanvasScene.h"
#include "library/ArchiveItem.h"
#include "library/ArchiveList.h"
#include "library/FolderPicker.h"
#include "library/TemplatePicker.h"
#include "panel/TextToolsPanel.h"
#include "touchui/KSPushbutton.h"

void TitlerWindow::connectWidget()
{
    connectForToolsBar();
    connectForMainScene();
    connectForTextToolsAndArchiveList();
    connectForTextToolsPanel();
    connect(mArchiveList, &ArchiveList::signalStartPasteArchive, this, &TitlerWindow::slotStartPasteArchive);
    connect(this, &TitlerWindow::moveButtonClicked, mArchiveList, &ArchiveList::moveButtonClicked);
    connectForTemplates();
    connectForFolderPicker();
    connectForUndoRedoCommand();
}

void TitlerWindow::connectForToolsBar()
{
    connect(mToolsBar, &ToolsBar::closeButtonClick, this, &TitlerWindow::closeTitlerWindow);
    connect(mToolsBar, &ToolsBar::folderButtonClick, this, &TitlerWindow::openFolderDialog);
    connect(mToolsBar, &ToolsBar::redoButtonClicked, this,
            &TitlerWindow::hideSoftWareWithOutDeleteEmptyItems);
    connect(mToolsBar, &ToolsBar::undoButtonClicked, this,
            &TitlerWindow::hideSoftWareWithOutDeleteEmptyItems);
    connect(mToolsBar, &ToolsBar::canvasButtonClicked, this, &TitlerWindow::slotCanvasButtonClicked);
    connect(mToolsBar, &ToolsBar::newTextButtonClick, this, &TitlerWindow::slotNewTextButtonClicked);
    connect(mToolsBar, &ToolsBar::deleteButtonClick, this, &TitlerWindow::pressDelectButton);
    connect(mToolsBar, &ToolsBar::SafeAreaButtonClickedForDrawRect, mCanvasScene,
            &CanvasScene::slotDrawSafeArea);
    connect(mToolsBar, &ToolsBar::canvasButtonClicked, mCanvasScene, &CanvasScene::slotShowCanvasBG);
}

void TitlerWindow::connectForMainScene()
{
    connect(mCanvasScene, &CanvasScene::signalTextInserted, mToolsBar, &ToolsBar::setInsertUnchecked);
    connect(mCanvasScene, &CanvasScene::signalSceneNotifyIfExistSelectedObject, mToolsBar,
            &ToolsBar::changeBtnStatus);
    connect(mCanvasScene, &CanvasScene::signalDisableNewTextButton, mToolsBar,
            &ToolsBar::slotDisableNewTextButton);
    connect(mCanvasScene, &CanvasScene::signalCanvasSceneMousePressed, mToolsBar,
            &ToolsBar::slotlCanvasSceneMousePressed);
    connect(mToolsBar, &ToolsBar::signalShowCanvasMenu, this, &TitlerWindow::slotShowCanvasMenu);
    connect(mCanvasScene, &CanvasScene::signalHasMessageToShowInformation, this,
            &TitlerWindow::setHasMessageToShowInformation);
    connect(mCanvasScene, &CanvasScene::signalNewTextInsertedFailed, this,
            &TitlerWindow::hideSoftWareWithDeleteEmptyItems);
    connect(mCanvasScene, &CanvasScene::signalSaveOk, mArchiveList, &ArchiveList::refreshBaseItem);
    connect(mCanvasScene, &CanvasScene::signalStartEditTextItem, mArchiveList,
            &ArchiveList::moveCurrentArchiveItemVisble);
}

void TitlerWindow::connectForTextToolsAndArchiveList()
{
    connect(mArchiveList, &ArchiveList::signalUpdateCanvas, mCanvasScene, &CanvasScene::slotUpdateArchive);
    connect(mArchiveList, &ArchiveList::itemSetDefaultState, mCanvasScene,
            &CanvasScene::slotMakeSceneThumnail);
    connect(mArchiveList, &ArchiveList::startTemplatePicker, this, &TitlerWindow::showTemplateDialog);
    connect(mArchiveList, &ArchiveList::startUserTemplatePicker, this,
            &TitlerWindow::showTemplateDialogOnUser);
    connect(mArchiveList, &ArchiveList::cleanUndoStack, this, &TitlerWindow::clearUndoStack);
    connect(mArchiveList, &ArchiveList::archiveListMenuShow, this,
            &TitlerWindow::hideSoftWareWithDeleteEmptyItems);
    connect(mArchiveList, &ArchiveList::widgetItemReleased, this, &TitlerWindow::listWidgetReleasedEvent);
    connect(mMoveMode->button(), &QPushButton::clicked, this,
            &TitlerWindow::hideSoftWareWithDeleteEmptyItems);
}

void TitlerWindow::connectForTextToolsPanel()
{
    // The selection is shown in the panel.
    connect(mCanvasScene, &CanvasScene::signalSceneNotifyIfExistSelectedObject, mTextToolsPanel,
            &TextToolsPanel::changeFontPropertyBtnStatus);
    connect(mCanvasScene, &CanvasScene::signalNotifyPropertyAreaUpdateCurrentTextStyle, mTextToolsPanel,
            &TextToolsPanel::updateTextStyle);
    connect(mCanvasScene, &CanvasScene::signalSceneNotifyTextPropertyAreaObjectSelectionMode, mTextToolsPanel,
            &TextToolsPanel::selectionModeForShadowAndAlign);
    connect(mCanvasScene, &CanvasScene::signalBeginNewTextItem, mTextToolsPanel,
            &TextToolsPanel::slotBeginNewTextItem);
    connect(mCanvasScene, &CanvasScene::signalSceneSoftWareClosedWhenEditObject, mTextToolsPanel,
            &TextToolsPanel::slotHideColorPaletteWhenCloseSoftWare);
    connect(mCanvasScene, &CanvasScene::signalEndPreview, mTextToolsPanel, &TextToolsPanel::slotEndPreview);
    // Changes in the panel are sent to the canvas.
    connect(mTextToolsPanel, &TextToolsPanel::signalNotifyEditAreaSizeToolBoxEditDone, mCanvasScene,
            &CanvasScene::slotNotifyEditAreaSizeToolBoxEditDone);
    connect(mTextToolsPanel, &TextToolsPanel::textStyleChange, mCanvasScene,
            &CanvasScene::slotChangeObjectTextStyle);
    connect(mTextToolsPanel, &TextToolsPanel::signalUpdateCurrentTextProperty, mCanvasScene,
            &CanvasScene::slotUpdateCurrentTextProperty);
    // Transient controls, fonts and positions.
    connect(mTextToolsPanel, &TextToolsPanel::signalShowEdgeSlider, this, &TitlerWindow::slotShowEdgeSlider);
    connect(mToolsBar, &ToolsBar::signalShowCanvasMenu, mTextToolsPanel,
            &TextToolsPanel::slotAbsoluteShowCanvasMenu);
    connect(mTextToolsPanel, &TextToolsPanel::signalShowFontFamilyComboxList, this,
            &TitlerWindow::slotShowFontFamilyComboxList);
    connect(mTextToolsPanel, &TextToolsPanel::signalShowFontSizeComboxList, this,
            &TitlerWindow::slotShowFontSizeComboxList);
    connect(this, &TitlerWindow::modifyFontComboxItem, mTextToolsPanel,
            &TextToolsPanel::modifyFontFamilyComboxItem);
    connect(this, &TitlerWindow::titlerWindowGeometry, mTextToolsPanel,
            &TextToolsPanel::titlerWindowRectSlot);
}

void TitlerWindow::connectForTemplates()
{
    connect(mTemplatePicker, &TemplatePicker::selectedTemplate, this,
            &TitlerWindow::slotStartCreateNewArchiveFromTemplate);
    connect(mTemplatePicker, &TemplatePicker::signalCloseSoftwareKeyBoardForFileManager, mFolderPicker,
            &FolderPicker::slotCloseSoftwareKeyBoardForFileManager);
    connect(mArchiveList, &ArchiveList::addUserSignal, mTemplatePicker, &TemplatePicker::slotSaveAsTemplate);
}

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

void TitlerWindow::connectForUndoRedoCommand()
{
    connect(mArchiveList, &ArchiveList::deleteCommandSignal, this, &TitlerWindow::pushUndoStack);
    connect(mArchiveList, &ArchiveList::pasteCommandSignal, this, &TitlerWindow::pushUndoStack);
    connect(mArchiveList, &ArchiveList::focusCommandSignal, this, &TitlerWindow::pushUndoStack);
    connect(mArchiveList, &ArchiveList::moveCommandSignal, this, &TitlerWindow::pushUndoStack);
    connect(mCanvasScene, &CanvasScene::signalPushUndoCommandIntoStack, this, &TitlerWindow::pushUndoStack);
}

void TitlerWindow::connectForController()
{
    if (!mLinks->areMade())
        return;
    connect(ShowTitlerController::getInstance(), &ShowTitlerController::signalShowTitlerParameter, this,
            &TitlerWindow::showTitlerWindow);
    connect(EditContextController::getInstance(), &EditContextController::signalShowTitlerParameter, this,
            &TitlerWindow::showTitlerWindow);
    const auto* setup = SystemSetupInfoController::getInstance();
    connect(setup, &SystemSetupInfoController::signalsInputLanguageInfo, this,
            &TitlerWindow::slotInputLanguageChanged);
    connect(setup, &SystemSetupInfoController::signalsSystemLanguageInfo, this,
            &TitlerWindow::slotSystemLanguageChanged);
    connect(setup, &SystemSetupInfoController::signalsSystemInfo, this, &TitlerWindow::slotGetModuleInfo);
    connect(TitlerPowerController::getInstance(), &TitlerPowerController::signalPowerOff, this,
            &TitlerWindow::slotPowerOff);
    connectForRestoreOriginal();
    connect(EditTitlerController::getInstance(), &EditTitlerController::importNewFontFamilies,
            mTextToolsPanel, &TextToolsPanel::slotImportNewFontFamlies);
    connectForFolderNotices();
    connect(MessageBoxController::getInstance(), &MessageBoxController::signalCloseMessage, this,
            &TitlerWindow::continueCloseTitler);
    const auto* messages = ShowMessageController::getInstance();
    connect(messages, &ShowMessageController::signalsShowDialogMaskWidget, this,
            &TitlerWindow::slotShowDialogMaskWidget);
    connect(messages, &ShowMessageController::signalsShowMessageMaskWidget, this,
            &TitlerWindow::slotShowMessageMaskWidget);
    connectForTemplateNotices();
}

// Closes transient controls when a finger comes down in another process.
void TitlerWindow::connectForRestoreOriginal()
{
    const auto* events = TitlerAPPEventFilterController::getInstance();
    for (void (TitlerWindow::*restore)() :
         {&TitlerWindow::slotCancelArchiveListMoveMode, &TitlerWindow::slotHideEdgeSlider,
          &TitlerWindow::slotHideCanvasMenu, &TitlerWindow::slotHideFontFamilyComboxList,
          &TitlerWindow::slotHideFontSizeComboxList})
        connect(events, &TitlerAPPEventFilterController::signalRestoreOriginal, this, restore);
}

void TitlerWindow::connectForFolderNotices()
{
    const auto* fileManager = EditTitlerController::getInstance();
    connect(fileManager, &EditTitlerController::folderNameChangeFromFileManager, mFolderPicker,
            &FolderPicker::folderNameChanged);
    connect(fileManager, &EditTitlerController::folderDeleteFromFileManager, mFolderPicker,
            &FolderPicker::slotDeleteFolder);
}

void TitlerWindow::connectForTemplateNotices()
{
    const auto* fileManager = EditTitlerController::getInstance();
    connect(fileManager, &EditTitlerController::importNewUserTemplate, mTemplatePicker,
            &TemplatePicker::slotImportNewUserTemplate);
    connect(fileManager, &EditTitlerController::deleteUserTemplate, mTemplatePicker,
            &TemplatePicker::slotDeleteUserTemplate);
    connect(fileManager, &EditTitlerController::renameUserTemplate, mTemplatePicker,
            &TemplatePicker::slotRenameUserTemplate);
}
