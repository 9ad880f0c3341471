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

// The editing of a folder's name in its row: of a folder that is renamed, made, or made as a copy of another.
// Opens the field with its soft keyboard, refuses names that are in use, and brings what was typed to the
// disk. GUI thread.
class FolderNameEdit : public QObject
{
    Q_OBJECT

public:
    enum FolderEdit { FOLDER_EDIT_NONE = 0, FOLDER_EDIT_RENAME, FOLDER_EDIT_CREATE, FOLDER_EDIT_DUPLICATE };

    // Neither the rows nor the tree are owned, and no edit is active when the tree is deleted.
    FolderNameEdit(FolderRows* rows, KSTreeView* tree, QObject* parent);

    // FOLDER_EDIT_NONE while nothing is edited.
    FolderEdit action() const { return m_action; }
    bool isActive() const { return m_action != FOLDER_EDIT_NONE; }
    // Null while no field is open.
    FolderEditor* editor() const;
    // The row that is being edited; invalid for none.
    QModelIndex row() const { return m_row; }
    // The same, if the folder is only being made and does not exist yet.
    QModelIndex unmadeRow() const;
    // Returns whether the box is up that reports a name in use.
    bool isMessageUp() const { return m_messageUp; }
    void forgetMessage() { m_messageUp = false; }

    void startRename(const QModelIndex& index);
    // Return whether the field is open in a new row at the end of the tree. source is the name of a folder.
    bool startCreate(const QString& name);
    bool startDuplicate(const QString& source, const QModelIndex& sourceRow);
    // Ends the edit with what was typed. Returns true when that cannot be, since the name is in use.
    bool renameAction();
    // Ends the edit and drops what was typed.
    void cancelEdit();

    // Opens the soft keyboard for the field, if there is one.
    void callSoftKeyBoard();
    static void closeSoftKeyBoard();

    // Follow what other processes do to folders; plain names. Whether it is the folder that is being renamed:
    // then the edit goes on from the new name.
    void sourceRenamed(const QString& before, const QString& after);
    bool isRenaming(const QString& name) const;
    void goOnFrom(const QString& name);

Q_SIGNALS:
    // Full paths; comes before the row has the new name.
    void folderMoved(QString before, QString after);
    void rowAdded();
    // The row of a folder that was not made has been removed. The row that was current before is so again, if
    // there was any.
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
    // What was typed is to be carried out.
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
    bool m_committed = false; // the text of this edit has reached the disk
    bool m_messageUp = false;
};
