// Building, layout and painting of the window; see TitlerWindowSession.cpp for requests and closing,
// TitlerWindowTouch.cpp for events, masks and language, and TitlerWindowWiring.cpp for the connections.
#include "app/TitlerWindow.h"

#include "app/APPEventFilter.h"
#include "app/EarlyRequests.h"
#include "app/EditContextController.h"
#include "app/EditTitlerController.h"
#include "app/SavingNotice.h"
#include "app/ShowMessageController.h"
#include "app/ShowTitlerController.h"
#include "app/SystemSetupInfoController.h"
#include "app/TitlerAPPEventFilterController.h"
#include "app/TitlerPowerController.h"
#include "app/TitlerProjectDataController.h"
#include "app/TitlerToolFactory.h"
#include "app/ToolsBar.h"
#include "canvas/CanvasScene.h"
#include "canvas/DrawBoundingRectangle.h"
#include "canvas/GraphicsView.h"
#include "library/ArchiveList.h"
#include "library/FolderPicker.h"
#include "library/TemplatePicker.h"
#include "library/ThumbnailRender.h"
#include "messaging/services/ISoftKeyBoardController.h"
#include "panel/TextToolsPanel.h"
#include "support/LogManager.h"
#include "touchui/Balloon.h"
#include "touchui/KSInputContext.h"
#include "touchui/KSMenu.h"
#include "touchui/KSPushbutton.h"
#include "touchui/KSScrollViewerWidget.h"
#include "touchui/KSToolTip.h"
#include "touchui/TightLayout.h"
#include "touchui/WindowPlaceKeeper.h"

#include <QAction>
#include <QApplication>
#include <QHBoxLayout>
#include <QImageReader>
#include <QLabel>
#include <QPainter>
#include <QPushButton>
#include <QTranslator>
#include <QVBoxLayout>
#include <new>

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
constexpr long SOFT_KEYBOARD_SERVICE_ID = 95;
constexpr int ARCHIVELISTWIDGET_HEIGHT = 997;
constexpr int TITLE_ROW_HEIGHT = 38;
constexpr QPoint WINDOW_PANEL_POS(8, 8);
constexpr QPoint LEFT_PANEL_POS(12, 61);

const char MOVE_BUTTON_IMAGES[] =
    "TextToolPanel_Buttons:Button-38B_Rest_Left:Button-38B_Rest_Center:Button-38B_Rest_Right:"
    "Button-38B_Pressed_Left:Button-38B_Pressed_Center:Button-38B_Pressed_Right::::"
    "Button-38selected_Rest_Left:Button-38selected_Rest_Center:Button-38selected_Rest_Right:"
    "Button-38selected_Pressed_Left:Button-38selected_Pressed_Center:Button-38selected_Pressed_Right:::";

} // namespace

TitlerWindow::TitlerWindow(bool deferArchiveList, QWidget* parent)
    : QMainWindow(parent, Qt::FramelessWindowHint), m_bDeferArchiveList(deferArchiveList)
{
    INIT_LOGGING(L"KS2Titler");
    setAppDefaultParameter();
    setAttribute(Qt::WA_AcceptTouchEvents);
    KSMenu::setMainWindow(this);
    KSScrollViewerWidget::s_mainWnd = this;
    ICanvasHost::setInstance(this);
    MessageBoxController::setProvider(
        []() -> MessageBoxController* { return ShowMessageController::getInstance(); },
        &ShowMessageController::clearInstance);

    setWindowTitle(tr("Titler"));
    setGeometry(MAIN_RECT);
    new WindowPlaceKeeper(this); // child of this
    QPalette windowPalette = palette();
    windowPalette.setColor(QPalette::Window, Qt::black);
    setPalette(windowPalette);

    mUndoStack.setUndoLimit(UNDO_LIMIT);
    initWindowWidget();
    initChildWindows();
    connectWidget();
    Balloon::s_ParentWindow = this;
    KSToolTip::s_mainWindow = this;
    initProcessFactory();
    initProcessCommunications();
    connectForController();
    mArchiveList->setMainScene(mCanvasScene);
    if (APPEventFilter* filter = APPEventFilter::instance())
        filter->registerEventFilter(this);
}

TitlerWindow::~TitlerWindow()
{
    // Events of children that go must not reach a window that is half gone.
    if (APPEventFilter* filter = APPEventFilter::instance())
        filter->unegisterEventFilter(this);
    // The canvas must be gone before the service links that its workers report through.
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

    EarlyRequests::clearInstance();
    ShowTitlerController::clearInstance();
    SystemSetupInfoController::clearInstance();
    ShowMessageController::clearInstance();
    TitlerPowerController::clearInstance();
    EditContextController::clearInstance();
    TitlerProjectDataController::clearInstance();
    TitlerAPPEventFilterController::clearInstance();
    if (mInputContext)
        mInputContext->setKeyBoardController(nullptr);
    if (mTranslator)
        mTranslator->deleteLater();
    MessageBoxController::setProvider(nullptr, nullptr);
    ICanvasHost::setInstance(nullptr);
    mFactory.reset();
    UNINIT_LOGGING();
}

void TitlerWindow::setAppDefaultParameter()
{
    mTranslator = nullptr;
    QApplication::setFont(QFont(QStringLiteral("KST-Medium"), 12));
    const QPalette before = QApplication::palette();
    QPalette applicationPalette;
    applicationPalette.setColor(QPalette::Highlight, Qt::darkBlue);
    applicationPalette.setColor(QPalette::HighlightedText, QColor(0, 0, 0, 0));
    QApplication::setPalette(applicationPalette);
    QApplication::setPalette(before, "QObject");
}

void TitlerWindow::initWindowWidget()
{
    createToolsBar();
    createCanvasScene();
    createArchiveList();
    createTextToolsPanel();

    auto* mainRow = newLayout<QHBoxLayout>();
    mainRow->addSpacing(8);
    mainRow->addWidget(createLeftColumn());
    mainRow->addLayout(createRightColumn());

    auto* central = new QWidget(this);
    auto* column = newLayout<QVBoxLayout>();
    column->addSpacing(8);
    column->addLayout(mainRow);
    column->addStretch();
    central->setLayout(column);
    setCentralWidget(central);
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

void TitlerWindow::createArchiveList()
{
    mPathLabel = new QLabel;
    mPathLabel->setStyleSheet(QStringLiteral("color:rgb(220,220,220); text-align:left; font:28px;"));
    // The lines of some families are higher, and the list under the row has a frame at a fixed place.
    mPathLabel->setFixedHeight(TITLE_ROW_HEIGHT);

    mFolderIcon = new QPushButton(this);
    mFolderIcon->setIcon(QIcon(QStringLiteral(":/FolderPicker/Titler_folder_icon")));
    mFolderIcon->setFixedSize(28, 30);
    mFolderIcon->setIconSize(QSize(28, 28));
    mFolderIcon->setEnabled(false);
    mFolderIcon->setStyleSheet(QStringLiteral("border:0; background:transparent;"));

    mMoveButton = new KSPushbutton(QString::fromLatin1(MOVE_BUTTON_IMAGES), this);
    mMoveButton->setFixedSize(70, TITLE_ROW_HEIGHT);
    mMoveButton->setText(tr("Move"));
    mMoveButton->setStyleSheet(QStringLiteral("color:rgb(220, 220, 220); font:20px;"));
    mMoveButton->setFocusPolicy(Qt::NoFocus);
    mMoveButton->setAttribute(Qt::WA_AcceptTouchEvents);
    connect(mMoveButton, &QPushButton::clicked, this, &TitlerWindow::editAndDoneButtonClicked);
    connect(mMoveButton, &QPushButton::pressed, this, &TitlerWindow::moveButtonPressed);
    connect(mMoveButton, &QPushButton::released, this, &TitlerWindow::moveButtonReleased);

    mArchiveList = new ArchiveList(mPathLabel, !m_bDeferArchiveList, this);
    mArchiveList->setFixedSize(ARCHIVELISTWIDGET_WIDTH, ARCHIVELISTWIDGET_HEIGHT);
}

void TitlerWindow::createTextToolsPanel()
{
    mTextToolsPanel = new TextToolsPanel(this);
}

QWidget* TitlerWindow::createLeftColumn()
{
    auto* titleRow = newLayout<QHBoxLayout>();
    titleRow->addSpacing(6);
    titleRow->addWidget(mFolderIcon);
    titleRow->addSpacing(7);
    titleRow->addWidget(mPathLabel);
    titleRow->addStretch();
    titleRow->addWidget(mMoveButton);
    titleRow->addSpacing(0);

    auto* column = newLayout<QVBoxLayout>();
    column->addSpacing(8);
    column->addLayout(titleRow);
    column->addSpacing(10);
    column->addWidget(mArchiveList, 2);
    column->addStretch();

    auto* row = newLayout<QHBoxLayout>();
    row->addSpacing(6);
    row->addLayout(column);

    auto* left = new QWidget(this);
    left->setFixedWidth(ARCHIVELISTWIDGET_WIDTH);
    left->setLayout(row);
    return left;
}

QLayout* TitlerWindow::createRightColumn()
{
    auto* canvasRow = newLayout<QHBoxLayout>();
    canvasRow->addSpacing(52);
    canvasRow->addWidget(mGraphicsView);
    canvasRow->addSpacing(31);

    auto* column = newLayout<QVBoxLayout>();
    column->addWidget(mToolsBar);
    column->addSpacing(22);
    column->addLayout(canvasRow);
    column->addSpacing(43);
    column->addWidget(mTextToolsPanel);
    column->addStretch();
    return column;
}

void TitlerWindow::initChildWindows()
{
    mOpacityMask = createMask();
    mOpacityMask->setParent(this);
    mOpacityMask->setGeometry(rect());
    mOpacityMask->raise();
    mOpacityMask->hide();
    mSavingNotice = new SavingNotice(this);
    mFolderPicker = new FolderPicker(this);
    mTemplatePicker = new TemplatePicker(this);
}

void TitlerWindow::initProcessFactory()
{
    mFactory.reset(new (std::nothrow) TitlerToolFactory);
    // A port that cannot be bound leaves a window that no request can reach; the siblings' services still
    // work.
    if (mFactory)
        mFactory->initialize();
}

void TitlerWindow::initProcessCommunications()
{
    if (!mFactory)
        return;
    mInputContext = KSInputContext::instance();
    mSoftKeyBoardController = mFactory->createService<ISoftKeyBoardController>(SOFT_KEYBOARD_SERVICE_ID);
    if (mInputContext) {
        mInputContext->setWindowID(winId());
        if (mSoftKeyBoardController)
            mSoftKeyBoardController->registerCallBack(mInputContext);
        mInputContext->setKeyBoardController(mSoftKeyBoardController);
    }

    mShowTitlerController = ShowTitlerController::getInstance();
    mSystemSetupInfoController = SystemSetupInfoController::getInstance();
    mEditTitlerController = EditTitlerController::getInstance();
    mShowMessageController = ShowMessageController::getInstance();
    mTitlerPowerController = TitlerPowerController::getInstance();
    mTitlerProjectDataController = TitlerProjectDataController::getInstance();
    mTitlerAPPEventFilterController = TitlerAPPEventFilterController::getInstance();

    mShowTitlerController->setFactory(mFactory.get());
    mSystemSetupInfoController->setFactory(mFactory.get());
    mEditTitlerController->setFactory(mFactory.get());
    mShowMessageController->setFactory(mFactory.get());
    mTitlerPowerController->setFactory(mFactory.get());
    mTitlerProjectDataController->setFactory(mFactory.get());
    mTitlerAPPEventFilterController->initialize(mFactory.get());
    mTitlerAPPEventFilterController->sendAPPEvent(APPEventDefine::LOCKTYPE_OBJECT, false);
}

void TitlerWindow::paintEvent(QPaintEvent* event)
{
    QMainWindow::paintEvent(event);
    QPainter painter(this);
    painter.drawPixmap(WINDOW_PANEL_POS, mWindowPanelPixmap);
    painter.drawPixmap(LEFT_PANEL_POS, mLeftPanelPixmap);
    drawCanvasSceneBG(painter);
    painter.drawImage(VSEPARATOR_RECT, QImage(QStringLiteral(":/Separator_V")));
    const QImage horizontal(QStringLiteral(":/Separator_H"));
    painter.drawImage(HSEPARATOR_TOP_RECT, horizontal);
    painter.drawImage(HSEPARATOR_BOTTOM_RECT, horizontal);
}

void TitlerWindow::drawCanvasSceneBG(QPainter& painter)
{
    if (mCanvasPixmap.isNull()) {
        QImageReader reader(QStringLiteral(":/PanelBG/Titler_Canvas"));
        mCanvasPixmap = QPixmap::fromImageReader(&reader);
    }
    painter.drawPixmap(STARTPOINT_OF_CANVASSCENE_BG, mCanvasPixmap);
}

void TitlerWindow::resizeEvent(QResizeEvent* event)
{
    DrawBoundingRectangle frames;
    mLeftPanelPixmap = frames.paintBoundingRectangle(2);
    mWindowPanelPixmap = frames.paintBoundingRectangle(1);
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
    mCanvasScene->endPreview(); // the palette is a window of its own
    WINDOW_IS_SHOWN = false;
    if (!event->spontaneous()) {
        // Whoever asked for a mask may take it away only later, or never.
        showDialogMaskWidget(false);
        showMessageMaskWidget(false);
        if (mInputContext)
            mInputContext->setWindowID(winId());
    }
    QMainWindow::hideEvent(event);
}

bool TitlerWindow::windowIsVisible() const
{
    return WINDOW_IS_SHOWN;
}
