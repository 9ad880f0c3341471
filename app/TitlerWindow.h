// The main window and the hub of the program: owns every visible object, makes every connection between them
// and to the controllers, and keeps the session from a request to its answer. Built hidden and kept hidden
// between sessions; closing hides it and empties canvas and list, nothing is rebuilt on the next show.
//
// Window coordinates: 1920 x 1080, the canvas view of 1280 x 720 at (609, 97).
// GUI thread only. The constructor blocks until both sibling processes listen.
#pragma once

#include <QMainWindow>
#include <QPixmap>
#include <QPoint>
#include <QRect>
#include <QString>
#include <QUndoStack>
#include <memory>

#include "app/TitlerParamter.h"
#include "canvas/ICanvasHost.h"
#include "messaging/services/MessageDefine.h"
#include "messaging/services/SystemSetupDef.h"

class Archive;
class ArchiveList;
class CanvasScene;
class EditContextController;
class EditTitlerController;
class FolderPicker;
class GraphicsView;
class ISoftKeyBoardController;
class KSBaseItemWidget;
class KSInputContext;
class KSPushbutton;
class KSScrollViewerWidget;
class QAction;
class QLabel;
class QPushButton;
class QTranslator;
class QUndoCommand;
class SavingNotice;
class ShowMessageController;
class ShowTitlerController;
class SystemSetupInfoController;
class TextToolsPanel;
class TemplatePicker;
class TitlerAPPEventFilterController;
class TitlerPowerController;
class TitlerProjectDataController;
class TitlerToolFactory;
class ToolsBar;

class TitlerWindow : public QMainWindow, public ICanvasHost
{
    Q_OBJECT

public:
    static const QRect MAIN_RECT;
    static const QRect SCENE_RECT;
    static const QPoint STARTPOINT_OF_CANVASSCENE_BG;
    static const QRect VSEPARATOR_RECT;
    static const QRect HSEPARATOR_TOP_RECT;
    static const QRect HSEPARATOR_BOTTOM_RECT;
    static const QRect TEXT_PROPERTY_RECT; // presses in here do not end text editing
    static const int ARCHIVELISTWIDGET_WIDTH;
    static const double OPACITY_VALUE;

    // deferArchiveList leaves the list empty until a request names a folder.
    TitlerWindow(bool deferArchiveList, QWidget* parent);
    ~TitlerWindow() override;

    bool windowIsVisible() const override;

    // Whether nothing of the canvas is still on its way to disk.
    bool dataSaveIsFinished();

    // Puts what is being edited on its way to disk, as leaving the title does.
    void saveCurrentTitle();
    // Blocks, and says so on the window, until all pictures are in their place. Gives up when the disk hangs.
    void waitUntilSaved();

    bool archiveListIsMoveMode() const;

Q_SIGNALS:
    void moveButtonClicked(bool isMoveMode);
    void titlerWindowGeometry(QRect rect);
    void modifyFontComboxItem(bool isAllItems);
    void signalHideEdgeSlider();

public Q_SLOTS:
    // Closing.
    void closeTitlerWindow();
    void continueCloseTitler(MessageDefine::tagCloseParam param);
    void closeTitlerMainWindow();
    void slotPowerOff();
    void setRealClose(bool realClose);
    // Saves, waits until all is written, and ends the event loop.
    void endProcess();

    // Showing. Requests for a visible window are dropped whole.
    void showTitlerWindow(titler_paramter paramter);
    void refreshArchiveList(QString path);
    // Modal; return when a folder is open or the operator has cancelled. The second comes from the running
    // editor, to which Cancel goes back.
    void showFolderDialog();
    void openFolderDialog();
    void slotCancelClicked();
    // Modal; return when the operator has chosen a template or cancelled. The second begins with the
    // operator's own templates.
    void showTemplateDialog();
    void showTemplateDialogOnUser();

    // Undo.
    void pushUndoStack(QUndoCommand* subUndoCommand); // takes over the command
    void clearUndoStack();

    // Leaving text editing.
    void hideSoftWareWithDeleteEmptyItems();
    void hideSoftWareWithOutDeleteEmptyItems();
    void slotDeleteEmptyItems();

    // Move mode.
    void editAndDoneButtonClicked();
    void slotChangeDoneToMoveMode();
    void slotCancelArchiveListMoveMode();
    void moveButtonPressed();
    void moveButtonReleased();

    // Language and module.
    void slotSystemLanguageChanged(SystemSetupDef::emSystemLanguageType systemLanguage);
    void slotInputLanguageChanged(SystemSetupDef::emInputLanguageType inputLanguage);
    void slotGetModuleInfo(SystemSetupDef::emInformationModel moduleInfo);

    // Forwarders.
    void slotNewTextButtonClicked();
    void pressDelectButton();
    void slotCanvasButtonClicked(QAction* action);
    void slotStartPasteArchive();
    void slotStartCreateNewArchiveFromTemplate(Archive* archiveData);
    void listWidgetReleasedEvent(KSBaseItemWidget* item, QPoint point, KSScrollViewerWidget* viewer);
    void setHasMessageToShowInformation(bool isNeedShow, QString defaultFont);

    // Lock reporting.
    void slotShowEdgeSlider(bool isShow);
    void slotShowCanvasMenu(bool isShow);
    void slotShowFontFamilyComboxList(bool isShow);
    void slotShowFontSizeComboxList(bool isShow);
    void slotHideEdgeSlider();
    void slotHideCanvasMenu();
    void slotHideFontFamilyComboxList();
    void slotHideFontSizeComboxList();
    void slotShowDialogMaskWidget(bool isShow);
    void slotShowMessageMaskWidget(bool isShow);

protected:
    bool eventFilter(QObject* obj, QEvent* event) override;
    void mousePressEvent(QMouseEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void resizeEvent(QResizeEvent* event) override;
    void showEvent(QShowEvent* event) override;
    void hideEvent(QHideEvent* event) override;
    void closeEvent(QCloseEvent* event) override;

private:
    void setAppDefaultParameter();
    void initWindowWidget();
    void createToolsBar();
    void createCanvasScene();
    void createArchiveList();
    void createTextToolsPanel();
    QWidget* createLeftColumn();
    QLayout* createRightColumn();
    void initChildWindows();
    void initProcessFactory();
    void initProcessCommunications();

    void connectWidget();
    void connectForToolsBar();
    void connectForMainScene();
    void connectForTextToolsAndArchiveList();
    void connectForTextToolsPanel();
    void connectForUndoRedoCommand();
    void connectForController();
    void connectForTemplates();
    void connectForTemplateNotices();
    void connectForFolderPicker();
    void connectForFolderNotices();
    void initFolderPicker();
    void markOpenFolder();

    bool ignoreMouseAndTouchEventWhenArchiveListIsMoveMode(QObject* obj, QEvent* event);
    bool ignoreTouchEventWhenSliderIsShowing(QObject* obj, QEvent* event) const;
    void leaveTextEditing(bool deleteEmptyItems);
    void changeMoveMode(bool on);
    void sendTransientControlEvent(bool on);
    void reportHiddenControl();

    bool asksAboutUnsavedWork();
    void giveUpUnsavedWork();
    void logUnsynced();

    void setOpacityMaskVisible(bool visible);
    void showDialogMaskWidget(bool show);
    void showMessageMaskWidget(bool show);
    QWidget* createMask() const;
    void refuseRequest(const QString& path);

    void switchTranslator(SystemSetupDef::emSystemLanguageType type);
    void useSpecifiedFont(SystemSetupDef::emSystemLanguageType type);
    void retranslateUI();
    void changeFontComboxItem(SystemSetupDef::emInformationModel moduleInfo);
    void drawCanvasSceneBG(QPainter& painter);
    void resetCanvasBackground();

    // What the operator is being asked about the end of the session.
    enum class Question { None, LoseUnsavedWork };

    static bool WINDOW_IS_SHOWN;

    // Visible objects; Qt parents own them, the undo stack is the window's own.
    ToolsBar* mToolsBar = nullptr;
    CanvasScene* mCanvasScene = nullptr;
    GraphicsView* mGraphicsView = nullptr;
    ArchiveList* mArchiveList = nullptr;
    QLabel* mPathLabel = nullptr;
    QPushButton* mFolderIcon = nullptr;
    TextToolsPanel* mTextToolsPanel = nullptr;
    KSPushbutton* mMoveButton = nullptr;
    QUndoStack mUndoStack;
    QWidget* mOpacityMask = nullptr;
    SavingNotice* mSavingNotice = nullptr;
    FolderPicker* mFolderPicker = nullptr;
    TemplatePicker* mTemplatePicker = nullptr;
    QWidget* mMessageMask = nullptr;
    QWidget* mDialogMask = nullptr;
    QTranslator* mTranslator = nullptr;

    std::unique_ptr<TitlerToolFactory> mFactory;
    KSInputContext* mInputContext = nullptr;                    // owned by the platform integration
    ISoftKeyBoardController* mSoftKeyBoardController = nullptr; // owned by the factory

    // Singletons; each owns itself until the destructor clears it.
    EditContextController* mEditContextController = nullptr;
    ShowTitlerController* mShowTitlerController = nullptr;
    SystemSetupInfoController* mSystemSetupInfoController = nullptr;
    EditTitlerController* mEditTitlerController = nullptr;
    ShowMessageController* mShowMessageController = nullptr;
    TitlerPowerController* mTitlerPowerController = nullptr;
    TitlerProjectDataController* mTitlerProjectDataController = nullptr;
    TitlerAPPEventFilterController* mTitlerAPPEventFilterController = nullptr;

    QPixmap mLeftPanelPixmap;
    QPixmap mWindowPanelPixmap;
    QPixmap mCanvasPixmap;

    Question mQuestion = Question::None;
    bool m_bDeferArchiveList;
    bool m_bRealClose = true;
    bool m_bFolderDialogFromWindow = false;
    bool m_bMoveModeOff = true;
    bool m_bHasMessage = false;
    bool m_bEditByMain = false;
    bool m_bEnding = false;
    QString m_strMessage;
    SystemSetupDef::emInformationModel m_emModuleInfo = SystemSetupDef::emInformationModelDefault;
    QString m_strTranslationPath;
};

// The one main window; null before it is built and after it is deleted.
extern TitlerWindow* pMainWindow;
