#pragma once

#include "messaging/services/MessageDefine.h"

#include <QModelIndex>
#include <QObject>
#include <QPersistentModelIndex>
#include <QPointer>
#include <QString>

class FolderEditor;
class FolderRows;
class KSTreeView;

// Edits a folder's name in its row: of a folder that is renamed, created, or created as a copy of another.
// Opens the field with the soft keyboard, refuses names in use, and carries out the change on the disk. GUI
// thread.
class FolderNameEdit : public QObject
{
    Q_OBJECT

public:
    enum FolderEdit { FOLDER_EDIT_NONE = 0, FOLDER_EDIT_RENAME, FOLDER_EDIT_CREATE, FOLDER_EDIT_DUPLICATE };

    // Neither the rows nor the tree are owned. No edit may be active when the tree is deleted.
    FolderNameEdit(FolderRows* rows, KSTreeView* tree, QObject* parent);

    // Returns the kind of the edit, FOLDER_EDIT_NONE without one.
    FolderEdit action() const { return m_action; }
    bool isActive() const { return m_action != FOLDER_EDIT_NONE; }
    // Returns the field, or null while none is open.
    FolderEditor* editor() const;
    // Returns the row that is being edited; invalid without an edit.
    QModelIndex row() const { return m_row; }
    // Returns the row that is being edited if its folder is not created yet; invalid otherwise.
    QModelIndex unmadeRow() const;
    // Returns whether the message about a name in use is shown.
    bool isMessageUp() const { return m_messageUp; }
    void forgetMessage() { m_messageUp = false; }

    void startRename(const QModelIndex& index);
    // Open the field in a new row at the end of the tree. Return whether it is open. source is the name of a
    // folder.
    bool startCreate(const QString& name);
    bool startDuplicate(const QString& source, const QModelIndex& sourceRow);
    // Ends the edit and applies the text. Returns true when the edit has to continue, since the name is in
    // use.
    bool renameAction();
    // Ends the edit and discards the text.
    void cancelEdit();

    // Opens the soft keyboard for the field, if there is one.
    void callSoftKeyBoard();
    static void closeSoftKeyBoard();

    // Called when another process renamed a folder; plain names. isRenaming() returns whether that folder is
    // the one being renamed here, in which case goOnFrom() continues the edit from the new name.
    void sourceRenamed(const QString& before, const QString& after);
    bool isRenaming(const QString& name) const;
    void goOnFrom(const QString& name);

Q_SIGNALS:
    // Emitted before the row gets the new name. Full paths.
    void folderMoved(QString before, QString after);
    void rowAdded();
    // Emitted when the row of a folder that was not created has been removed. isFolderCurrent: the row that
    // was current before is current again.
    void unmadeRowDropped(bool isFolderCurrent);

public Q_SLOTS:
    void slotCreateEditor(FolderEditor* editor);
    void slotEditStateEnd();
    void slotPressedEnter();
    void slotPressedClose();
    void slotInvalidInput();
    void slotLongInput();
    void slotValidInput();
    void messageClosed(MessageDefine::tagCloseParam param);
    // Called when the text of the field has to be applied.
    void doEdit(const QString& name, const QModelIndex& index);

private:
    bool addFolderRow(const QString& name, FolderEdit action, const QModelIndex& behind);
    bool openEditor(const QModelIndex& index, FolderEdit action);
    void dropUnmadeRow(const QPersistentModelIndex& row, const QString& source);
    bool checkFolderNameIsExist(const QString& name) const;
    void showLimit(const QString& text, int code);
    bool makeFolder(const QString& name, const QModelIndex& index);
    void doRename(const QString& name, const QModelIndex& index);
    void setRow(const QModelIndex& index, const QString& name);
    void canSendSignal(const QString& name, bool flag) const;

    FolderRows* m_rows;
    KSTreeView* m_tree;
    QPointer<FolderEditor> m_editor;
    QPersistentModelIndex m_row;
    FolderEdit m_action = FOLDER_EDIT_NONE;
    QString m_oldName;
    QString m_duplicateSource; // full path
    bool m_nameValid = true;
    bool m_committed = false; // whether the text was applied on the disk
    bool m_messageUp = false;
};
