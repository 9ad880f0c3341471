#pragma once

#include <QMainWindow>
#include <QPoint>
#include <QRect>
#include <QString>
#include <QUndoStack>
#include <memory>
#include <optional>

#include "app/SessionEnd.h"
#include "app/TitlerParamter.h"
#include "app/UnsavedWork.h"
#include "app/WindowBackground.h"
#include "app/WindowLanguage.h"
#include "canvas/ICanvasHost.h"
#include "messaging/services/MessageDefine.h"
#include "messaging/services/SystemSetupDef.h"

class Archive;
class ArchiveList;
class CanvasScene;
class FolderPicker;
class GraphicsView;
class KSBaseItemWidget;
class KSScrollViewerWidget;
class MoveMode;
class QAction;
class QUndoCommand;
class SavingNotice;
class SiblingLinks;
class TemplatePicker;
class TextToolsPanel;
class ToolsBar;
class WindowDialogs;
class WindowMasks;

// The main window and centre of the program: owns all widgets, makes the connections between them and to the
// controllers, and controls a session from the request to the answer. It is built hidden and hidden between
// sessions; closing it hides it and empties canvas and list, and showing it again builds nothing.
//
// Window coordinates: 1920 x 1080, with the canvas view of 1280 x 720 at (609, 97).
// GUI thread only. The constructor blocks until both sibling processes listen.
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
    static const QRect TEXT_PROPERTY_RECT; // presses in this area do not end text editing
    static const int ARCHIVELISTWIDGET_WIDTH;
    static const double OPACITY_VALUE;

    // Builds the window. With deferArchiveList the list stays empty until a request names a folder.
    TitlerWindow(bool deferArchiveList, QWidget* parent);
    ~TitlerWindow() override;

    bool windowIsVisible() const override { return WINDOW_IS_SHOWN; }

    // Returns whether all changes on the canvas are written to disk.
    bool dataSaveIsFinished();

    // Commits what is being edited and saves the title, as when another title is selected.
    void saveCurrentTitle();
    // Blocks until all pictures are written, and shows a notice meanwhile. Gives up when the disk hangs.
    void waitUntilSaved();

    bool archiveListIsMoveMode() const;

Q_SIGNALS:
    void moveButtonClicked(bool isMoveMode);
    void titlerWindowGeometry(QRect rect);
    void modifyFontComboxItem(bool isAllItems);
    void signalHideEdgeSlider();

public Q_SLOTS:
    // Closing
    void closeTitlerWindow();
    void continueCloseTitler(MessageDefine::tagCloseParam param);
    void closeTitlerMainWindow();
    void slotPowerOff() { endProcess(); }
    void setRealClose(bool realClose) { m_sessionEnd.setQuits(realClose); }
    // Saves, waits until everything is written, and ends the event loop.
    void endProcess();

    // Showing. Requests are ignored while the window is visible.
    void showTitlerWindow(titler_paramter paramter);
    void refreshArchiveList(QString path);
    // Modal; return when a folder is open or the operator has cancelled. openFolderDialog() is used while a
    // title is edited: after Cancel editing continues.
    void showFolderDialog();
    void openFolderDialog();
    void slotCancelClicked();
    // Modal; return when the operator has picked a template or cancelled. showTemplateDialogOnUser() opens
    // the tab of the user templates.
    void showTemplateDialog();
    void showTemplateDialogOnUser();

    // Undo
    void pushUndoStack(QUndoCommand* subUndoCommand); // takes ownership
    void clearUndoStack();

    // Leaving text editing
    void hideSoftWareWithDeleteEmptyItems() { leaveTextEditing(true); }
    void hideSoftWareWithOutDeleteEmptyItems() { leaveTextEditing(false); }
    void slotDeleteEmptyItems();

    // Move mode
    void editAndDoneButtonClicked();
    void slotChangeDoneToMoveMode();
    void slotCancelArchiveListMoveMode();
    void moveButtonPressed();
    void moveButtonReleased();

    // Language and module
    void slotSystemLanguageChanged(SystemSetupDef::emSystemLanguageType systemLanguage);
    void slotInputLanguageChanged(SystemSetupDef::emInputLanguageType inputLanguage);
    void slotGetModuleInfo(SystemSetupDef::emInformationModel moduleInfo);

    // Forwarding
    void slotNewTextButtonClicked();
    void pressDelectButton();
    void slotCanvasButtonClicked(QAction* action);
    void slotStartPasteArchive();
    void slotStartCreateNewArchiveFromTemplate(Archive* archiveData);
    void listWidgetReleasedEvent(KSBaseItemWidget*, QPoint, KSScrollViewerWidget*)
    {
        hideSoftWareWithOutDeleteEmptyItems();
    }
    void setHasMessageToShowInformation(bool isNeedShow, QString defaultFont);

    // Lock reporting: the siblings are told of controls that close on a press elsewhere
    void slotShowEdgeSlider(bool isShow) { sendTransientControlEvent(isShow); }
    void slotShowCanvasMenu(bool isShow) { sendTransientControlEvent(isShow); }
    void slotShowFontFamilyComboxList(bool isShow) { sendTransientControlEvent(isShow); }
    void slotShowFontSizeComboxList(bool isShow) { sendTransientControlEvent(isShow); }
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
    void initWindowWidget(bool deferArchiveList);
    void createToolsBar();
    void createCanvasScene();
    QWidget* createArchiveList(bool deferArchiveList);
    void createTextToolsPanel();
    void initChildWindows();

    void connectWidget();
    void connectForToolsBar();
    void connectForMainScene();
    void connectForTextToolsAndArchiveList();
    void connectForTextToolsPanel();
    void connectForUndoRedoCommand();
    void connectForController();
    void connectForRestoreOriginal();
    void connectForTemplates();
    void connectForTemplateNotices();
    void connectForFolderPicker();
    void connectForFolderNotices();

    bool ignoreMouseAndTouchEventWhenArchiveListIsMoveMode(QObject* obj, QEvent* event);
    bool ignoreTouchEventWhenSliderIsShowing(QObject* obj, QEvent* event) const;
    void leaveTextEditing(bool deleteEmptyItems);
    void changeMoveMode(bool on);
    void sendTransientControlEvent(bool on);
    void reportHiddenControl();
    void beginSession(const titler_paramter& parameter);
    void markOpenFolder();
    void hideSession();
    void resetCanvasBackground();
    void retranslateUI();
    void useSpecifiedFont(const QString& family);
    void changeFontComboxItem(SystemSetupDef::emInformationModel moduleInfo);

    static bool WINDOW_IS_SHOWN;

    // Owned by their Qt parents.
    ToolsBar* m_toolsBar = nullptr;
    CanvasScene* m_canvasScene = nullptr;
    GraphicsView* m_graphicsView = nullptr;
    ArchiveList* m_archiveList = nullptr;
    TextToolsPanel* m_textToolsPanel = nullptr;
    SavingNotice* m_savingNotice = nullptr;
    FolderPicker* m_folderPicker = nullptr;
    TemplatePicker* m_templatePicker = nullptr;

    QUndoStack m_undoStack;
    std::unique_ptr<SiblingLinks> m_links;
    std::unique_ptr<MoveMode> m_moveMode;
    std::unique_ptr<WindowMasks> m_masks;
    std::unique_ptr<WindowDialogs> m_dialogs;
    WindowBackground m_background;
    WindowLanguage m_language;

    SessionEnd m_sessionEnd;
    UnsavedWork m_unsavedWork;
    std::optional<QString> m_missingFont; // reported when the window is shown
    SystemSetupDef::emInformationModel m_emModuleInfo = SystemSetupDef::emInformationModelDefault;
};

// The main window; null before it is built and after it is deleted.
extern TitlerWindow* pMainWindow;
