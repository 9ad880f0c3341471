// Fills the tree of the folder picker from the disk: the folders under the root of the titles, each with the
// titles that its order file names and that are there. A folder's titles are read when they are first needed.
//
// A node is a number that stays with its folder, also through a rename, so that handles outlive every
// re-reading: one whose folder or title has gone has no neighbours, no children and an empty file name. GUI
// thread.
#pragma once

#include "library/FolderPickerController.h"
#include "touchui/KSModelDataFactory.h"

#include <QFileInfo>
#include <QFont>
#include <QHash>
#include <QList>
#include <QMap>
#include <QPointer>
#include <QString>
#include <QStringList>

class FolderEditor;

class FolderPickerFactory : public KSModelDataFactory
{
    Q_OBJECT

public:
    enum Column { NameColumn = 0, DateColumn = 1, ColumnCount = 2 };

    static const QString DATE_FORMAT;
    static const QString FOLDER_ICON;

    explicit FolderPickerFactory(QObject* parent = nullptr);

    // Without a slash at its end; nothing is read until importSourceData().
    void setRootPath(const QString& path) { mRootPath = path; }
    QString rootPath() const { return mRootPath; }
    // Of the rows that are made from now on.
    void setItemFont(const QFont& font) { mFont = font; }

    // The name cells of folders have one, which signalCreateEditor announces.
    QWidget* createControl(QWidget* parent, _controlType type, const QModelIndex& index) override;
    bool isControlSelfEnding() const override { return true; }
    void importSourceData() override;
    void* getNextNode(void* node) override;
    void* getChildNode(void* node) override;
    // Reads no more titles than it takes to know.
    bool hasChildNode(void* node) override;
    void InstallItemAttribute(KSModelAttributeItem* item, void* node) override;

    // Of a folder under the root, whether it is there or not.
    QFileInfo getNewFolderInfo(const QString& name) const;
    // The titles of the folder in the order of its order file.
    QList<QFileInfo> getTitlerFiles(int folder, const QString& path);
    // What the node stands for: a folder or a title file; empty for the root.
    QFileInfo getNodeInfo(void* node);
    // Names the folder as a node, which it becomes when it is none yet; its titles are read anew.
    void* takeFolder(const QString& name);
    // The folder of the old name goes on under the new one.
    void renameFolder(const QString& oldName, const QString& newName);

    // All attributes of a folder's row. The name is what the row shows, whatever the disk says.
    void setFolderAttribute(KSModelAttributeItem* item, const QString& name, const QFileInfo& info) const;

Q_SIGNALS:
    void signalCreateEditor(FolderEditor* editor);

public Q_SLOTS:
    void slotReleaseEditor();

private:
    void getChildInfo(const QString& path, int folder);
    void ensureChildInfo(int folder);
    // Whether the folder has titles, for which only some of them may have to be looked at.
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

    FolderPickerController mDisk;
    QString mRootPath;
    QFont mFont;
    QList<int> mFolders;                     // in their order
    QHash<QString, int> mNumbers;            // of every folder that was ever seen
    QMap<int, QString> mFolderNames;         // the other way round
    QMap<int, QList<QFileInfo>> mTitleInfos; // of the folders whose titles have been read
    QMap<int, QStringList> mTitleNames;
    QMap<int, bool> mHasTitles; // of the folders that were asked about
    QPointer<FolderEditor> mEditor;
};
