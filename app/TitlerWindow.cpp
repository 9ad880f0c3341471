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
    mLinks = std::make_unique<SiblingLinks>();

    setWindowTitle(tr("Titler"));
    setGeometry(MAIN_RECT);
    new WindowPlaceKeeper(this); // owned by this window
    QPalette windowPalette = palette();
    windowPalette.setColor(QPalette::Window, Qt::black);
    setPalette(windowPalette);

    mUndoStack.setUndoLimit(UNDO_LIMIT);
    initWindowWidget(deferArchiveList);
    initChildWindows();
    connectWidget();
    Balloon::s_ParentWindow = this;
    KSToolTip::s_mainWindow = this;
    mLinks->initProcessFactory();
    mLinks->initProcessCommunications(winId());
    connectForController();
    mArchiveList->setMainScene(mCanvasScene);
    if (APPEventFilter* filter = APPEventFilter::instance())
        filter->registerEventFilter(this);
}

TitlerWindow::~TitlerWindow()
{
    // Prevents events of destroyed children from reaching a partly destroyed window.
    if (APPEventFilter* filter = APPEventFilter::instance())
        filter->unegisterEventFilter(this);
    // The canvas is deleted before the service links, through which its workers report.
    mUndoStack.clear();
    delete mFolderPicker;
    delete mTextToolsPanel;
    KSToolTip::clearInstance();
    KSToolTip::s_mainWindow = nullptr;
    Balloon::s_ParentWindow = nullptr;
    KSMenu::setMainWindow(nullptr);
    KSScrollViewerWidget::s_mainWnd.clear();
    delete mArchiveList;
    delete mGraphicsView;
    delete mCanvasScene;

    ICanvasHost::setInstance(nullptr);
    mLinks.reset();
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
    WindowLayout::arrange(this, leftColumn, mToolsBar, mGraphicsView, mTextToolsPanel);
}

void TitlerWindow::createToolsBar()
{
    mToolsBar = new ToolsBar(mUndoStack.createUndoAction(this), mUndoStack.createRedoAction(this), this);
}

void TitlerWindow::createCanvasScene()
{
    mCanvasScene = new CanvasScene(std::make_unique<ThumbnailRender>(), this);
    mCanvasScene->setSceneRect(SCENE_RECT);
    mGraphicsView = new GraphicsView(mCanvasScene, this);
    mGraphicsView->setStyleSheet(QStringLiteral("background-color:transparent; border:0"));
    mGraphicsView->setFixedSize(SCENE_RECT.size());
    connect(mGraphicsView, &GraphicsView::deleteEmptyItem, this, &TitlerWindow::slotDeleteEmptyItems);
}

// Returns the left column: the title row above the list.
QWidget* TitlerWindow::createArchiveList(bool deferArchiveList)
{
    auto* pathLabel = new QLabel;
    pathLabel->setStyleSheet(QStringLiteral("color:rgb(220,220,220); text-align:left; font:28px;"));
    // Fixed, since lines are higher in some families, and the list below has a frame at a fixed place.
    pathLabel->setFixedHeight(TITLE_ROW_HEIGHT);

    mMoveMode = std::make_unique<MoveMode>(this);
    connect(mMoveMode->button(), &QPushButton::clicked, this, &TitlerWindow::editAndDoneButtonClicked);
    connect(mMoveMode->button(), &QPushButton::pressed, this, &TitlerWindow::moveButtonPressed);
    connect(mMoveMode->button(), &QPushButton::released, this, &TitlerWindow::moveButtonReleased);

    mArchiveList = new ArchiveList(pathLabel, !deferArchiveList, this);
    mArchiveList->setFixedSize(ARCHIVELISTWIDGET_WIDTH, ARCHIVELISTWIDGET_HEIGHT);
    return WindowLayout::leftColumn(this, pathLabel, mMoveMode->button(), mArchiveList);
}

void TitlerWindow::createTextToolsPanel()
{
    mTextToolsPanel = new TextToolsPanel(this);
}

void TitlerWindow::initChildWindows()
{
    mSavingNotice = new SavingNotice(this);
    mFolderPicker = new FolderPicker(this);
    mTemplatePicker = new TemplatePicker(this);
    mMasks = std::make_unique<WindowMasks>(this, mTextToolsPanel, mFolderPicker, mTemplatePicker);
    mDialogs = std::make_unique<WindowDialogs>(this, mMasks.get(), mFolderPicker, mTemplatePicker);
}

// --- Events ---------------------------------------------------------------------------------------------

void TitlerWindow::paintEvent(QPaintEvent* event)
{
    QMainWindow::paintEvent(event);
    QPainter painter(this);
    mBackground.paint(painter);
}

void TitlerWindow::resizeEvent(QResizeEvent* event)
{
    mBackground.makeFrames();
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
    mCanvasScene->endPreview(); // the palette is a separate window
    WINDOW_IS_SHOWN = false;
    if (!event->spontaneous()) {
        // The process that requested a mask may remove it much later, or never.
        slotShowDialogMaskWidget(false);
        slotShowMessageMaskWidget(false);
        if (KSInputContext* context = mLinks->inputContext())
            context->setWindowID(winId());
    }
    QMainWindow::hideEvent(event);
}

// Treats a close by the window manager like the Close button, so the process continues.
void TitlerWindow::closeEvent(QCloseEvent* event)
{
    if (mSessionEnd.closesWindow()) {
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
    if (mArchiveList->getMoveState())
        return false;
    if (ignoreMouseAndTouchEventWhenArchiveListIsMoveMode(obj, event))
        return true;
    switch (event->type()) {
    case QEvent::MouseButtonPress:
    case QEvent::TouchBegin:
        if (qobject_cast<QMenu*>(obj))
            return false;
        mArchiveList->clearOperationItemState(mArchiveList->getCurrentOperationArchive());
        break;
    case QEvent::MouseButtonRelease:
        if (obj == mArchiveList)
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
        return obj && !qobject_cast<QSlider*>(obj) && mTextToolsPanel->edgeSliderIsShown();
    default:
        return false;
    }
}

bool TitlerWindow::ignoreMouseAndTouchEventWhenArchiveListIsMoveMode(QObject* obj, QEvent* event)
{
    if (!mMoveMode->isEndedBy(obj, event, mArchiveList))
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
    mUnsavedWork.takeQuestion();
    const RequestedPath path(QString::fromStdWString(paramter.path));
    // A window that is hidden right after it was shown confuses window managers: they may handle the end of
    // it so late that they unmap the window of the next request.
    if (paramter.mode != _titler_paramter::CREATE_OR_EDIT || path.canBeOpened()) {
        show();
        activateWindow();
        raise();
    }
    mLinks->changeTopWindow(MessageDefine::TOP_WINDOW_TITLER);
    mLinks->setMessageMainWindow(this);
    mCanvasScene->setModuleInfo(m_emModuleInfo);
    mTextToolsPanel->setModuleInfo(m_emModuleInfo);
    mTextToolsPanel->initTextToolsPanel();
    mTemplatePicker->setModuleInfo(m_emModuleInfo);

    mToolsBar->setFolderButtonEnabled(true);
    mDialogs->initFolderPicker();
    beginSession(paramter);

    if (const std::optional<QString> font = std::exchange(mMissingFont, std::nullopt))
        mLinks->postMessage(MessageDef::MESSAGE_FONT_MISSING, *font);
    mLinks->getInputLanguage();
    changeFontComboxItem(m_emModuleInfo);
}

void TitlerWindow::beginSession(const titler_paramter& parameter)
{
    mSessionEnd.beginSession(parameter.mode == _titler_paramter::CREATE_OR_EDIT);
    if (parameter.mode == _titler_paramter::CREATE_OR_EDIT) {
        mToolsBar->setFolderButtonEnabled(false);
        mFolderPicker->setDuplicateButtonEnabled(false);
        mFolderPicker->setCreateFolderButtonEnabled(false);
        refreshArchiveList(QString::fromStdWString(parameter.path));
    } else if (parameter.mode == _titler_paramter::SUB_PANEL) {
        EditContextController::getInstance()->setITitlerNoCallBack();
        mFolderPicker->updateTreeView();
        showFolderDialog();
    }
}

void TitlerWindow::refreshArchiveList(QString path)
{
    const RequestedPath requested(path);
    switch (requested.target()) {
    case RequestedPath::Target::Choice:
        mFolderPicker->updateTreeView();
        showFolderDialog();
        return;
    case RequestedPath::Target::Folder:
        mArchiveList->refreshArchiveList(path);
        break;
    case RequestedPath::Target::Title:
        mArchiveList->refreshArchiveListInFile(requested.folder(), requested.fileName());
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
    mArchiveList->stopArchiveListTapAndHoldTimer();
    if (archiveListIsMoveMode())
        slotCancelArchiveListMoveMode(); // a dragged title gets its place while the folder is still open
    mArchiveList->slotHideOptionMenu();
    const QString path = mArchiveList->getCurrentPath();
    saveCurrentTitle();
    clearUndoStack();
    mTextToolsPanel->setSignalValue(false);
    mArchiveList->synchronizationFolderFile();
    mTextToolsPanel->initTextToolsPanel();
    mLinks->editFolderEnds(path);
    mToolsBar->resetToDefaultState();
    resetCanvasBackground();
    waitUntilSaved();
    if (mUnsavedWork.ask(*mLinks))
        return; // continueCloseTitler() is called with the answer

    EditContextController* context = EditContextController::getInstance();
    if (mSessionEnd.asksFirst() && context->isMainNeedMsg()) {
        mLinks->postMessage(MessageDef::MESSAGE_CONFIRM_CLOSE);
        context->setITitlerNoCallBack();
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
    if (mSessionEnd.closesWindow())
        close();
    else
        hideSession();
    mDialogs->takeOpenedFromEditor();
    mLinks->simpleCloseSoftKeyboard();
    EditContextController::getInstance()->sentITitlerCallBack(path.toStdWString());
    EditContextController::getInstance()->setITitlerNoCallBack();
    mLinks->changeTopWindow(MessageDefine::TOP_WINDOW_MAIN);
    // All files are renamed into place. Nobody waits for the disk to sync them; those that are not synced
    // after the deadline are only logged.
    QTimer::singleShot(SYNC_DEADLINE, this, &UnsavedWork::logUnsynced);
}

void TitlerWindow::hideSession()
{
    mTemplatePicker->reject(); // the answer to a message may arrive while it is open
    mFolderPicker->setCurrentFolderName(QString());
    mToolsBar->hideCanvasMenu(); // the menu is a separate window
    hide();
    mCanvasScene->clearCanvas();
    mArchiveList->cleanArchiveList();
    mArchiveList->clearCopyArchive();
}

void TitlerWindow::continueCloseTitler(MessageDefine::tagCloseParam param)
{
    if (isHidden() || param.messageId != MessageDef::MESSAGE_CONFIRM_CLOSE)
        return;
    if (mUnsavedWork.takeQuestion()) {
        if (param.closeType != MessageDefine::CLOSE_OK) {
            // The session continues, although the siblings were told that the folder is free.
            mLinks->editFolderStarts(mArchiveList->getCurrentPath());
            return;
        }
        UnsavedWork::giveUp();
    }
    closeTitlerMainWindow();
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
            LOG_DEBUG_OPERATE(L"TitlerWindow", LOG_NUMBER, L"pictures are still being written");
        mSavingNotice->hide();
    }
    // The picture thread posts its reports to this thread. Deliver them now, before later messages and before
    // the process ends.
    mLinks->sendTitleReports();
}

void TitlerWindow::saveCurrentTitle()
{
    mGraphicsView->cancelTouch(); // a dragged object is saved at its old place
    mCanvasScene->leaveTitle();
}

void TitlerWindow::endProcess()
{
    if (!mSessionEnd.beginEndOfProcess())
        return;
    mFolderPicker->done(QDialog::Rejected); // closes the dialog even if its Cancel is disabled
    saveCurrentTitle();
    waitUntilSaved();
    UnsavedWork::giveUp();
    if (!KSInputContext::isSoftKeyboardClosed())
        mLinks->simpleCloseSoftKeyboard(); // otherwise the keyboard stays open after the process has ended
    close();
    QApplication::closeAllWindows();
    QCoreApplication::quit();
}

// --- Dialogs --------------------------------------------------------------------------------------------

void TitlerWindow::showFolderDialog()
{
    mDialogs->showFolderDialog();
}

void TitlerWindow::openFolderDialog()
{
    mArchiveList->stopArchiveListTapAndHoldTimer();
    if (isHidden())
        return;
    mDialogs->noteOpenedFromEditor();
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

// Marks the open folder in the picker: it cannot be renamed there, and renames by other processes are
// followed.
void TitlerWindow::markOpenFolder()
{
    mFolderPicker->setCurrentFolderName(
        mArchiveList->getCurrentPath().section(QLatin1Char('/'), -1, -1, QString::SectionSkipEmpty));
}

void TitlerWindow::slotCancelClicked()
{
    if (!mDialogs->takeOpenedFromEditor()) {
        if (mSessionEnd.closesWindow()) {
            close();
        } else {
            mFolderPicker->setCurrentFolderName(QString());
            hide();
            mLinks->simpleCloseSoftKeyboard();
        }
    }
    if (WINDOW_IS_SHOWN)
        return;
    EditContextController::getInstance()->setITitlerNoCallBack();
    mLinks->changeTopWindow(MessageDefine::TOP_WINDOW_MAIN);
    mLinks->editFolderEnds(mArchiveList->getCurrentPath());
}

void TitlerWindow::showTemplateDialog()
{
    mDialogs->showTemplateDialog();
}

void TitlerWindow::showTemplateDialogOnUser()
{
    mTemplatePicker->showUserTemplateTab();
    showTemplateDialog();
}

void TitlerWindow::slotStartCreateNewArchiveFromTemplate(Archive* archiveData)
{
    mArchiveList->createArchiveFromTemplate(archiveData);
    mCanvasScene->createThumnailPicture();
}

void TitlerWindow::slotShowDialogMaskWidget(bool isShow)
{
    if (!isShow || WINDOW_IS_SHOWN)
        mMasks->showDialogMaskWidget(isShow);
}

void TitlerWindow::slotShowMessageMaskWidget(bool isShow)
{
    if (!isShow || WINDOW_IS_SHOWN)
        mMasks->showMessageMaskWidget(isShow);
}

// --- Undo, and what the canvas and the list are asked for --------------------------------------------------

// Drops a change of the selected title while the stack is clean, so that the stack stays clean.
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
    mLinks->dummyCloseSoftKeyboard();
}

// The checker pattern is part of the window's own picture behind the canvas.
void TitlerWindow::slotCanvasButtonClicked(QAction*)
{
    update();
}

void TitlerWindow::setHasMessageToShowInformation(bool isNeedShow, QString defaultFont)
{
    mMissingFont = isNeedShow ? std::optional(std::move(defaultFont)) : std::nullopt;
}

// --- Leaving text editing --------------------------------------------------------------------------------

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
    mLinks->dummyCloseSoftKeyboard();
}

void TitlerWindow::slotDeleteEmptyItems()
{
    // widgetAt() returns the viewport of a view, not the view itself. So a tap on the canvas beside an empty
    // text deletes the text.
    if (!qobject_cast<QGraphicsView*>(QApplication::widgetAt(QCursor::pos())))
        mCanvasScene->slotDeleteEmptyItems();
}

// --- Move mode ------------------------------------------------------------------------------------------

bool TitlerWindow::archiveListIsMoveMode() const
{
    return mMoveMode->isOn();
}

void TitlerWindow::editAndDoneButtonClicked()
{
    // Commits the input method's text before editing ends.
    if (KSInputContext* context = mLinks->inputContext())
        context->sendEvent(QInputMethodEvent());
    KSPushbutton* button = mMoveMode->button();
    button->setStyleSheet(button->styleSheet());
    const bool on = !archiveListIsMoveMode();
    sendTransientControlEvent(on);
    changeMoveMode(on);
}

void TitlerWindow::changeMoveMode(bool on)
{
    mMoveMode->setOn(on);
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
    mMoveMode->showPressed();
}

void TitlerWindow::moveButtonReleased()
{
    mMoveMode->showReleased();
}

// --- Lock reporting -------------------------------------------------------------------------------------

// Reports to the siblings that a control that closes on a press elsewhere was opened or closed.
void TitlerWindow::sendTransientControlEvent(bool on)
{
    mLinks->sendAPPEvent(APPEventDefine::LOCKTYPE_OBJECT, on);
}

void TitlerWindow::reportHiddenControl()
{
    if (WINDOW_IS_SHOWN)
        sendTransientControlEvent(false);
}

void TitlerWindow::slotHideEdgeSlider()
{
    mTextToolsPanel->hideEdgeSlider();
    reportHiddenControl();
}

void TitlerWindow::slotHideCanvasMenu()
{
    mToolsBar->hideCanvasMenu();
    reportHiddenControl();
}

void TitlerWindow::slotHideFontFamilyComboxList()
{
    mTextToolsPanel->hideFontFamilyComboxList();
    reportHiddenControl();
}

void TitlerWindow::slotHideFontSizeComboxList()
{
    mTextToolsPanel->hideFontSizeComboxList();
    reportHiddenControl();
}

// --- Language and module --------------------------------------------------------------------------------

void TitlerWindow::slotSystemLanguageChanged(SystemSetupDef::emSystemLanguageType systemLanguage)
{
    if (mLanguage.switchTranslator(systemLanguage))
        retranslateUI();
    useSpecifiedFont(WindowLanguage::fontFamily(systemLanguage));
    mTemplatePicker->reloadTemplates(systemLanguage);
}

void TitlerWindow::slotInputLanguageChanged(SystemSetupDef::emInputLanguageType inputLanguage)
{
    mCanvasScene->slotSceneInputLanguageChanged(inputLanguage);
    mTextToolsPanel->displayInputLanguage(inputLanguage);
}

void TitlerWindow::slotGetModuleInfo(SystemSetupDef::emInformationModel moduleInfo)
{
    m_emModuleInfo = moduleInfo;
    mCanvasScene->setModuleInfo(moduleInfo);
    mTextToolsPanel->setModuleInfo(moduleInfo);
    mTemplatePicker->setModuleInfo(moduleInfo);
}

void TitlerWindow::retranslateUI()
{
    setWindowTitle(tr("Titler"));
    mMoveMode->translateText();
    mTextToolsPanel->translateText();
    mToolsBar->translateText();
    mFolderPicker->translateText();
    mArchiveList->translateText();
    mTemplatePicker->translateText();
}

void TitlerWindow::useSpecifiedFont(const QString& family)
{
    mFolderPicker->setSystemLanFont(QFont(family));
    setStyleSheet(QStringLiteral(" * {font-family:'%1';}").arg(family));
    mArchiveList->setSystemLanFont(family);
    mTemplatePicker->setSystemLanFont(QFont(family));
}

void TitlerWindow::changeFontComboxItem(SystemSetupDef::emInformationModel moduleInfo)
{
    Q_EMIT modifyFontComboxItem(moduleInfo != SystemSetupDef::emInformationModelChina);
}
