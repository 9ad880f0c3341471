#pragma once

#include <QColor>
#include <QIcon>
#include <QPixmap>
#include <QPoint>
#include <QRect>
#include <QSize>
#include <QWidget>

class KSPushbutton;
class OutsidePressFilter;
class QAction;
class QHBoxLayout;
class QLabel;
class QMenu;
class QMouseEvent;
class QPainter;
class QPushButton;

// The row of touch buttons above the canvas: Folder, New Text, Delete, Undo, Redo, Safe Area, Canvas, Close.
// It reports taps as signals and does not know what they do, apart from its own looks and the small Canvas
// menu.
class ToolsBar : public QWidget
{
    Q_OBJECT
public:
    static const QSize BAR_ICON_SIZE;
    static const QSize TOOLBARBTN_SIZE;
    static const QPoint BTNS_TEXT_POINT;
    static const QPoint CANVASBTN_TEXT_POINT;
    static constexpr int BTNS_TEXTLABEL_WIDTH = 120;
    static const QColor TRANSPARENT_COLOR;

    // undo and redo: the actions of the undo stack; not owned, they must outlive the bar.
    ToolsBar(QAction* undo, QAction* redo, QWidget* parent);
    ~ToolsBar() override;

    bool eventFilter(QObject* obj, QEvent* event) override;

    void setFolderButtonEnabled(bool enabled);
    // Resets the look of Folder, since the dialog that it opened has received its release.
    void setFolderButtonRest();
    // Shows Delete, Undo and Redo disabled until the next change, and switches the safe area off.
    void resetToDefaultState();
    void hideCanvasMenu();
    void translateText();

public Q_SLOTS:
    void setInsertUnchecked();
    void changeBtnStatus(bool hasSelectedItem);
    void slotlCanvasSceneMousePressed();
    void slotDisableNewTextButton(bool disable);

Q_SIGNALS:
    void folderButtonClick();
    void newTextButtonClick();
    void closeButtonClick();
    void redoButtonClicked();
    void undoButtonClicked();
    void deleteButtonClick();
    void SafeAreaButtonClicked();
    void SafeAreaButtonClickedForDrawRect(bool isOK);
    // Emitted for one of the three menu actions, with data 0 black, 1 white, 2 checker.
    void canvasButtonClicked(QAction* action);
    void exeUndoAction();
    void exeRedoAction();
    void signalShowCanvasMenu(bool isShow);
    void menuTriggered(QAction* action);

private Q_SLOTS:
    void clickedFolderButton();
    void clickedInsertButton();
    void clickedDeleteButton();
    void clickedCloseButton();
    void slotUndoButtonClicked();
    void slotRedoButtonClicked();
    void setUndoButtonEnabled();
    void setRedoButtonEnabled();
    void clickedSafeAreaButton();
    void showCanvasMenu();
    void canvasBtnSelected();
    void canvasBtnReleased();

private:
    // A button with its label and pictures.
    struct ToolButton {
        KSPushbutton* button = nullptr;
        QLabel* label = nullptr;
        // Kept, since each new icon leaves its rendered pictures in the application's cache.
        QIcon icon;
        QIcon disabledIcon;
    };

    ToolButton createButton(const QString& iconName, const QPoint& textPoint);
    void createButtons();
    void createMenu();
    void createLayout();
    void createConnection();
    void connectLooks();
    void setToolEnabled(const ToolButton& tool, bool enabled);
    void setPushButtonDisabled(QPushButton* button);
    void resetSafeArea();
    // Set the look of a pressed and a released button. Safe Area stays selected while the lines are shown.
    void showPressed(const ToolButton& tool);
    void showReleased(const ToolButton& tool);
    bool isSelected(const ToolButton& tool) const;

    bool paintCanvasMenu(QEvent* event);
    void onMouseButtonPress(QMouseEvent* event);
    void onMouseButtonRelease(QMouseEvent* event);
    void onMouseButtonMove(QMouseEvent* event);
    void onMouseLeave();
    void drawMenuItem(QPainter* painter);
    static QRect getMenuItemRect(const QRect& rect, int index);
    int cursorItem(const QPoint& point) const;

    QAction* m_undoAction;
    QAction* m_redoAction;
    ToolButton m_folder;
    ToolButton m_text;
    ToolButton m_delete;
    ToolButton m_undo;
    ToolButton m_redo;
    ToolButton m_safeArea;
    ToolButton m_canvas;
    ToolButton m_close;
    QMenu* m_menu = nullptr;
    OutsidePressFilter* m_outsidePress = nullptr;
    QPixmap m_menuBackground;
    QPixmap m_menuCursor;
    QPixmap m_menuSeparator;
    int m_menuItem = -1; // item under the finger
    bool m_safeAreaShown = false;
};
