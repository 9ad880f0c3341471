// The connections that the window makes between its children, and from the controllers, against the list of
// them.
#include "app/APPEventFilter.h"
#include "app/EditContextController.h"
#include "app/EditTitlerController.h"
#include "app/ShowMessageController.h"
#include "app/ShowTitlerController.h"
#include "app/SystemSetupInfoController.h"
#include "app/TitlerAPPEventFilterController.h"
#include "app/TitlerPowerController.h"
#include "app/TitlerWindow.h"
#include "app/ToolsBar.h"
#include "canvas/CanvasScene.h"
#include "canvas/GraphicsView.h"
#include "canvas/MessageBoxController.h"
#include "library/ArchiveList.h"
#include "library/FolderPicker.h"
#include "library/TemplatePicker.h"
#include "panel/TextToolsPanel.h"
#include "tests/app/Siblings.h"
#include "touchui/KSPushbutton.h"

#include <QMap>
#include <QMetaMethod>
#include <QTest>

class tst_titlerwindow_wiring : public QObject
{
    Q_OBJECT

private Q_SLOTS:
    void initTestCase();
    void cleanupTestCase();
    void aMissingRowIsNoticed();
    void toolsBar();
    void canvas();
    void panel();
    void list();
    void dialogs();
    void controllers();
    void thereAreNoOthers();

private:
    template <typename Sender, typename Signal, typename Receiver, typename Slot>
    void row(const char* name, const Sender* sender, Signal signal, const Receiver* receiver, Slot slot);
    void noRowIsMissing();
    // Signals of the object's own class with more or fewer receivers than there are rows for them.
    QStringList strangeSignals(const QObject* sender) const;

    Siblings mSiblings;
    TitlerWindow* mWindow = nullptr;
    ToolsBar* mToolsBar = nullptr;
    CanvasScene* mScene = nullptr;
    TextToolsPanel* mPanel = nullptr;
    ArchiveList* mList = nullptr;
    FolderPicker* mFolders = nullptr;
    TemplatePicker* mTemplates = nullptr;
    QStringList mMissing;
    QMap<QPair<const QObject*, QByteArray>, int> mRows; // by signal
};

namespace
{

// What a class does with its own signals is no business of the window.
const QStringList INTERNAL{"ToolsBar::exeUndoAction",           "ToolsBar::exeRedoAction",
                           "ToolsBar::menuTriggered",           "TextToolsPanel::sendTitlerWindowRect",
                           "ArchiveList::signalStartMove",      "ArchiveList::signalItemsCanDrag",
                           "ArchiveList::signalAddArchiveData", "ArchiveList::signalAddOneArchiveData"};

// How many receivers a signal has, which only the sender itself may ask.
struct Receivers : QObject {
    static int count(const QObject* sender, const QMetaMethod& signal)
    {
        const QByteArray code = '2' + signal.methodSignature();
        return (sender->*(&Receivers::receivers))(code.constData());
    }
};

} // namespace

// A connection that exists cannot be made a second time as a unique one.
template <typename Sender, typename Signal, typename Receiver, typename Slot>
void tst_titlerwindow_wiring::row(const char* name, const Sender* sender, Signal signal,
                                  const Receiver* receiver, Slot slot)
{
    ++mRows[{sender, QMetaMethod::fromSignal(signal).methodSignature()}];
    if (const auto made = connect(sender, signal, receiver, slot, Qt::UniqueConnection)) {
        disconnect(made);
        mMissing.append(QLatin1String(name));
    }
}

#define ROW(sender, signal, receiver, slot) row(#signal " -> " #slot, sender, &signal, receiver, &slot)

void tst_titlerwindow_wiring::noRowIsMissing()
{
    const QStringList missing = std::exchange(mMissing, {});
    QVERIFY2(missing.isEmpty(), qPrintable(missing.join(QLatin1Char('\n'))));
}

void tst_titlerwindow_wiring::initTestCase()
{
    QVERIFY(mSiblings.listenOnFreePorts());
    APPEventFilter::instance();
    Q_INIT_RESOURCE(UILibrary);
    Q_INIT_RESOURCE(TitlerToolResource);
    mWindow = new TitlerWindow(true, nullptr);
    pMainWindow = mWindow;
    mWindow->setRealClose(false);
    mToolsBar = mWindow->findChild<ToolsBar*>();
    mScene = mWindow->findChild<CanvasScene*>();
    mPanel = mWindow->findChild<TextToolsPanel*>();
    mList = mWindow->findChild<ArchiveList*>();
    mFolders = mWindow->findChild<FolderPicker*>();
    mTemplates = mWindow->findChild<TemplatePicker*>();
    for (const QObject* child :
         std::initializer_list<const QObject*>{mToolsBar, mScene, mPanel, mList, mFolders, mTemplates})
        QVERIFY(child);
}

void tst_titlerwindow_wiring::cleanupTestCase()
{
    delete mWindow;
    pMainWindow = nullptr;
    APPEventFilter::release();
}

void tst_titlerwindow_wiring::aMissingRowIsNoticed()
{
    ROW(mToolsBar, ToolsBar::closeButtonClick, mWindow, TitlerWindow::clearUndoStack);
    QCOMPARE(std::exchange(mMissing, {}),
             QStringList{"ToolsBar::closeButtonClick -> TitlerWindow::clearUndoStack"});
    // The question itself has made nothing.
    ROW(mToolsBar, ToolsBar::closeButtonClick, mWindow, TitlerWindow::clearUndoStack);
    QCOMPARE(std::exchange(mMissing, {}).size(), 1);
}

void tst_titlerwindow_wiring::toolsBar()
{
    ROW(mToolsBar, ToolsBar::closeButtonClick, mWindow, TitlerWindow::closeTitlerWindow);
    ROW(mToolsBar, ToolsBar::folderButtonClick, mWindow, TitlerWindow::openFolderDialog);
    ROW(mToolsBar, ToolsBar::redoButtonClicked, mWindow, TitlerWindow::hideSoftWareWithOutDeleteEmptyItems);
    ROW(mToolsBar, ToolsBar::undoButtonClicked, mWindow, TitlerWindow::hideSoftWareWithOutDeleteEmptyItems);
    ROW(mToolsBar, ToolsBar::canvasButtonClicked, mWindow, TitlerWindow::slotCanvasButtonClicked);
    ROW(mToolsBar, ToolsBar::newTextButtonClick, mWindow, TitlerWindow::slotNewTextButtonClicked);
    ROW(mToolsBar, ToolsBar::deleteButtonClick, mWindow, TitlerWindow::pressDelectButton);
    ROW(mToolsBar, ToolsBar::SafeAreaButtonClickedForDrawRect, mScene, CanvasScene::slotDrawSafeArea);
    ROW(mToolsBar, ToolsBar::canvasButtonClicked, mScene, CanvasScene::slotShowCanvasBG);
    ROW(mToolsBar, ToolsBar::signalShowCanvasMenu, mWindow, TitlerWindow::slotShowCanvasMenu);
    ROW(mToolsBar, ToolsBar::signalShowCanvasMenu, mPanel, TextToolsPanel::slotAbsoluteShowCanvasMenu);
    noRowIsMissing();
}

void tst_titlerwindow_wiring::canvas()
{
    ROW(mScene, CanvasScene::signalTextInserted, mToolsBar, ToolsBar::setInsertUnchecked);
    ROW(mScene, CanvasScene::signalSceneNotifyIfExistSelectedObject, mToolsBar, ToolsBar::changeBtnStatus);
    ROW(mScene, CanvasScene::signalDisableNewTextButton, mToolsBar, ToolsBar::slotDisableNewTextButton);
    ROW(mScene, CanvasScene::signalCanvasSceneMousePressed, mToolsBar,
        ToolsBar::slotlCanvasSceneMousePressed);
    ROW(mScene, CanvasScene::signalHasMessageToShowInformation, mWindow,
        TitlerWindow::setHasMessageToShowInformation);
    ROW(mScene, CanvasScene::signalNewTextInsertedFailed, mWindow,
        TitlerWindow::hideSoftWareWithDeleteEmptyItems);
    ROW(mScene, CanvasScene::signalSaveOk, mList, ArchiveList::refreshBaseItem);
    ROW(mScene, CanvasScene::signalStartEditTextItem, mList, ArchiveList::moveCurrentArchiveItemVisble);
    ROW(mScene, CanvasScene::signalPushUndoCommandIntoStack, mWindow, TitlerWindow::pushUndoStack);
    auto* view = mWindow->findChild<GraphicsView*>();
    QVERIFY(view);
    ROW(view, GraphicsView::deleteEmptyItem, mWindow, TitlerWindow::slotDeleteEmptyItems);
    noRowIsMissing();
}

void tst_titlerwindow_wiring::panel()
{
    ROW(mScene, CanvasScene::signalSceneNotifyIfExistSelectedObject, mPanel,
        TextToolsPanel::changeFontPropertyBtnStatus);
    ROW(mScene, CanvasScene::signalNotifyPropertyAreaUpdateCurrentTextStyle, mPanel,
        TextToolsPanel::updateTextStyle);
    ROW(mScene, CanvasScene::signalSceneNotifyTextPropertyAreaObjectSelectionMode, mPanel,
        TextToolsPanel::selectionModeForShadowAndAlign);
    ROW(mScene, CanvasScene::signalBeginNewTextItem, mPanel, TextToolsPanel::slotBeginNewTextItem);
    ROW(mScene, CanvasScene::signalEndPreview, mPanel, TextToolsPanel::slotEndPreview);
    ROW(mScene, CanvasScene::signalSceneSoftWareClosedWhenEditObject, mPanel,
        TextToolsPanel::slotHideColorPaletteWhenCloseSoftWare);
    ROW(mPanel, TextToolsPanel::signalShowEdgeSlider, mWindow, TitlerWindow::slotShowEdgeSlider);
    ROW(mPanel, TextToolsPanel::signalShowFontFamilyComboxList, mWindow,
        TitlerWindow::slotShowFontFamilyComboxList);
    ROW(mPanel, TextToolsPanel::signalShowFontSizeComboxList, mWindow,
        TitlerWindow::slotShowFontSizeComboxList);
    ROW(mPanel, TextToolsPanel::signalNotifyEditAreaSizeToolBoxEditDone, mScene,
        CanvasScene::slotNotifyEditAreaSizeToolBoxEditDone);
    ROW(mPanel, TextToolsPanel::textStyleChange, mScene, CanvasScene::slotChangeObjectTextStyle);
    ROW(mPanel, TextToolsPanel::signalUpdateCurrentTextProperty, mScene,
        CanvasScene::slotUpdateCurrentTextProperty);
    ROW(mWindow, TitlerWindow::modifyFontComboxItem, mPanel, TextToolsPanel::modifyFontFamilyComboxItem);
    ROW(mWindow, TitlerWindow::titlerWindowGeometry, mPanel, TextToolsPanel::titlerWindowRectSlot);
    noRowIsMissing();
}

void tst_titlerwindow_wiring::list()
{
    ROW(mList, ArchiveList::signalUpdateCanvas, mScene, CanvasScene::slotUpdateArchive);
    ROW(mList, ArchiveList::itemSetDefaultState, mScene, CanvasScene::slotMakeSceneThumnail);
    ROW(mList, ArchiveList::startTemplatePicker, mWindow, TitlerWindow::showTemplateDialog);
    ROW(mList, ArchiveList::startUserTemplatePicker, mWindow, TitlerWindow::showTemplateDialogOnUser);
    ROW(mList, ArchiveList::cleanUndoStack, mWindow, TitlerWindow::clearUndoStack);
    ROW(mList, ArchiveList::widgetItemReleased, mWindow, TitlerWindow::listWidgetReleasedEvent);
    ROW(mList, ArchiveList::archiveListMenuShow, mWindow, TitlerWindow::hideSoftWareWithDeleteEmptyItems);
    ROW(mList, ArchiveList::signalStartPasteArchive, mWindow, TitlerWindow::slotStartPasteArchive);
    ROW(mList, ArchiveList::deleteCommandSignal, mWindow, TitlerWindow::pushUndoStack);
    ROW(mList, ArchiveList::pasteCommandSignal, mWindow, TitlerWindow::pushUndoStack);
    ROW(mList, ArchiveList::focusCommandSignal, mWindow, TitlerWindow::pushUndoStack);
    ROW(mList, ArchiveList::moveCommandSignal, mWindow, TitlerWindow::pushUndoStack);
    ROW(mWindow, TitlerWindow::moveButtonClicked, mList, ArchiveList::moveButtonClicked);
    KSPushbutton* moveButton = nullptr;
    const auto buttons = mWindow->findChildren<KSPushbutton*>();
    for (KSPushbutton* button : buttons)
        if (button->text() == mWindow->tr("Move"))
            moveButton = button;
    QVERIFY(moveButton);
    ROW(moveButton, QPushButton::clicked, mWindow, TitlerWindow::hideSoftWareWithDeleteEmptyItems);
    ROW(moveButton, QPushButton::clicked, mWindow, TitlerWindow::editAndDoneButtonClicked);
    ROW(moveButton, QPushButton::pressed, mWindow, TitlerWindow::moveButtonPressed);
    ROW(moveButton, QPushButton::released, mWindow, TitlerWindow::moveButtonReleased);
    noRowIsMissing();
}

void tst_titlerwindow_wiring::dialogs()
{
    ROW(mFolders, FolderPicker::clearUndoCommandStack, mWindow, TitlerWindow::clearUndoStack);
    ROW(mFolders, FolderPicker::signalCancelClicked, mWindow, TitlerWindow::slotCancelClicked);
    ROW(mFolders, FolderPicker::changeFolderPath, mList, ArchiveList::refreshArchiveList);
    ROW(mFolders, FolderPicker::changeFolderFile, mList, ArchiveList::refreshArchiveListInFile);
    ROW(mFolders, FolderPicker::folderMoved, mScene, CanvasScene::folderRenamed);
    ROW(mFolders, FolderPicker::folderNameChange, mList, ArchiveList::refreshArchiveListForChangeFolderName);
    ROW(mTemplates, TemplatePicker::selectedTemplate, mWindow,
        TitlerWindow::slotStartCreateNewArchiveFromTemplate);
    ROW(mTemplates, TemplatePicker::signalCloseSoftwareKeyBoardForFileManager, mFolders,
        FolderPicker::slotCloseSoftwareKeyBoardForFileManager);
    ROW(mList, ArchiveList::addUserSignal, mTemplates, TemplatePicker::slotSaveAsTemplate);
    noRowIsMissing();
}

void tst_titlerwindow_wiring::controllers()
{
    ROW(ShowTitlerController::getInstance(), ShowTitlerController::signalShowTitlerParameter, mWindow,
        TitlerWindow::showTitlerWindow);
    ROW(EditContextController::getInstance(), EditContextController::signalShowTitlerParameter, mWindow,
        TitlerWindow::showTitlerWindow);
    auto* setup = SystemSetupInfoController::getInstance();
    ROW(setup, SystemSetupInfoController::signalsInputLanguageInfo, mWindow,
        TitlerWindow::slotInputLanguageChanged);
    ROW(setup, SystemSetupInfoController::signalsSystemLanguageInfo, mWindow,
        TitlerWindow::slotSystemLanguageChanged);
    ROW(setup, SystemSetupInfoController::signalsSystemInfo, mWindow, TitlerWindow::slotGetModuleInfo);
    ROW(TitlerPowerController::getInstance(), TitlerPowerController::signalPowerOff, mWindow,
        TitlerWindow::slotPowerOff);
    auto* locks = TitlerAPPEventFilterController::getInstance();
    ROW(locks, TitlerAPPEventFilterController::signalRestoreOriginal, mWindow,
        TitlerWindow::slotCancelArchiveListMoveMode);
    ROW(locks, TitlerAPPEventFilterController::signalRestoreOriginal, mWindow,
        TitlerWindow::slotHideEdgeSlider);
    ROW(locks, TitlerAPPEventFilterController::signalRestoreOriginal, mWindow,
        TitlerWindow::slotHideCanvasMenu);
    ROW(locks, TitlerAPPEventFilterController::signalRestoreOriginal, mWindow,
        TitlerWindow::slotHideFontFamilyComboxList);
    ROW(locks, TitlerAPPEventFilterController::signalRestoreOriginal, mWindow,
        TitlerWindow::slotHideFontSizeComboxList);
    auto* messages = ShowMessageController::getInstance();
    ROW(messages, ShowMessageController::signalsShowDialogMaskWidget, mWindow,
        TitlerWindow::slotShowDialogMaskWidget);
    ROW(messages, ShowMessageController::signalsShowMessageMaskWidget, mWindow,
        TitlerWindow::slotShowMessageMaskWidget);
    ROW(MessageBoxController::getInstance(), MessageBoxController::signalCloseMessage, mWindow,
        TitlerWindow::continueCloseTitler);
    auto* files = EditTitlerController::getInstance();
    ROW(files, EditTitlerController::importNewFontFamilies, mPanel, TextToolsPanel::slotImportNewFontFamlies);
    ROW(files, EditTitlerController::folderNameChangeFromFileManager, mFolders,
        FolderPicker::folderNameChanged);
    ROW(files, EditTitlerController::folderDeleteFromFileManager, mFolders, FolderPicker::slotDeleteFolder);
    ROW(files, EditTitlerController::importNewUserTemplate, mTemplates,
        TemplatePicker::slotImportNewUserTemplate);
    ROW(files, EditTitlerController::deleteUserTemplate, mTemplates, TemplatePicker::slotDeleteUserTemplate);
    ROW(files, EditTitlerController::renameUserTemplate, mTemplates, TemplatePicker::slotRenameUserTemplate);
    noRowIsMissing();
}

QStringList tst_titlerwindow_wiring::strangeSignals(const QObject* sender) const
{
    QStringList strange;
    const QMetaObject* type = sender->metaObject();
    for (int i = type->methodOffset(); i < type->methodCount(); ++i) {
        const QMetaMethod method = type->method(i);
        const QString name = QLatin1String(type->className()) + "::" + QLatin1String(method.name());
        if (method.methodType() != QMetaMethod::Signal || INTERNAL.contains(name))
            continue;
        const int wanted = mRows.value({sender, method.methodSignature()});
        const int made = Receivers::count(sender, method);
        if (made != wanted)
            strange.append(QStringLiteral("%1: %2 instead of %3").arg(name).arg(made).arg(wanted));
    }
    return strange;
}

void tst_titlerwindow_wiring::thereAreNoOthers()
{
    mRows.clear();
    toolsBar();
    canvas();
    panel();
    list();
    dialogs();
    controllers();
    QStringList strange;
    for (const QObject* sender : std::initializer_list<const QObject*>{
             mWindow, mToolsBar, mScene, mPanel, mList, mFolders, mTemplates,
             ShowTitlerController::getInstance(), EditContextController::getInstance(),
             SystemSetupInfoController::getInstance(), TitlerPowerController::getInstance(),
             ShowMessageController::getInstance(), EditTitlerController::getInstance()})
        strange.append(strangeSignals(sender));
    QVERIFY2(strange.isEmpty(), qPrintable(strange.join(QLatin1Char('\n'))));
    // A row that is made twice is seen, too.
    connect(mToolsBar, &ToolsBar::closeButtonClick, mWindow, &TitlerWindow::clearUndoStack);
    QCOMPARE(strangeSignals(mToolsBar), QStringList{"ToolsBar::closeButtonClick: 2 instead of 1"});
    disconnect(mToolsBar, &ToolsBar::closeButtonClick, mWindow, &TitlerWindow::clearUndoStack);
}

QTEST_MAIN(tst_titlerwindow_wiring)
#include "tst_titlerwindow_wiring.moc"
