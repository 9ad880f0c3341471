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
    connect(m_archiveList, &ArchiveList::signalStartPasteArchive, this, &TitlerWindow::slotStartPasteArchive);
    connect(this, &TitlerWindow::moveButtonClicked, m_archiveList, &ArchiveList::moveButtonClicked);
    connectForTemplates();
    connectForFolderPicker();
    connectForUndoRedoCommand();
}

void TitlerWindow::connectForToolsBar()
{
    connect(m_toolsBar, &ToolsBar::closeButtonClick, this, &TitlerWindow::closeTitlerWindow);
    connect(m_toolsBar, &ToolsBar::folderButtonClick, this, &TitlerWindow::openFolderDialog);
    connect(m_toolsBar, &ToolsBar::redoButtonClicked, this,
            &TitlerWindow::hideSoftWareWithOutDeleteEmptyItems);
    connect(m_toolsBar, &ToolsBar::undoButtonClicked, this,
            &TitlerWindow::hideSoftWareWithOutDeleteEmptyItems);
    connect(m_toolsBar, &ToolsBar::canvasButtonClicked, this, &TitlerWindow::slotCanvasButtonClicked);
    connect(m_toolsBar, &ToolsBar::newTextButtonClick, this, &TitlerWindow::slotNewTextButtonClicked);
    connect(m_toolsBar, &ToolsBar::deleteButtonClick, this, &TitlerWindow::pressDelectButton);
    connect(m_toolsBar, &ToolsBar::SafeAreaButtonClickedForDrawRect, m_canvasScene,
            &CanvasScene::slotDrawSafeArea);
    connect(m_toolsBar, &ToolsBar::canvasButtonClicked, m_canvasScene, &CanvasScene::slotShowCanvasBG);
}

void TitlerWindow::connectForMainScene()
{
    connect(m_canvasScene, &CanvasScene::signalTextInserted, m_toolsBar, &ToolsBar::setInsertUnchecked);
    connect(m_canvasScene, &CanvasScene::signalSceneNotifyIfExistSelectedObject, m_toolsBar,
            &ToolsBar::changeBtnStatus);
    connect(m_canvasScene, &CanvasScene::signalDisableNewTextButton, m_toolsBar,
            &ToolsBar::slotDisableNewTextButton);
    connect(m_canvasScene, &CanvasScene::signalCanvasSceneMousePressed, m_toolsBar,
            &ToolsBar::slotlCanvasSceneMousePressed);
    connect(m_toolsBar, &ToolsBar::signalShowCanvasMenu, this, &TitlerWindow::slotShowCanvasMenu);
    connect(m_canvasScene, &CanvasScene::signalHasMessageToShowInformation, this,
            &TitlerWindow::setHasMessageToShowInformation);
    connect(m_canvasScene, &CanvasScene::signalNewTextInsertedFailed, this,
            &TitlerWindow::hideSoftWareWithDeleteEmptyItems);
    connect(m_canvasScene, &CanvasScene::signalSaveOk, m_archiveList, &ArchiveList::refreshBaseItem);
    connect(m_canvasScene, &CanvasScene::signalStartEditTextItem, m_archiveList,
            &ArchiveList::moveCurrentArchiveItemVisble);
}

void TitlerWindow::connectForTextToolsAndArchiveList()
{
    connect(m_archiveList, &ArchiveList::signalUpdateCanvas, m_canvasScene, &CanvasScene::slotUpdateArchive);
    connect(m_archiveList, &ArchiveList::itemSetDefaultState, m_canvasScene,
            &CanvasScene::slotMakeSceneThumnail);
    connect(m_archiveList, &ArchiveList::startTemplatePicker, this, &TitlerWindow::showTemplateDialog);
    connect(m_archiveList, &ArchiveList::startUserTemplatePicker, this,
            &TitlerWindow::showTemplateDialogOnUser);
    connect(m_archiveList, &ArchiveList::cleanUndoStack, this, &TitlerWindow::clearUndoStack);
    connect(m_archiveList, &ArchiveList::archiveListMenuShow, this,
            &TitlerWindow::hideSoftWareWithDeleteEmptyItems);
    connect(m_archiveList, &ArchiveList::widgetItemReleased, this, &TitlerWindow::listWidgetReleasedEvent);
    connect(m_moveMode->button(), &QPushButton::clicked, this,
            &TitlerWindow::hideSoftWareWithDeleteEmptyItems);
}

void TitlerWindow::connectForTextToolsPanel()
{
    // The selection is shown in the panel.
    connect(m_canvasScene, &CanvasScene::signalSceneNotifyIfExistSelectedObject, m_textToolsPanel,
            &TextToolsPanel::changeFontPropertyBtnStatus);
    connect(m_canvasScene, &CanvasScene::signalNotifyPropertyAreaUpdateCurrentTextStyle, m_textToolsPanel,
            &TextToolsPanel::updateTextStyle);
    connect(m_canvasScene, &CanvasScene::signalSceneNotifyTextPropertyAreaObjectSelectionMode,
            m_textToolsPanel, &TextToolsPanel::selectionModeForShadowAndAlign);
    connect(m_canvasScene, &CanvasScene::signalBeginNewTextItem, m_textToolsPanel,
            &TextToolsPanel::slotBeginNewTextItem);
    connect(m_canvasScene, &CanvasScene::signalSceneSoftWareClosedWhenEditObject, m_textToolsPanel,
            &TextToolsPanel::slotHideColorPaletteWhenCloseSoftWare);
    connect(m_canvasScene, &CanvasScene::signalEndPreview, m_textToolsPanel, &TextToolsPanel::slotEndPreview);
    // Changes in the panel are sent to the canvas.
    connect(m_textToolsPanel, &TextToolsPanel::signalNotifyEditAreaSizeToolBoxEditDone, m_canvasScene,
            &CanvasScene::slotNotifyEditAreaSizeToolBoxEditDone);
    connect(m_textToolsPanel, &TextToolsPanel::textStyleChange, m_canvasScene,
            &CanvasScene::slotChangeObjectTextStyle);
    connect(m_textToolsPanel, &TextToolsPanel::signalUpdateCurrentTextProperty, m_canvasScene,
            &CanvasScene::slotUpdateCurrentTextProperty);
    // Transient controls, fonts and positions.
    connect(m_textToolsPanel, &TextToolsPanel::signalShowEdgeSlider, this, &TitlerWindow::slotShowEdgeSlider);
    connect(m_toolsBar, &ToolsBar::signalShowCanvasMenu, m_textToolsPanel,
            &TextToolsPanel::slotAbsoluteShowCanvasMenu);
    connect(m_textToolsPanel, &TextToolsPanel::signalShowFontFamilyComboxList, this,
            &TitlerWindow::slotShowFontFamilyComboxList);
    connect(m_textToolsPanel, &TextToolsPanel::signalShowFontSizeComboxList, this,
            &TitlerWindow::slotShowFontSizeComboxList);
    connect(this, &TitlerWindow::modifyFontComboxItem, m_textToolsPanel,
            &TextToolsPanel::modifyFontFamilyComboxItem);
    connect(this, &TitlerWindow::titlerWindowGeometry, m_textToolsPanel,
            &TextToolsPanel::titlerWindowRectSlot);
}

void TitlerWindow::connectForTemplates()
{
    connect(m_templatePicker, &TemplatePicker::selectedTemplate, this,
            &TitlerWindow::slotStartCreateNewArchiveFromTemplate);
    connect(m_templatePicker, &TemplatePicker::signalCloseSoftwareKeyBoardForFileManager, m_folderPicker,
            &FolderPicker::slotCloseSoftwareKeyBoardForFileManager);
    connect(m_archiveList, &ArchiveList::addUserSignal, m_templatePicker,
            &TemplatePicker::slotSaveAsTemplate);
}

void TitlerWindow::connectForFolderPicker()
{
    connect(m_folderPicker, &FolderPicker::clearUndoCommandStack, this, &TitlerWindow::clearUndoStack);
    connect(m_folderPicker, &FolderPicker::signalCancelClicked, this, &TitlerWindow::slotCancelClicked);
    connect(m_folderPicker, &FolderPicker::changeFolderPath, m_archiveList, &ArchiveList::refreshArchiveList);
    connect(m_folderPicker, &FolderPicker::changeFolderFile, m_archiveList,
            &ArchiveList::refreshArchiveListInFile);
    connect(m_folderPicker, &FolderPicker::folderNameChange, m_archiveList,
            &ArchiveList::refreshArchiveListForChangeFolderName);
    connect(m_folderPicker, &FolderPicker::folderMoved, m_canvasScene, &CanvasScene::folderRenamed);
}

void TitlerWindow::connectForUndoRedoCommand()
{
    connect(m_archiveList, &ArchiveList::deleteCommandSignal, this, &TitlerWindow::pushUndoStack);
    connect(m_archiveList, &ArchiveList::pasteCommandSignal, this, &TitlerWindow::pushUndoStack);
    connect(m_archiveList, &ArchiveList::focusCommandSignal, this, &TitlerWindow::pushUndoStack);
    connect(m_archiveList, &ArchiveList::moveCommandSignal, this, &TitlerWindow::pushUndoStack);
    connect(m_canvasScene, &CanvasScene::signalPushUndoCommandIntoStack, this, &TitlerWindow::pushUndoStack);
}

void TitlerWindow::connectForController()
{
    if (!m_links->areMade())
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
            m_textToolsPanel, &TextToolsPanel::slotImportNewFontFamlies);
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
    connect(fileManager, &EditTitlerController::folderNameChangeFromFileManager, m_folderPicker,
            &FolderPicker::folderNameChanged);
    connect(fileManager, &EditTitlerController::folderDeleteFromFileManager, m_folderPicker,
            &FolderPicker::slotDeleteFolder);
}

void TitlerWindow::connectForTemplateNotices()
{
    const auto* fileManager = EditTitlerController::getInstance();
    connect(fileManager, &EditTitlerController::importNewUserTemplate, m_templatePicker,
            &TemplatePicker::slotImportNewUserTemplate);
    connect(fileManager, &EditTitlerController::deleteUserTemplate, m_templatePicker,
            &TemplatePicker::slotDeleteUserTemplate);
    connect(fileManager, &EditTitlerController::renameUserTemplate, m_templatePicker,
            &TemplatePicker::slotRenameUserTemplate);
}
