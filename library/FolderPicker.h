// The dialog in which the operator picks the folder of titles to work in, or a title of it: a tree of the
// folders under the root of the titles, with a picture of the pressed title. Folders are made, copied and
// renamed in place, and what other processes do to them is followed while the dialog shows. It lives as long
// as the main window and is shown by exec(). GUI thread.
#pragma once

#include "library/FolderPickerController.h"
#include "messaging/services/FileManagerDefine.h"
#include "messaging/services/MessageDefine.h"
#include "touchui/DialogMasks.h"

#include <QDialog>
#include <QFont>
#include <QPersistentModelIndex>
#include <QPixmap>
#include <QPoint>
#include <QPointer>
#include <QSize>
#include <QString>
#include <string>

class FolderEditor;
class FolderPickerFactory;
class KSPushbutton;
class KSTreeModel;
class KSTreeView;
class QLabel;

class FolderPicker : public QDialog
{
    Q_OBJECT

public:
    static const int LEFT_WIDTH = 240;
    static const int WIDGET_HEIGHT = 135;
    static const int HSEPARATOR_LENGTH = 1069;
    static const int LIMIT_REMAIN = FolderPickerController::LIMIT_REMAIN;
    static const int KB_MILLION = FolderPickerController::KB_MILLION;
    static const QString DISPLAY_FILE_SIZE;
    static const QSize FOLDER_PICKER_SIZE;
    static const QSize FOLDER_TREEVIEW_SIZE;
    static const QPoint STARTPOINT_OF_TOP_HSEPARATOR;
    static const QPoint STARTPOINT_OF_BOTTOM_HSEPARATOR;
    static const QString COLOR_TRANSPARENT;
    static const QString FOLDER_NAME_REGEXP;

    // Which of Duplicate, New Folder, Open and Cancel can be pressed; any other value: all of them.
    enum _folderButtonState {
        ALL_BUTTONS = 0,
        NO_DUPLICATE = 1,
        OPEN_AND_CANCEL = 2,
        NO_BUTTONS = 3,
        NEW_FOLDER_AND_CANCEL = 4
    };
    using folderButtonState = _folderButtonState;

    enum FolderEdit { FOLDER_EDIT_NONE = 0, FOLDER_EDIT_RENAME, FOLDER_EDIT_CREATE, FOLDER_EDIT_DUPLICATE };

    explicit FolderPicker(QWidget* parent = nullptr);
    ~FolderPicker() override;

    // Marks the folder that is open in the editor, which cannot take a new name meanwhile. Empty: none is.
    void setCurrentFolderName(const QString& name);
    QString currentFolderName() const { return mCurrentFolderName; }
    void setSystemLanFont(QFont font);
    void translateText();
    // Reads all folders anew; what was selected and being edited is dropped.
    void updateTreeView();
    // Opens the keyboard again when a name is being edited.
    void showSoftKeyboard();

    void setDuplicateButtonEnabled(bool enabled);
    void setCreateFolderButtonEnabled(bool enabled);
    void setCancelButtonEnabled(bool enabled);

    // Nothing was picked from the dialog above this one: the folder that is being opened leaves this one
    // open.
    void setKeepFolderDialog() { mKeepDialog = true; }
    // Darkens the dialog while another of this process is above it.
    void showOpacityWidget(bool show);
    void showDialogMaskWidget(bool show) { mMasks.showDialogMaskWidget(show); }
    void showMessageMaskWidget(bool show) { mMasks.showMessageMaskWidget(show); }

    KSTreeView* treeView() const { return mTree; }
    KSTreeModel* treeModel() const { return mModel; }
    // Null while no name is being edited.
    FolderEditor* editor() const;
    FolderEdit editAction() const { return mAction; }

Q_SIGNALS:
    // Full paths of folders; the name of a title file.
    void changeFolderPath(QString path);
    void changeFolderFile(QString path, QString fileName);
    // The folder that is open in the editor was renamed elsewhere.
    void folderNameChange(QString before, QString after);
    // A folder was renamed, here or elsewhere, whether it is open or not. Comes first.
    void folderMoved(QString before, QString after);
    void clearUndoCommandStack();
    void signalCancelClicked();

public Q_SLOTS:
    void createFolder();
    void duplicateFolder();
    void openFolder();
    void cancelFolder();
    void ChangeButtonState(folderButtonState state);
    void slotCloseSoftwareKeyBoardForFileManager();

    // The tree.
    void pressedFolder(QModelIndex indexPress);
    void startEditing(QModelIndex index);
    void slotCurrentChangedByTouch(QModelIndex index);
    // The rows are sorted by the column now.
    void slotHeaderClicked(int column);

    // The editor.
    void slotCreateEditor(FolderEditor* editor);
    void slotPressedClose();
    void slotPressedEnter();
    void slotEditStateEnd();
    void slotInvalidInput();
    void slotLongInput();
    void slotValidInput();
    void slotTextChanged(QString text);
    // A message box was closed.
    void reCallcallSoftKeyBoard(MessageDefine::tagCloseParam param);

    // What the file manager has done to folders. Names, or full paths whose last part is taken.
    void folderNameChanged(FileManagerDefine::tagChangeFolderNameParam param);
    void continuefolderNameChanged(QString after);
    void slotDeleteFolder(std::wstring name);

    void slotButtonPressed(int id);
    void slotButtonReleased(bool outside, int id);

    // Escape and the window manager: Cancel, where that can be pressed.
    void reject() override;

protected:
    bool eventFilter(QObject* object, QEvent* event) override;
    void paintEvent(QPaintEvent* event) override;
    void showEvent(QShowEvent* event) override;
    void hideEvent(QHideEvent* event) override;

private:
    enum Button { DuplicateButton, CreateButton, OpenButton, CancelButton, ButtonCount };

    void createTree();
    void createDetails();
    void createButtons();
    void connectTree();
    QString regetRootPath();
    QString folderPath(const QString& name) const;

    bool checkItemisFolder(const QModelIndex& index) const;
    QModelIndex folderOf(const QModelIndex& index) const;
    // The current row is a title in that folder, which is closed.
    bool isHiddenBy(const QModelIndex& folder) const;
    QString nameOf(const QModelIndex& index) const;
    QModelIndex getFolderIndex(const QString& name, const QModelIndex& skipped = QModelIndex()) const;
    // A name that comes from another process stands for the folder.
    bool isNameOf(const QString& name, const QString& folder) const;
    bool checkFolderNameIsExist(const QString& name) const;
    bool checkDiskSpaceIsFull(const QString& path, bool withFolderSize) const;
    bool checkCanShowTemplate(const QModelIndex& index) const;
    bool checkCanCreateNew(const QModelIndex& index) const;
    bool isVanished(const QModelIndex& index);

    void setDefauleItemAttribute(const QModelIndex& index, const QString& name);
    void setAttributeAtDoEdit(const QModelIndex& index, const QString& name);
    void insertChildrenIndex(const QModelIndex& index, const QString& name);
    void setEditable(const QString& name, bool editable);
    void removeRow(const QModelIndex& index);
    void dropUnmadeFolder(const QPersistentModelIndex& row, const QString& source);

    bool addFolderRow(const QString& name, FolderEdit action, const QModelIndex& behind);
    bool openEditor(const QModelIndex& index, FolderEdit action);
    void callSoftKeyBoard();
    void showLimit(const QString& text, int code);
    // Ends an edit; true when that cannot be, for the name is in use.
    bool renameAction();
    void cancelEdit();
    void doEdit(const QString& name, const QModelIndex& index);
    void doRename(const QString& name, const QModelIndex& index);
    void canSendSignal(const QString& name, bool flag) const;
    bool filterWhileEditing(QEvent* event);

    void initThumbnailArea(const QString& path);
    void updateThumbnailArea(const QString& path);
    void clearThumbnailArea();

    FolderPickerController mController;
    FolderPickerFactory* mFactory;
    KSTreeModel* mModel;
    KSTreeView* mTree = nullptr;
    KSPushbutton* mButtons[ButtonCount] = {};
    QLabel* mTitle = nullptr;
    QLabel* mThumbnail = nullptr;
    QLabel* mSizeLabel = nullptr;
    QWidget* mOpacity = nullptr;
    DialogMasks mMasks;
    QPixmap mBackground;
    QFont mItemFont;

    QString mRootPath;
    QString mUntitled;
    QString mCurrentFolderName;
    QPersistentModelIndex mPressedIndex;
    bool mKeepDialog = false;

    QPointer<FolderEditor> mEditor;
    QPersistentModelIndex mEditIndex;
    FolderEdit mAction = FOLDER_EDIT_NONE;
    bool mEditing = false;
    bool mNameValid = true;
    bool mCommitted = false; // the text of this edit has reached the disk
    bool mMessageUp = false; // the box that tells of a name in use
    QString mOldName;
    QString mFullName;        // what is being typed
    QString mDuplicateSource; // full path
};
