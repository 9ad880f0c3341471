// Every connection between the objects that the window owns, and to the controllers. No canvas, panel or
// library object connects to another by itself.
#include "app/TitlerWindow.h"

#include "app/EditContextController.h"
#include "app/EditTitlerController.h"
#include "app/ShowMessageController.h"
#include "app/ShowTitlerController.h"
#include "app/SystemSetupInfoController.h"
#include "app/TitlerAPPEventFilterController.h"
#include "app/TitlerPowerController.h"
#include "app/ToolsBar.h"
#include "canvas/CanvasScene.h"
#include "library/ArchiveItem.h"
#include "library/ArchiveList.h"
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
    connect(mMoveButton, &QPushButton::clicked, this, &TitlerWindow::hideSoftWareWithDeleteEmptyItems);
}

void TitlerWindow::connectForTextToolsPanel()
{
    // What is selected is shown.
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
    // What is changed goes to the canvas.
    connect(mTextToolsPanel, &TextToolsPanel::signalNotifyEditAreaSizeToolBoxEditDone, mCanvasScene,
            &CanvasScene::slotNotifyEditAreaSizeToolBoxEditDone);
    connect(mTextToolsPanel, &TextToolsPanel::textStyleChange, mCanvasScene,
            &CanvasScene::slotChangeObjectTextStyle);
    connect(mTextToolsPanel, &TextToolsPanel::signalUpdateCurrentTextProperty, mCanvasScene,
            &CanvasScene::slotUpdateCurrentTextProperty);
    // Controls that are open for the moment, fonts and places.
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
    if (!mFactory)
        return;
    mEditContextController = EditContextController::getInstance();
    connect(mShowTitlerController, &ShowTitlerController::signalShowTitlerParameter, this,
            &TitlerWindow::showTitlerWindow);
    connect(mEditContextController, &EditContextController::signalShowTitlerParameter, this,
            &TitlerWindow::showTitlerWindow);
    connect(mSystemSetupInfoController, &SystemSetupInfoController::signalsInputLanguageInfo, this,
            &TitlerWindow::slotInputLanguageChanged);
    connect(mSystemSetupInfoController, &SystemSetupInfoController::signalsSystemLanguageInfo, this,
            &TitlerWindow::slotSystemLanguageChanged);
    connect(mSystemSetupInfoController, &SystemSetupInfoController::signalsSystemInfo, this,
            &TitlerWindow::slotGetModuleInfo);
    connect(mTitlerPowerController, &TitlerPowerController::signalPowerOff, this,
            &TitlerWindow::slotPowerOff);
    connect(mTitlerAPPEventFilterController, &TitlerAPPEventFilterController::signalRestoreOriginal, this,
            &TitlerWindow::slotCancelArchiveListMoveMode);
    connect(mTitlerAPPEventFilterController, &TitlerAPPEventFilterController::signalRestoreOriginal, this,
            &TitlerWindow::slotHideEdgeSlider);
    connect(mTitlerAPPEventFilterController, &TitlerAPPEventFilterController::signalRestoreOriginal, this,
            &TitlerWindow::slotHideCanvasMenu);
    connect(mTitlerAPPEventFilterController, &TitlerAPPEventFilterController::signalRestoreOriginal, this,
            &TitlerWindow::slotHideFontFamilyComboxList);
    connect(mTitlerAPPEventFilterController, &TitlerAPPEventFilterController::signalRestoreOriginal, this,
            &TitlerWindow::slotHideFontSizeComboxList);
    connect(mEditTitlerController, &EditTitlerController::importNewFontFamilies, mTextToolsPanel,
            &TextToolsPanel::slotImportNewFontFamlies);
    connectForFolderNotices();
    connect(MessageBoxController::getInstance(), &MessageBoxController::signalCloseMessage, this,
            &TitlerWindow::continueCloseTitler);
    connect(mShowMessageController, &ShowMessageController::signalsShowDialogMaskWidget, this,
            &TitlerWindow::slotShowDialogMaskWidget);
    connect(mShowMessageController, &ShowMessageController::signalsShowMessageMaskWidget, this,
            &TitlerWindow::slotShowMessageMaskWidget);
    connectForTemplateNotices();
}
