#include "app/TitlerWindow.h"

#include "app/APPEventFilter.h"
#include "app/EditContextController.h"
#include "app/MoveMode.h"
#include "app/RequestedPath.h"
#include "app/SavingNotice.h"
#include "app/SiblingLinks.h"
#include "app/ToolsBar.h"
#include "app/WindowDialogs.h"
#include "app/WindowLayout.h"
#include "app/WindowMasks.h"
#include "canvas/CanvasScene.h"
#include "canvas/GraphicsView.h"
#include "library/ArchiveList.h"
#include "library/FolderPicker.h"
#include "library/TemplatePicker.h"
#include "library/ThumbnailRender.h"
#include "panel/TextToolsPanel.h"
#include "support/ConfinedPath.h"
#include "support/LogManager.h"
#include "touchui/Balloon.h"
#include "touchui/KSInputContext.h"
#include "touchui/KSMenu.h"
#include "touchui/KSPushbutton.h"
#include "touchui/KSScrollViewerWidget.h"
#include "touchui/KSToolTip.h"
#include "touchui/WindowPlaceKeeper.h"

#include <QAction>
#include <QApplication>
#include <QCloseEvent>
#include <QDebug>
#include <QGraphicsView>
#include <QInputMethodEvent>
#include <QLabel>
#include <QMenu>
#include <QMouseEvent>
#include <QPainter>
#include <QPushButton>
#include <QSlider>
#include <QTimer>
#include <QUndoCommand>
#include <string>
#include <utility>

TitlerWindow* pMainWindow = nullptr;

const QRect TitlerWindow::MAIN_RECT(0, 0, 1920, 1080);
const QRect TitlerWindow::SCENE_RECT(0, 0, 1280, 720);
const QPoint TitlerWindow::STARTPOINT_OF_CANVASSCENE_BG(579, 75);
const QRect TitlerWindow::VSEPARATOR_RECT(QPoint(574, 10), QPoint(577, 1069));
const QRect TitlerWindow::HSEPARATOR_TOP_RECT(QPoint(578, 83), QPoint(1907, 86));
const QRect TitlerWindow::HSEPARATOR_BOTTOM_RECT(QPoint(578, 845), QPoint(1907, 848));
const QRect TitlerWindow::TEXT_PROPERTY_RECT(QPoint(578, 849), QPoint(1907, 1068));
const int TitlerWindow::ARCHIVELISTWIDGET_WIDTH = 549;
const double TitlerWindow::OPACITY_VALUE = 0.65;
bool TitlerWindow::WINDOW_IS_SHOWN = false;

namespace
{

constexpr int UNDO_LIMIT = 25;
constexpr int ARCHIVELISTWIDGET_HEIGHT = 997;
constexpr int TITLE_ROW_HEIGHT = 38;
constexpr int SYNC_DEADLINE = 10000; // ms
constexpr int LOG_NUMBER = 400;
constexpr int FOCUS_COMMAND_ID = 1;
constexpr int CANVAS_CHECKER = 2;

bool isGraphicsView(const QWidget* widget)
{
    // The widget may be the viewport of the view.
    for (; widget; widget = widget->parentWidget())
        if (qobject_cast<const QGraphicsView*>(widget))
            return true;
    return false;
}

} // namespace

TitlerWindow::TitlerWindow(bool deferArchiveList, QWidget* parent)
    : QMainWindow(parent, Qt::FramelessWindowHint)
{
    INIT_LOGGING(L"KS2Titler");
    setAppDefaultParameter();
    setAttribute(Qt::WA_AcceptTouchEvents);
    KSMenu::setMainWindow(this);
    KSScrollViewerWidget::s_mainWnd = this;
    ICanvasHost::setInstance(this);
    m_links = std::make_unique<SiblingLinks>();

    setWindowTitle(tr("Titler"));
    setGeometry(MAIN_RECT);
    new WindowPlaceKeeper(this); // owned by this window
    QPalette windowPalette = palette();
    windowPalette.setColor(QPalette::Window, Qt::black);
    setPalette(windowPalette);

    m_undoStack.setUndoLimit(UNDO_LIMIT);
    initWindowWidget(deferArchiveList);
    initChildWindows();
    connectWidget();
    Balloon::s_ParentWindow = this;
    KSToolTip::s_mainWindow = this;
    m_links->initProcessFactory();
    m_links->initProcessCommunications(winId());
    connectForController();
    m_archiveList->setMainScene(m_canvasScene);
    if (APPEventFilter* filter = APPEventFilter::instance())
        filter->registerEventFilter(this);
}

TitlerWindow::~TitlerWindow()
{
    // Prevents events of destroyed children from reaching a partly destroyed window.
    if (APPEventFilter* filter = APPEventFilter::instance())
        filter->unegisterEventFilter(this);
    // The canvas is deleted before the service links, through which its workers report.
    m_undoStack.clear();
    delete m_folderPicker;
    delete m_textToolsPanel;
    KSToolTip::clearInstance();
    KSToolTip::s_mainWindow = nullptr;
    Balloon::s_ParentWindow = nullptr;
    KSMenu::setMainWindow(nullptr);
    KSScrollViewerWidget::s_mainWnd.clear();
    delete m_archiveList;
    delete m_graphicsView;
    delete m_canvasScene;

    ICanvasHost::setInstance(nullptr);
    m_links.reset();
    UNINIT_LOGGING();
}

void TitlerWindow::setAppDefaultParameter()
{
    QApplication::setFont(QFont(QStringLiteral("KST-Medium"), 12));
    const QPalette before = QApplication::palette();
    QPalette applicationPalette;
    applicationPalette.setColor(QPalette::Highlight, Qt::darkBlue);
    applicationPalette.setColor(QPalette::HighlightedText, QColor(0, 0, 0, 0));
    QApplication::setPalette(applicationPalette);
    QApplication::setPalette(before, "QObject");
}

// --- Building -------------------------------------------------------------------------------------------

void TitlerWindow::initWindowWidget(bool deferArchiveList)
{
    createToolsBar();
    createCanvasScene();
    QWidget* leftColumn = createArchiveList(deferArchiveList);
    createTextToolsPanel();
    WindowLayout::arrange(this, leftColumn, m_toolsBar, m_graphicsView, m_textToolsPanel);
}

void TitlerWindow::createToolsBar()
{
    m_toolsBar = new ToolsBar(m_undoStack.createUndoAction(this), m_undoStack.createRedoAction(this), this);
}

void TitlerWindow::createCanvasScene()
{
    m_canvasScene = new CanvasScene(std::make_unique<ThumbnailRender>(), this);
    m_canvasScene->setSceneRect(SCENE_RECT);
    m_graphicsView = new GraphicsView(m_canvasScene, this);
    m_graphicsView->setStyleSheet(QStringLiteral("background-color:transparent; border:0"));
    m_graphicsView->setFixedSize(SCENE_RECT.size());
    connect(m_graphicsView, &GraphicsView::deleteEmptyItem, this, &TitlerWindow::slotDeleteEmptyItems);
}

// Returns the left column: the title row above the list.
QWidget* TitlerWindow::createArchiveList(bool deferArchiveList)
{
    auto* pathLabel = new QLabel;
    pathLabel->setStyleSheet(QStringLiteral("color:rgb(220,220,220); text-align:left; font:28px;"));
    // Fixed, since lines are higher in some families, and the list below has a frame at a fixed place.
    pathLabel->setFixedHeight(TITLE_ROW_HEIGHT);

    m_moveMode = std::make_unique<MoveMode>(this);
    connect(m_moveMode->button(), &QPushButton::clicked, this, &TitlerWindow::editAndDoneButtonClicked);
    connect(m_moveMode->button(), &QPushButton::pressed, this, &TitlerWindow::moveButtonPressed);
    connect(m_moveMode->button(), &QPushButton::released, this, &TitlerWindow::moveButtonReleased);

    m_archiveList = new ArchiveList(pathLabel, !deferArchiveList, this);
    m_archiveList->setFixedSize(ARCHIVELISTWIDGET_WIDTH, ARCHIVELISTWIDGET_HEIGHT);
    return WindowLayout::leftColumn(this, pathLabel, m_moveMode->button(), m_archiveList);
}

void TitlerWindow::createTextToolsPanel()
{
    m_textToolsPanel = new TextToolsPanel(this);
}

void TitlerWindow::initChildWindows()
{
    m_savingNotice = new SavingNotice(this);
    m_folderPicker = new FolderPicker(this);
    m_templatePicker = new TemplatePicker(this);
    m_masks = std::make_unique<WindowMasks>(this, m_textToolsPanel, m_folderPicker, m_templatePicker);
    m_dialogs = std::make_unique<WindowDialogs>(this, m_masks.get(), m_folderPicker, m_templatePicker);
}

// --- Events ---------------------------------------------------------------------------------------------

void TitlerWindow::paintEvent(QPaintEvent* event)
{
    QMainWindow::paintEvent(event);
    QPainter painter(this);
    m_background.paint(painter);
}

void TitlerWindow::resizeEvent(QResizeEvent* event)
{
    Q_EMIT titlerWindowGeometry(geometry());
    QMainWindow::resizeEvent(event);
}

void TitlerWindow::showEvent(QShowEvent* event)
{
    WINDOW_IS_SHOWN = true;
    QMainWindow::showEvent(event);
}

void TitlerWindow::hideEvent(QHideEvent* event)
{
    m_canvasScene->endPreview(); // the palette is a separate window
    WINDOW_IS_SHOWN = false;
    if (!event->spontaneous()) {
        // The process that requested a mask may remove it much later, or never.
        slotShowDialogMaskWidget(false);
        slotShowMessageMaskWidget(false);
        if (KSInputContext* context = m_links->inputContext())
            context->setWindowID(winId());
    }
    QMainWindow::hideEvent(event);
}

// Treats a close by the window manager like the Close button, so the process continues.
void TitlerWindow::closeEvent(QCloseEvent* event)
{
    if (m_sessionEnd.closesWindow()) {
        QMainWindow::closeEvent(event);
        QCoreApplication::quit();
        return;
    }
    event->ignore();
    closeTitlerWindow();
}

void TitlerWindow::mousePressEvent(QMouseEvent* event)
{
    QWidget* child = childAt(mapFromGlobal(QCursor::pos()));
    QString places;
    QDebug(&places) << "#POS#:" << child << QCursor::pos() << event->position() << event->globalPosition();
    LOG_DEBUG_OPERATE(L"TitlerWindow", 200, places.toStdWString());
    if (TEXT_PROPERTY_RECT.contains(mapFromGlobal(event->globalPosition().toPoint()))) {
        QMainWindow::mousePressEvent(event);
        QMainWindow::mousePressEvent(event);
        return;
    }
    if (!isGraphicsView(child))
        hideSoftWareWithDeleteEmptyItems();
    QMainWindow::mousePressEvent(event);
}

bool TitlerWindow::eventFilter(QObject* obj, QEvent* event)
{
    if (m_archiveList->getMoveState())
        return false;
    if (ignoreMouseAndTouchEventWhenArchiveListIsMoveMode(obj, event))
        return true;
    switch (event->type()) {
    case QEvent::MouseButtonPress:
    case QEvent::TouchBegin:
        if (qobject_cast<QMenu*>(obj))
            return false;
        m_archiveList->clearOperationItemState(m_archiveList->getCurrentOperationArchive());
        break;
    case QEvent::MouseButtonRelease:
        if (obj == m_archiveList)
            hideSoftWareWithOutDeleteEmptyItems();
        break;
    default:
        break;
    }
    return ignoreTouchEventWhenSliderIsShowing(obj, event);
}

// Ignores touches of all other widgets while the slider of the edge is open.
bool TitlerWindow::ignoreTouchEventWhenSliderIsShowing(QObject* obj, QEvent* event) const
{
    switch (event->type()) {
    case QEvent::TouchBegin:
    case QEvent::TouchUpdate:
    case QEvent::TouchEnd:
        return obj && !qobject_cast<QSlider*>(obj) && m_textToolsPanel->edgeSliderIsShown();
    default:
        return false;
    }
}

bool TitlerWindow::ignoreMouseAndTouchEventWhenArchiveListIsMoveMode(QObject* obj, QEvent* event)
{
    if (!m_moveMode->isEndedBy(obj, event, m_archiveList))
        return false;
    slotCancelArchiveListMoveMode();
    if (event->type() == QEvent::TouchBegin)
        slotCancelArchiveListMoveMode(); // the siblings receive two reports for a touch
    return true;
}

// --- A session, from the request to the answer -----------------------------------------------------------

void TitlerWindow::showTitlerWindow(titler_paramter paramter)
{
    if (!isHidden())
        return;
    m_unsavedWork.takeQuestion();
    const RequestedPath path(QString::fromStdWString(paramter.path));
    // A window that is hidden right after it was shown confuses window managers: they may handle the end of
    // it so late that they unmap the window of the next request.
    if (paramter.mode != _titler_paramter::CREATE_OR_EDIT || path.canBeOpened()) {
        show();
        activateWindow();
        raise();
    }
    m_links->changeTopWindow(MessageDefine::TOP_WINDOW_TITLER);
    m_links->setMessageMainWindow(this);
    m_canvasScene->setModuleInfo(m_emModuleInfo);
    m_textToolsPanel->setModuleInfo(m_emModuleInfo);
    m_textToolsPanel->initTextToolsPanel();
    m_templatePicker->setModuleInfo(m_emModuleInfo);

    m_toolsBar->setFolderButtonEnabled(true);
    m_dialogs->initFolderPicker();
    beginSession(paramter);

    if (const std::optional<QString> font = std::exchange(m_missingFont, std::nullopt))
        m_links->postMessage(MessageDef::MESSAGE_FONT_MISSING, *font);
    m_links->getInputLanguage();
    changeFontComboxItem(m_emModuleInfo);
}

void TitlerWindow::beginSession(const titler_paramter& parameter)
{
    m_sessionEnd.beginSession(parameter.mode == _titler_paramter::CREATE_OR_EDIT);
    if (parameter.mode == _titler_paramter::CREATE_OR_EDIT) {
        m_toolsBar->setFolderButtonEnabled(false);
        m_folderPicker->setDuplicateButtonEnabled(false);
        m_folderPicker->setCreateFolderButtonEnabled(false);
        refreshArchiveList(QString::fromStdWString(parameter.path));
    } else if (parameter.mode == _titler_paramter::SUB_PANEL) {
        EditContextController::getInstance()->setITitlerNoCallBack();
        m_folderPicker->updateTreeView();
        showFolderDialog();
    }
}

void TitlerWindow::refreshArchiveList(QString path)
{
    const RequestedPath requested(path);
    switch (requested.target()) {
    case RequestedPath::Target::Choice:
        m_folderPicker->updateTreeView();
        showFolderDialog();
        return;
    case RequestedPath::Target::Folder:
        m_archiveList->refreshArchiveList(path);
        break;
    case RequestedPath::Target::Title:
        m_archiveList->refreshArchiveListInFile(requested.folder(), requested.fileName());
        break;
    case RequestedPath::Target::Outside:
        ConfinedPath::logRefusal(L"a request asks for what lies outside: ", path.toStdString());
        hide(); // same as for a path that does not exist
        break;
    case RequestedPath::Target::Missing:
        hide();
        break;
    }
    markOpenFolder();
}

void TitlerWindow::closeTitlerWindow()
{
    m_archiveList->stopArchiveListTapAndHoldTimer();
    if (archiveListIsMoveMode())
        slotCancelArchiveListMoveMode(); // a dragged title gets its place while the folder is still open
    m_archiveList->slotHideOptionMenu();
    const QString path = m_archiveList->getCurrentPath();
    saveCurrentTitle();
    clearUndoStack();
    m_textToolsPanel->setSignalValue(false);
    m_archiveList->synchronizationFolderFile();
    m_textToolsPanel->initTextToolsPanel();
    m_links->editFolderEnds(path);
    m_toolsBar->resetToDefaultState();
    resetCanvasBackground();
    waitUntilSaved();
    if (m_unsavedWork.ask(*m_links))
        return; // continueCloseTitler() is called with the answer

    EditContextController* context = EditContextController::getInstance();
    if (m_sessionEnd.asksFirst() && context->isMainNeedMsg()) {
        m_links->postMessage(MessageDef::MESSAGE_CONFIRM_CLOSE);
        context->setITitlerNoCallBack();
        return;
    }
    closeTitlerMainWindow();
}

void TitlerWindow::resetCanvasBackground()
{
    QAction checker(nullptr);
    checker.setData(CANVAS_CHECKER);
    m_canvasScene->slotShowCanvasBG(&checker);
}

void TitlerWindow::closeTitlerMainWindow()
{
    const QString path = m_archiveList->getCurrentPath();
    if (m_sessionEnd.closesWindow())
        close();
    else
        hideSession();
    m_dialogs->takeOpenedFromEditor();
    m_links->simpleCloseSoftKeyboard();
    EditContextController::getInstance()->sentITitlerCallBack(path.toStdWString());
    EditContextController::getInstance()->setITitlerNoCallBack();
    m_links->changeTopWindow(MessageDefine::TOP_WINDOW_MAIN);
    // All files are renamed into place. Nobody waits for the disk to sync them; those that are not synced
    // after the deadline are only logged.
    QTimer::singleShot(SYNC_DEADLINE, this, &UnsavedWork::logUnsynced);
}

void TitlerWindow::hideSession()
{
    m_templatePicker->reject(); // the answer to a message may arrive while it is open
    m_folderPicker->setCurrentFolderName(QString());
    m_toolsBar->hideCanvasMenu(); // the menu is a separate window
    hide();
    m_canvasScene->clearCanvas();
    m_archiveList->cleanArchiveList();
    m_archiveList->clearCopyArchive();
}

void TitlerWindow::continueCloseTitler(MessageDefine::tagCloseParam param)
{
    if (isHidden() || param.messageId != MessageDef::MESSAGE_CONFIRM_CLOSE)
        return;
    if (m_unsavedWork.takeQuestion()) {
        if (param.closeType != MessageDefine::CLOSE_OK) {
            // The session continues, although the siblings were told that the folder is free.
            m_links->editFolderStarts(m_archiveList->getCurrentPath());
            return;
        }
        UnsavedWork::giveUp();
    }
    closeTitlerMainWindow();
}

bool TitlerWindow::dataSaveIsFinished()
{
    return m_canvasScene->isEditFinish();
}

void TitlerWindow::waitUntilSaved()
{
    if (!dataSaveIsFinished()) {
        if (isVisible())
            m_savingNotice->showAtOnce();
        if (!m_canvasScene->waitForPictures())
            LOG_DEBUG_OPERATE(L"TitlerWindow", LOG_NUMBER, L"pictures are still being written");
        m_savingNotice->hide();
    }
    // The picture thread posts its reports to this thread. Deliver them now, before later messages and before
    // the process ends.
    m_links->sendTitleReports();
}

void TitlerWindow::saveCurrentTitle()
{
    m_graphicsView->cancelTouch(); // a dragged object is saved at its old place
    m_canvasScene->leaveTitle();
}

void TitlerWindow::endProcess()
{
    if (!m_sessionEnd.beginEndOfProcess())
        return;
    m_folderPicker->done(QDialog::Rejected); // closes the dialog even if its Cancel is disabled
    saveCurrentTitle();
    waitUntilSaved();
    UnsavedWork::giveUp();
    if (!KSInputContext::isSoftKeyboardClosed())
        m_links->simpleCloseSoftKeyboard(); // otherwise the keyboard stays open after the process has ended
    close();
    QApplication::closeAllWindows();
    QCoreApplication::quit();
}

// --- Dialogs --------------------------------------------------------------------------------------------

void TitlerWindow::showFolderDialog()
{
    m_dialogs->showFolderDialog();
}

void TitlerWindow::openFolderDialog()
{
    m_archiveList->stopArchiveListTapAndHoldTimer();
    if (isHidden())
        return;
    m_dialogs->noteOpenedFromEditor();
    hideSoftWareWithDeleteEmptyItems();
    m_canvasScene->slotMakeSceneThumnail();
    m_folderPicker->setCancelButtonEnabled(!m_archiveList->isEmpty());
    m_archiveList->synchronizationFolderFile();
    clearUndoStack();
    m_folderPicker->updateTreeView();
    markOpenFolder();
    showFolderDialog();
    m_toolsBar->setFolderButtonRest();
}

// Marks the open folder in the picker: it cannot be renamed there, and renames by other processes are
// followed.
void TitlerWindow::markOpenFolder()
{
    m_folderPicker->setCurrentFolderName(
        m_archiveList->getCurrentPath().section(QLatin1Char('/'), -1, -1, QString::SectionSkipEmpty));
}

void TitlerWindow::slotCancelClicked()
{
    if (!m_dialogs->takeOpenedFromEditor()) {
        if (m_sessionEnd.closesWindow()) {
            close();
        } else {
            m_folderPicker->setCurrentFolderName(QString());
            hide();
            m_links->simpleCloseSoftKeyboard();
        }
    }
    if (WINDOW_IS_SHOWN)
        return;
    EditContextController::getInstance()->setITitlerNoCallBack();
    m_links->changeTopWindow(MessageDefine::TOP_WINDOW_MAIN);
    m_links->editFolderEnds(m_archiveList->getCurrentPath());
}

void TitlerWindow::showTemplateDialog()
{
    m_dialogs->showTemplateDialog();
}

void TitlerWindow::showTemplateDialogOnUser()
{
    m_templatePicker->showUserTemplateTab();
    showTemplateDialog();
}

void TitlerWindow::slotStartCreateNewArchiveFromTemplate(Archive* archiveData)
{
    m_archiveList->createArchiveFromTemplate(archiveData);
    m_canvasScene->createThumnailPicture();
}

void TitlerWindow::slotShowDialogMaskWidget(bool isShow)
{
    if (!isShow || WINDOW_IS_SHOWN)
        m_masks->showDialogMaskWidget(isShow);
}

void TitlerWindow::slotShowMessageMaskWidget(bool isShow)
{
    if (!isShow || WINDOW_IS_SHOWN)
        m_masks->showMessageMaskWidget(isShow);
}

// --- Undo, and what the canvas and the list are asked for --------------------------------------------------

// Drops a change of the selected title while the stack is clean, so that the stack stays clean.
void TitlerWindow::pushUndoStack(QUndoCommand* subUndoCommand)
{
    if (m_undoStack.isClean() && subUndoCommand->id() == FOCUS_COMMAND_ID) {
        delete subUndoCommand;
        return;
    }
    m_undoStack.push(subUndoCommand);
}

void TitlerWindow::clearUndoStack()
{
    m_undoStack.clear();
    if (ArchiveItem* item = m_archiveList->getCurrentOperationArchive())
        m_archiveList->clearOperationItemState(item);
}

void TitlerWindow::slotStartPasteArchive()
{
    m_canvasScene->createThumnailPicture();
}

void TitlerWindow::slotNewTextButtonClicked()
{
    m_canvasScene->slotInsertNewTextItem();
}

void TitlerWindow::pressDelectButton()
{
    m_canvasScene->deleteSelectedItems();
    m_links->dummyCloseSoftKeyboard();
}

// The checker pattern is part of the window's own picture behind the canvas.
void TitlerWindow::slotCanvasButtonClicked(QAction*)
{
    update();
}

void TitlerWindow::setHasMessageToShowInformation(bool isNeedShow, QString defaultFont)
{
    m_missingFont = isNeedShow ? std::optional(std::move(defaultFont)) : std::nullopt;
}

// --- Leaving text editing --------------------------------------------------------------------------------

void TitlerWindow::leaveTextEditing(bool deleteEmptyItems)
{
    const bool isEditing = m_canvasScene->itemIsEditorInteraction();
    if (isEditing || m_canvasScene->itemIsSelectionMode()) {
        if (isEditing)
            m_canvasScene->clearItemsSelectionAndFocus();
        else
            m_canvasScene->clearItemsSelectionMode();
        if (deleteEmptyItems)
            slotDeleteEmptyItems();
        m_canvasScene->disableTextPropertyArea();
        if (isEditing && deleteEmptyItems)
            LOG_DEBUG_OPERATE(L"TitlerWindow", 200, L"hideSoftWareWithDeleteEmptyItems");
    }
    m_links->dummyCloseSoftKeyboard();
}

void TitlerWindow::slotDeleteEmptyItems()
{
    // widgetAt() returns the viewport of a view, not the view itself. So a tap on the canvas beside an empty
    // text deletes the text.
    if (!qobject_cast<QGraphicsView*>(QApplication::widgetAt(QCursor::pos())))
        m_canvasScene->slotDeleteEmptyItems();
}

// --- Move mode ------------------------------------------------------------------------------------------

bool TitlerWindow::archiveListIsMoveMode() const
{
    return m_moveMode->isOn();
}

void TitlerWindow::editAndDoneButtonClicked()
{
    // Commits the input method's text before editing ends.
    if (KSInputContext* context = m_links->inputContext())
        context->sendEvent(QInputMethodEvent());
    KSPushbutton* button = m_moveMode->button();
    button->setStyleSheet(button->styleSheet());
    const bool on = !archiveListIsMoveMode();
    sendTransientControlEvent(on);
    changeMoveMode(on);
}

void TitlerWindow::changeMoveMode(bool on)
{
    m_moveMode->setOn(on);
    Q_EMIT moveButtonClicked(on);
}

void TitlerWindow::slotChangeDoneToMoveMode()
{
    if (archiveListIsMoveMode())
        editAndDoneButtonClicked();
}

void TitlerWindow::slotCancelArchiveListMoveMode()
{
    reportHiddenControl();
    changeMoveMode(false);
}

void TitlerWindow::moveButtonPressed()
{
    m_moveMode->showPressed();
}

void TitlerWindow::moveButtonReleased()
{
    m_moveMode->showReleased();
}

// --- Lock reporting -------------------------------------------------------------------------------------

// Reports to the siblings that a control that closes on a press elsewhere was opened or closed.
void TitlerWindow::sendTransientControlEvent(bool on)
{
    m_links->sendAPPEvent(APPEventDefine::LOCKTYPE_OBJECT, on);
}

void TitlerWindow::reportHiddenControl()
{
    if (WINDOW_IS_SHOWN)
        sendTransientControlEvent(false);
}

void TitlerWindow::slotHideEdgeSlider()
{
    m_textToolsPanel->hideEdgeSlider();
    reportHiddenControl();
}

void TitlerWindow::slotHideCanvasMenu()
{
    m_toolsBar->hideCanvasMenu();
    reportHiddenControl();
}

void TitlerWindow::slotHideFontFamilyComboxList()
{
    m_textToolsPanel->hideFontFamilyComboxList();
    reportHiddenControl();
}

void TitlerWindow::slotHideFontSizeComboxList()
{
    m_textToolsPanel->hideFontSizeComboxList();
    reportHiddenControl();
}

// --- Language and module --------------------------------------------------------------------------------

void TitlerWindow::slotSystemLanguageChanged(SystemSetupDef::emSystemLanguageType systemLanguage)
{
    if (m_language.switchTranslator(systemLanguage))
        retranslateUI();
    useSpecifiedFont(WindowLanguage::fontFamily(systemLanguage));
    m_templatePicker->reloadTemplates(systemLanguage);
}

void TitlerWindow::slotInputLanguageChanged(SystemSetupDef::emInputLanguageType inputLanguage)
{
    m_canvasScene->slotSceneInputLanguageChanged(inputLanguage);
    m_textToolsPanel->displayInputLanguage(inputLanguage);
}

void TitlerWindow::slotGetModuleInfo(SystemSetupDef::emInformationModel moduleInfo)
{
    m_emModuleInfo = moduleInfo;
    m_canvasScene->setModuleInfo(moduleInfo);
    m_textToolsPanel->setModuleInfo(moduleInfo);
    m_templatePicker->setModuleInfo(moduleInfo);
}

void TitlerWindow::retranslateUI()
{
    setWindowTitle(tr("Titler"));
    m_moveMode->translateText();
    m_textToolsPanel->translateText();
    m_toolsBar->translateText();
    m_folderPicker->translateText();
    m_archiveList->translateText();
    m_templatePicker->translateText();
}

void TitlerWindow::useSpecifiedFont(const QString& family)
{
    m_folderPicker->setSystemLanFont(QFont(family));
    setStyleSheet(QStringLiteral(" * {font-family:'%1';}").arg(family));
    m_archiveList->setSystemLanFont(family);
    m_templatePicker->setSystemLanFont(QFont(family));
}

void TitlerWindow::changeFontComboxItem(SystemSetupDef::emInformationModel moduleInfo)
{
    Q_EMIT modifyFontComboxItem(moduleInfo != SystemSetupDef::emInformationModelChina);
}
