#pragma once

#include "library/FolderPickerController.h"

#include <QFileInfo>
#include <QModelIndex>
#include <QString>

class FolderPickerFactory;
class KSTreeModel;
class QObject;

// The rows of the folder picker's tree: folders below the root of the titles, with their titles as children.
// Knows which folder is open in the editor and cannot be renamed meanwhile. GUI thread.
class FolderRows
{
public:
    // The parent owns the model and its factory, and outlives this object.
    explicit FolderRows(QObject* parent);

    KSTreeModel* model() const { return m_model; }
    FolderPickerFactory* factory() const { return m_factory; }
    const FolderPickerController& disk() const { return m_disk; }

    // Looks up the root again and reads all folders again.
    void reload();
    // Returns the root of the titles; looks it up if it is not known yet.
    QString regetRootPath();
    // Returns the full path of a folder in the root, which need not exist.
    QString folderPath(const QString& name) const;

    bool checkItemisFolder(const QModelIndex& index) const;
    // Returns the row of the folder; for a title that of its folder.
    QModelIndex folderOf(const QModelIndex& index) const;
    QString nameOf(const QModelIndex& index) const;
    // Returns the row of the folder with the name. An exact match is preferred to one that differs in case.
    QModelIndex getFolderIndex(const QString& name, const QModelIndex& skipped = QModelIndex()) const;
    // Returns whether a name received from another process means the folder.
    bool isNameOf(const QString& name, const QString& folder) const;
    bool hasTitles(const QModelIndex& folder) const;
    int titleCount(const QModelIndex& folder) const;
    // Returns the file of a title's row.
    QFileInfo titleFile(const QModelIndex& title) const;

    // Fill the row of a folder: the first for a new folder, the second for an existing one.
    void setDefauleItemAttribute(const QModelIndex& index, const QString& name);
    void setAttributeAtDoEdit(const QModelIndex& index, const QString& name);
    // Inserts the titles of the folder below its row.
    void insertChildrenIndex(const QModelIndex& index, const QString& name);
    void remove(const QModelIndex& index);

    // Returns the folder that is open in the editor; empty for none. setOpenFolder() makes the previous one
    // editable again.
    QString openFolder() const { return m_openFolder; }
    void setOpenFolder(const QString& name);
    // Call when another process renamed the open folder. The caller changes the row.
    void openFolderRenamed(const QString& name) { m_openFolder = name; }

private:
    void setEditable(const QString& name, bool editable);

    FolderPickerController m_disk;
    FolderPickerFactory* m_factory;
    KSTreeModel* m_model;
    QString m_root;
    QString m_openFolder;
};
