#pragma once

#include "library/FolderPickerController.h"

#include <QFileInfo>
#include <QModelIndex>
#include <QString>

class FolderPickerFactory;
class KSTreeModel;
class QObject;

// The rows of the folder picker's tree: folders below the root of the titles, and their titles below them.
// Knows which folder is open in the editor and cannot take a new name meanwhile. GUI thread.
class FolderRows
{
public:
    // The parent owns the model and its factory, and outlives this object.
    explicit FolderRows(QObject* parent);

    KSTreeModel* model() const { return m_model; }
    FolderPickerFactory* factory() const { return m_factory; }
    const FolderPickerController& disk() const { return m_disk; }

    // Looks the root up again and reads all folders anew.
    void reload();
    // Returns the root of the titles, which is looked up when it is not known.
    QString regetRootPath();
    // Full path of a folder in the root, whether it exists or not.
    QString folderPath(const QString& name) const;

    bool checkItemisFolder(const QModelIndex& index) const;
    // Returns the row of the folder; a title stands for its folder.
    QModelIndex folderOf(const QModelIndex& index) const;
    QString nameOf(const QModelIndex& index) const;
    // The row of the folder of that name. Names that differ in case alone may both be there: the very name
    // comes first.
    QModelIndex getFolderIndex(const QString& name, const QModelIndex& skipped = QModelIndex()) const;
    // Returns whether a name that comes from another process stands for the folder.
    bool isNameOf(const QString& name, const QString& folder) const;
    bool hasTitles(const QModelIndex& folder) const;
    int titleCount(const QModelIndex& folder) const;
    // The file of a title's row.
    QFileInfo titleFile(const QModelIndex& title) const;

    // Fill the row of a folder: for one that is being made, and for one that is there.
    void setDefauleItemAttribute(const QModelIndex& index, const QString& name);
    void setAttributeAtDoEdit(const QModelIndex& index, const QString& name);
    // Puts the titles of the folder below its row.
    void insertChildrenIndex(const QModelIndex& index, const QString& name);
    void remove(const QModelIndex& index);

    // The folder that is open in the editor; empty for none. setOpenFolder makes the one before editable.
    QString openFolder() const { return m_openFolder; }
    void setOpenFolder(const QString& name);
    // Follows a rename of the open folder by others, whose row is changed by the caller.
    void openFolderRenamed(const QString& name) { m_openFolder = name; }

private:
    void setEditable(const QString& name, bool editable);

    FolderPickerController m_disk;
    FolderPickerFactory* m_factory;
    KSTreeModel* m_model;
    QString m_root;
    QString m_openFolder;
};
