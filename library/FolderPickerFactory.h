#pragma once

#include "library/FolderPickerController.h"
#include "touchui/KSModelDataFactory.h"

#include <QFileInfo>
#include <QFont>
#include <QHash>
#include <QIcon>
#include <QList>
#include <QMap>
#include <QPixmap>
#include <QString>
#include <QStringList>

class FolderEditor;

// Fills the tree of the folder picker from the disk: the folders under the root of the titles, each with the
// existing titles that its order file names. The titles of a folder are read when they are first needed.
//
// A node is a number that belongs to a folder permanently, even when it is renamed, so nodes stay valid when
// the disk is read again. The node of a folder or title that no longer exists has no neighbours, no children
// and an empty file name. GUI thread.
class FolderPickerFactory : public KSModelDataFactory
{
    Q_OBJECT

public:
    enum Column { NameColumn = 0, DateColumn = 1, ColumnCount = 2 };

    static const QString DATE_FORMAT;
    static const QString FOLDER_ICON;

    explicit FolderPickerFactory(QObject* parent = nullptr);

    // Sets the root, without a slash at its end; call importSourceData() to read it.
    void setRootPath(const QString& path) { m_rootPath = path; }
    // Sets the font of the rows that are made from now on.
    void setItemFont(const QFont& font) { m_font = font; }

    // Creates an editor for the name cell of a folder and emits signalCreateEditor(); null for other cells.
    QWidget* createControl(QWidget* parent, _controlType type, const QModelIndex& index) override;
    bool isControlSelfEnding() const override { return true; }
    void importSourceData() override;
    void* getNextNode(void* node) override;
    void* getChildNode(void* node) override;
    // Stops reading at the first title.
    bool hasChildNode(void* node) override;
    void InstallItemAttribute(KSModelAttributeItem* item, void* node) override;

    // Returns the entry of a folder under the root, which need not exist.
    QFileInfo getNewFolderInfo(const QString& name) const;
    // Returns the titles of the folder in the order of its order file.
    QList<QFileInfo> getTitlerFiles(int folder, const QString& path);
    // Returns the folder or title file of the node; empty for the root.
    QFileInfo getNodeInfo(void* node);
    // Returns the node of the folder, new if it has none yet; its titles are read again.
    void* takeFolder(const QString& name);
    // Transfers the node of the old name to the new one.
    void renameFolder(const QString& oldName, const QString& newName);

    // Sets all attributes of a folder's row. The row shows the given name, even if info has another one.
    void setFolderAttribute(KSModelAttributeItem* item, const QString& name, const QFileInfo& info) const;

Q_SIGNALS:
    void signalCreateEditor(FolderEditor* editor);

public Q_SLOTS:
    // Called when the editor was released, which the view deletes.
    void slotReleaseEditor() {}

private:
    void getChildInfo(const QString& path, int folder);
    void ensureChildInfo(int folder);
    // Returns whether the folder has titles. Reads only until the first one is found.
    bool hasTitles(int folder);
    void forgetTitles(int folder);
    QList<QFileInfo> firstTitlerFiles(const QString& path, qsizetype most) const;
    void setAttributes(KSModelAttributeItem* item, const QString& name, const QDateTime& date,
                       bool folder) const;
    void setDisplayAttribute(KSModelAttributeItem* item, const QString& name, const QString& date) const;
    void setDecorationAttribute(KSModelAttributeItem* item, bool folder) const;
    void setEditAttribute(KSModelAttributeItem* item, const QString& name) const;
    void setFontAttribute(KSModelAttributeItem* item) const;
    void setTextAlignmentAttribute(KSModelAttributeItem* item) const;
    void setItemEditableAttribute(KSModelAttributeItem* item, bool folder) const;
    void setitemOtherAttribute(KSModelAttributeItem* item, const QDateTime& date, bool folder) const;

    FolderPickerController m_disk;
    QString m_rootPath;
    QFont m_font;
    QIcon m_folderIcon{QPixmap(FOLDER_ICON)};
    QList<int> m_folders;                     // in display order
    QHash<QString, int> m_numbers;            // by name, of all folders seen so far
    QMap<int, QString> m_folderNames;         // names by number
    QMap<int, QList<QFileInfo>> m_titleInfos; // of the folders whose titles were read
    QMap<int, QStringList> m_titleNames;
    QMap<int, bool> m_hasTitles; // results of hasTitles()
};
