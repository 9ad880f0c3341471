#pragma once

#include "library/FolderNameEdit.h"
#include "library/FolderPickerController.h"
#include "library/FolderRows.h"
#include "messaging/services/FileManagerDefine.h"
#include "messaging/services/MessageDefine.h"
#include "touchui/DialogMasks.h"

#include <QDialog>
#include <QFont>
#include <QImage>
#include <QPixmap>
#include <QPoint>
#include <QSize>
#include <QString>
#include <memory>
#include <string>

class FolderEditor;
class KSPushbutton;
class KSTreeModel;
class KSTreeView;
class QLabel;
class TitlePreview;

// The dialog in which the operator picks the folder of titles to work in, or a title in it: a tree of the
// folders under the root of the titles, with a picture of the pressed title. Folders are created, copied and
// renamed in their rows, and changes by other processes are shown while the dialog is open. It exists as long
// as the main window and is shown with exec(). GUI thread.
class FolderPicker : public QDialog
{
    Q_OBJECT

public:
    static const int LEFT_WIDTH = 240; // width of the picture of a title; its height follows
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

    // Which of Duplicate, New Folder, Open and Cancel are enabled; any other value enables all.
    enum _folderButtonState {
        ALL_BUTTONS = 0,
        NO_DUPLICATE = 1,
        OPEN_AND_CANCEL = 2,
        NO_BUTTONS = 3,
        NEW_FOLDER_AND_CANCEL = 4
    };
    using folderButtonState = _folderButtonState;

    using FolderEdit = FolderNameEdit::FolderEdit;
    using enum FolderNameEdit::FolderEdit;

    explicit FolderPicker(QWidget* parent = nullptr);
    ~FolderPicker() override;

    // Marks the folder that is open in the editor, which cannot be renamed meanwhile. Empty for none.
    void setCurrentFolderName(const QString& name) { m_rows.setOpenFolder(name); }
    QString currentFolderName() const { return m_rows.openFolder(); }
    void setSystemLanFont(QFont font);
    void translateText();
    // Reads all folders again; drops the selection and an edit.
    void updateTreeView();
    // Opens the soft keyboard again while a name is being edited.
    void showSoftKeyboard();

    void setDuplicateButtonEnabled(bool enabled);
    void setCreateFolderButtonEnabled(bool enabled);
    void setCancelButtonEnabled(bool enabled);

    // Keeps this dialog open when the folder being opened needs a template and none is picked in the dialog
    // above.
    void setKeepFolderDialog() { m_keepDialog = true; }
    // Darkens this dialog while another dialog of this process is above it.
    void showOpacityWidget(bool show);
    void showDialogMaskWidget(bool show) { m_masks.showDialogMaskWidget(show); }
    void showMessageMaskWidget(bool show) { m_masks.showMessageMaskWidget(show); }

    KSTreeView* treeView() const { return m_tree; }
    KSTreeModel* treeModel() const { return m_rows.model(); }
    // Returns the field, or null while no name is being edited.
    FolderEditor* editor() const { return m_edit->editor(); }
    FolderEdit editAction() const { return m_edit->action(); }

Q_SIGNALS:
    // Emitted when the operator has picked a folder or a title. Full paths of folders; the name of a title
    // file.
    void changeFolderPath(QString path);
    void changeFolderFile(QString path, QString fileName);
    // Emitted when another process has renamed the folder that is open in the editor.
    void folderNameChange(QString before, QString after);
    // Emitted when this or another process has renamed a folder, whether it is open or not. Comes before
    // folderNameChange().
    void folderMoved(QString before, QString after);
    void clearUndoCommandStack();
    void signalCancelClicked();

public Q_SLOTS:
    void createFolder();
    void duplicateFolder();
    void openFolder();
    void cancelFolder();
    void ChangeButtonState(folderButtonState state);
    void slotCloseSoftwareKeyBoardForFileManager() { FolderNameEdit::closeSoftKeyBoard(); }

    // Slots of the tree
    void pressedFolder(QModelIndex indexPress);
    void startEditing(QModelIndex index);
    void slotCurrentChangedByTouch(QModelIndex index);
    // Called when the rows were sorted by the column.
    void slotHeaderClicked(int column);

    // Slots of the editor
    void slotCreateEditor(FolderEditor* editor) { m_edit->slotCreateEditor(editor); }
    void slotPressedClose() { m_edit->slotPressedClose(); }
    void slotPressedEnter() { m_edit->slotPressedEnter(); }
    void slotEditStateEnd() { m_edit->slotEditStateEnd(); }
    void slotInvalidInput() { m_edit->slotInvalidInput(); }
    void slotLongInput() { m_edit->slotLongInput(); }
    void slotValidInput() { m_edit->slotValidInput(); }
    void slotTextChanged(QString) {} // the field itself keeps the text
    // Called when a message box was closed.
    void reCallcallSoftKeyBoard(MessageDefine::tagCloseParam param) { m_edit->messageClosed(param); }

    // Called when another process renamed or deleted a folder. Takes names or full paths, of which the last
    // part is used.
    void folderNameChanged(FileManagerDefine::tagChangeFolderNameParam param);
    void continuefolderNameChanged(QString after) { m_edit->goOnFrom(after); }
    void slotDeleteFolder(std::wstring name);

    // Called on Escape and by the window manager: acts like Cancel if that is enabled.
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

    bool isVanished(const QModelIndex& index);
    bool isEditKept();
    void renameRow(const QString& before, const QString& after);
    bool filterWhileEditing(QEvent* event);

    FolderRows m_rows;
    KSTreeView* m_tree = nullptr;
    std::unique_ptr<FolderNameEdit> m_edit;
    KSPushbutton* m_buttons[ButtonCount] = {};
    QLabel* m_title = nullptr;
    std::unique_ptr<TitlePreview> m_preview;
    QWidget* m_opacity = nullptr;
    DialogMasks m_masks;
    QPixmap m_background;
    QImage m_separator;
    QString m_untitled;
    bool m_keepDialog = false;
};
