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

    Siblings m_siblings;
    TitlerWindow* m_window = nullptr;
    ToolsBar* m_toolsBar = nullptr;
    CanvasScene* m_scene = nullptr;
    TextToolsPanel* m_panel = nullptr;
    ArchiveList* m_list = nullptr;
    FolderPicker* m_folders = nullptr;
    TemplatePicker* m_templates = nullptr;
    QStringList m_missing;
    QMap<QPair<const QObject*, QByteArray>, int> m_rows; // by signal
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
    ++m_rows[{sender, QMetaMethod::fromSignal(signal).methodSignature()}];
    if (const auto made = connect(sender, signal, receiver, slot, Qt::UniqueConnection)) {
        disconnect(made);
        m_missing.append(QLatin1String(name));
    }
}

#define ROW(sender, signal, receiver, slot) row(#signal " -> " #slot, sender, &signal, receiver, &slot)

void tst_titlerwindow_wiring::noRowIsMissing()
{
    const QStringList missing = std::exchange(m_missing, {});
    QVERIFY2(missing.isEmpty(), qPrintable(missing.join(QLatin1Char('\n'))));
}

void tst_titlerwindow_wiring::initTestCase()
{
    QVERIFY(m_siblings.listenOnFreePorts());
    APPEventFilter::instance();
    Q_INIT_RESOURCE(UILibrary);
    Q_INIT_RESOURCE(TitlerToolResource);
    m_window = new TitlerWindow(true, nullptr);
    pMainWindow = m_window;
    m_window->setRealClose(false);
    m_toolsBar = m_window->findChild<ToolsBar*>();
    m_scene = m_window->findChild<CanvasScene*>();
    m_panel = m_window->findChild<TextToolsPanel*>();
    m_list = m_window->findChild<ArchiveList*>();
    m_folders = m_window->findChild<FolderPicker*>();
    m_templates = m_window->findChild<TemplatePicker*>();
    for (const QObject* child :
         std::initializer_list<const QObject*>{m_toolsBar, m_scene, m_panel, m_list, m_folders, m_templates})
        QVERIFY(child);
}

void tst_titlerwindow_wiring::cleanupTestCase()
{
    delete m_window;
    pMainWindow = nullptr;
    APPEventFilter::release();
}

void tst_titlerwindow_wiring::aMissingRowIsNoticed()
{
    ROW(m_toolsBar, ToolsBar::closeButtonClick, m_window, TitlerWindow::clearUndoStack);
    QCOMPARE(std::exchange(m_missing, {}),
             QStringList{"ToolsBar::closeButtonClick -> TitlerWindow::clearUndoStack"});
    // The question itself has made nothing.
    ROW(m_toolsBar, ToolsBar::closeButtonClick, m_window, TitlerWindow::clearUndoStack);
    QCOMPARE(std::exchange(m_missing, {}).size(), 1);
}

void tst_titlerwindow_wiring::toolsBar()
{
    ROW(m_toolsBar, ToolsBar::closeButtonClick, m_window, TitlerWindow::closeTitlerWindow);
    ROW(m_toolsBar, ToolsBar::folderButtonClick, m_window, TitlerWindow::openFolderDialog);
    ROW(m_toolsBar, ToolsBar::redoButtonClicked, m_window, TitlerWindow::hideSoftWareWithOutDeleteEmptyItems);
    ROW(m_toolsBar, ToolsBar::undoButtonClicked, m_window, TitlerWindow::hideSoftWareWithOutDeleteEmptyItems);
    ROW(m_toolsBar, ToolsBar::canvasButtonClicked, m_window, TitlerWindow::slotCanvasButtonClicked);
    ROW(m_toolsBar, ToolsBar::newTextButtonClick, m_window, TitlerWindow::slotNewTextButtonClicked);
    ROW(m_toolsBar, ToolsBar::deleteButtonClick, m_window, TitlerWindow::pressDelectButton);
    ROW(m_toolsBar, ToolsBar::SafeAreaButtonClickedForDrawRect, m_scene, CanvasScene::slotDrawSafeArea);
    ROW(m_toolsBar, ToolsBar::canvasButtonClicked, m_scene, CanvasScene::slotShowCanvasBG);
    ROW(m_toolsBar, ToolsBar::signalShowCanvasMenu, m_window, TitlerWindow::slotShowCanvasMenu);
    ROW(m_toolsBar, ToolsBar::signalShowCanvasMenu, m_panel, TextToolsPanel::slotAbsoluteShowCanvasMenu);
    noRowIsMissing();
}

void tst_titlerwindow_wiring::canvas()
{
    ROW(m_scene, CanvasScene::signalTextInserted, m_toolsBar, ToolsBar::setInsertUnchecked);
    ROW(m_scene, CanvasScene::signalSceneNotifyIfExistSelectedObject, m_toolsBar, ToolsBar::changeBtnStatus);
    ROW(m_scene, CanvasScene::signalDisableNewTextButton, m_toolsBar, ToolsBar::slotDisableNewTextButton);
    ROW(m_scene, CanvasScene::signalCanvasSceneMousePressed, m_toolsBar,
        ToolsBar::slotlCanvasSceneMousePressed);
    ROW(m_scene, CanvasScene::signalHasMessageToShowInformation, m_window,
        TitlerWindow::setHasMessageToShowInformation);
    ROW(m_scene, CanvasScene::signalNewTextInsertedFailed, m_window,
        TitlerWindow::hideSoftWareWithDeleteEmptyItems);
    ROW(m_scene, CanvasScene::signalSaveOk, m_list, ArchiveList::refreshBaseItem);
    ROW(m_scene, CanvasScene::signalStartEditTextItem, m_list, ArchiveList::moveCurrentArchiveItemVisble);
    ROW(m_scene, CanvasScene::signalPushUndoCommandIntoStack, m_window, TitlerWindow::pushUndoStack);
    auto* view = m_window->findChild<GraphicsView*>();
    QVERIFY(view);
    ROW(view, GraphicsView::deleteEmptyItem, m_window, TitlerWindow::slotDeleteEmptyItems);
    noRowIsMissing();
}

void tst_titlerwindow_wiring::panel()
{
    ROW(m_scene, CanvasScene::signalSceneNotifyIfExistSelectedObject, m_panel,
        TextToolsPanel::changeFontPropertyBtnStatus);
    ROW(m_scene, CanvasScene::signalNotifyPropertyAreaUpdateCurrentTextStyle, m_panel,
        TextToolsPanel::updateTextStyle);
    ROW(m_scene, CanvasScene::signalSceneNotifyTextPropertyAreaObjectSelectionMode, m_panel,
        TextToolsPanel::selectionModeForShadowAndAlign);
    ROW(m_scene, CanvasScene::signalBeginNewTextItem, m_panel, TextToolsPanel::slotBeginNewTextItem);
    ROW(m_scene, CanvasScene::signalEndPreview, m_panel, TextToolsPanel::slotEndPreview);
    ROW(m_scene, CanvasScene::signalSceneSoftWareClosedWhenEditObject, m_panel,
        TextToolsPanel::slotHideColorPaletteWhenCloseSoftWare);
    ROW(m_panel, TextToolsPanel::signalShowEdgeSlider, m_window, TitlerWindow::slotShowEdgeSlider);
    ROW(m_panel, TextToolsPanel::signalShowFontFamilyComboxList, m_window,
        TitlerWindow::slotShowFontFamilyComboxList);
    ROW(m_panel, TextToolsPanel::signalShowFontSizeComboxList, m_window,
        TitlerWindow::slotShowFontSizeComboxList);
    ROW(m_panel, TextToolsPanel::signalNotifyEditAreaSizeToolBoxEditDone, m_scene,
        CanvasScene::slotNotifyEditAreaSizeToolBoxEditDone);
    ROW(m_panel, TextToolsPanel::textStyleChange, m_scene, CanvasScene::slotChangeObjectTextStyle);
    ROW(m_panel, TextToolsPanel::signalUpdateCurrentTextProperty, m_scene,
        CanvasScene::slotUpdateCurrentTextProperty);
    ROW(m_window, TitlerWindow::modifyFontComboxItem, m_panel, TextToolsPanel::modifyFontFamilyComboxItem);
    ROW(m_window, TitlerWindow::titlerWindowGeometry, m_panel, TextToolsPanel::titlerWindowRectSlot);
    noRowIsMissing();
}

void tst_titlerwindow_wiring::list()
{
    ROW(m_list, ArchiveList::signalUpdateCanvas, m_scene, CanvasScene::slotUpdateArchive);
    ROW(m_list, ArchiveList::itemSetDefaultState, m_scene, CanvasScene::slotMakeSceneThumnail);
    ROW(m_list, ArchiveList::startTemplatePicker, m_window, TitlerWindow::showTemplateDialog);
    ROW(m_list, ArchiveList::startUserTemplatePicker, m_window, TitlerWindow::showTemplateDialogOnUser);
    ROW(m_list, ArchiveList::cleanUndoStack, m_window, TitlerWindow::clearUndoStack);
    ROW(m_list, ArchiveList::widgetItemReleased, m_window, TitlerWindow::listWidgetReleasedEvent);
    ROW(m_list, ArchiveList::archiveListMenuShow, m_window, TitlerWindow::hideSoftWareWithDeleteEmptyItems);
    ROW(m_list, ArchiveList::signalStartPasteArchive, m_window, TitlerWindow::slotStartPasteArchive);
    ROW(m_list, ArchiveList::deleteCommandSignal, m_window, TitlerWindow::pushUndoStack);
    ROW(m_list, ArchiveList::pasteCommandSignal, m_window, TitlerWindow::pushUndoStack);
    ROW(m_list, ArchiveList::focusCommandSignal, m_window, TitlerWindow::pushUndoStack);
    ROW(m_list, ArchiveList::moveCommandSignal, m_window, TitlerWindow::pushUndoStack);
    ROW(m_window, TitlerWindow::moveButtonClicked, m_list, ArchiveList::moveButtonClicked);
    KSPushbutton* moveButton = nullptr;
    const auto buttons = m_window->findChildren<KSPushbutton*>();
    for (KSPushbutton* button : buttons)
        if (button->text() == m_window->tr("Move"))
            moveButton = button;
    QVERIFY(moveButton);
    ROW(moveButton, QPushButton::clicked, m_window, TitlerWindow::hideSoftWareWithDeleteEmptyItems);
    ROW(moveButton, QPushButton::clicked, m_window, TitlerWindow::editAndDoneButtonClicked);
    ROW(moveButton, QPushButton::pressed, m_window, TitlerWindow::moveButtonPressed);
    ROW(moveButton, QPushButton::released, m_window, TitlerWindow::moveButtonReleased);
    noRowIsMissing();
}

void tst_titlerwindow_wiring::dialogs()
{
    ROW(m_folders, FolderPicker::clearUndoCommandStack, m_window, TitlerWindow::clearUndoStack);
    ROW(m_folders, FolderPicker::signalCancelClicked, m_window, TitlerWindow::slotCancelClicked);
    ROW(m_folders, FolderPicker::changeFolderPath, m_list, ArchiveList::refreshArchiveList);
    ROW(m_folders, FolderPicker::changeFolderFile, m_list, ArchiveList::refreshArchiveListInFile);
    ROW(m_folders, FolderPicker::folderMoved, m_scene, CanvasScene::folderRenamed);
    ROW(m_folders, FolderPicker::folderNameChange, m_list,
        ArchiveList::refreshArchiveListForChangeFolderName);
    ROW(m_templates, TemplatePicker::selectedTemplate, m_window,
        TitlerWindow::slotStartCreateNewArchiveFromTemplate);
    ROW(m_templates, TemplatePicker::signalCloseSoftwareKeyBoardForFileManager, m_folders,
        FolderPicker::slotCloseSoftwareKeyBoardForFileManager);
    ROW(m_list, ArchiveList::addUserSignal, m_templates, TemplatePicker::slotSaveAsTemplate);
    noRowIsMissing();
}

void tst_titlerwindow_wiring::controllers()
{
    ROW(ShowTitlerController::getInstance(), ShowTitlerController::signalShowTitlerParameter, m_window,
        TitlerWindow::showTitlerWindow);
    ROW(EditContextController::getInstance(), EditContextController::signalShowTitlerParameter, m_window,
        TitlerWindow::showTitlerWindow);
    auto* setup = SystemSetupInfoController::getInstance();
    ROW(setup, SystemSetupInfoController::signalsInputLanguageInfo, m_window,
        TitlerWindow::slotInputLanguageChanged);
    ROW(setup, SystemSetupInfoController::signalsSystemLanguageInfo, m_window,
        TitlerWindow::slotSystemLanguageChanged);
    ROW(setup, SystemSetupInfoController::signalsSystemInfo, m_window, TitlerWindow::slotGetModuleInfo);
    ROW(TitlerPowerController::getInstance(), TitlerPowerController::signalPowerOff, m_window,
        TitlerWindow::slotPowerOff);
    auto* locks = TitlerAPPEventFilterController::getInstance();
    ROW(locks, TitlerAPPEventFilterController::signalRestoreOriginal, m_window,
        TitlerWindow::slotCancelArchiveListMoveMode);
    ROW(locks, TitlerAPPEventFilterController::signalRestoreOriginal, m_window,
        TitlerWindow::slotHideEdgeSlider);
    ROW(locks, TitlerAPPEventFilterController::signalRestoreOriginal, m_window,
        TitlerWindow::slotHideCanvasMenu);
    ROW(locks, TitlerAPPEventFilterController::signalRestoreOriginal, m_window,
        TitlerWindow::slotHideFontFamilyComboxList);
    ROW(locks, TitlerAPPEventFilterController::signalRestoreOriginal, m_window,
        TitlerWindow::slotHideFontSizeComboxList);
    auto* messages = ShowMessageController::getInstance();
    ROW(messages, ShowMessageController::signalsShowDialogMaskWidget, m_window,
        TitlerWindow::slotShowDialogMaskWidget);
    ROW(messages, ShowMessageController::signalsShowMessageMaskWidget, m_window,
        TitlerWindow::slotShowMessageMaskWidget);
    ROW(MessageBoxController::getInstance(), MessageBoxController::signalCloseMessage, m_window,
        TitlerWindow::continueCloseTitler);
    auto* files = EditTitlerController::getInstance();
    ROW(files, EditTitlerController::importNewFontFamilies, m_panel,
        TextToolsPanel::slotImportNewFontFamlies);
    ROW(files, EditTitlerController::folderNameChangeFromFileManager, m_folders,
        FolderPicker::folderNameChanged);
    ROW(files, EditTitlerController::folderDeleteFromFileManager, m_folders, FolderPicker::slotDeleteFolder);
    ROW(files, EditTitlerController::importNewUserTemplate, m_templates,
        TemplatePicker::slotImportNewUserTemplate);
    ROW(files, EditTitlerController::deleteUserTemplate, m_templates, TemplatePicker::slotDeleteUserTemplate);
    ROW(files, EditTitlerController::renameUserTemplate, m_templates, TemplatePicker::slotRenameUserTemplate);
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
        const int wanted = m_rows.value({sender, method.methodSignature()});
        const int made = Receivers::count(sender, method);
        if (made != wanted)
            strange.append(QStringLiteral("%1: %2 instead of %3").arg(name).arg(made).arg(wanted));
    }
    return strange;
}

void tst_titlerwindow_wiring::thereAreNoOthers()
{
    m_rows.clear();
    toolsBar();
    canvas();
    panel();
    list();
    dialogs();
    controllers();
    QStringList strange;
    for (const QObject* sender : std::initializer_list<const QObject*>{
             m_window, m_toolsBar, m_scene, m_panel, m_list, m_folders, m_templates,
             ShowTitlerController::getInstance(), EditContextController::getInstance(),
             SystemSetupInfoController::getInstance(), TitlerPowerController::getInstance(),
             ShowMessageController::getInstance(), EditTitlerController::getInstance()})
        strange.append(strangeSignals(sender));
    QVERIFY2(strange.isEmpty(), qPrintable(strange.join(QLatin1Char('\n'))));
    // A row that is made twice is seen, too.
    connect(m_toolsBar, &ToolsBar::closeButtonClick, m_window, &TitlerWindow::clearUndoStack);
    QCOMPARE(strangeSignals(m_toolsBar), QStringList{"ToolsBar::closeButtonClick: 2 instead of 1"});
    disconnect(m_toolsBar, &ToolsBar::closeButtonClick, m_window, &TitlerWindow::clearUndoStack);
}

QTEST_MAIN(tst_titlerwindow_wiring)
#include "tst_titlerwindow_wiring.moc"
