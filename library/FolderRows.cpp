#include "library/FolderRows.h"

#include "library/FolderNameRules.h"
#include "library/FolderPickerFactory.h"
#include "touchui/KSModelAttributeItem.h"
#include "touchui/KSModelDataItem.h"
#include "touchui/KSTreeModel.h"
#include "touchui/KSVIEW.h"

FolderRows::FolderRows(QObject* parent)
    : m_factory(new FolderPickerFactory(parent))
    , m_model(new KSTreeModel(m_factory, FolderPickerFactory::ColumnCount, parent))
{
}

void FolderRows::reload()
{
    m_root.clear();
    regetRootPath();
    m_model->createDataItems();
    setEditable(m_openFolder, false);
}

QString FolderRows::regetRootPath()
{
    if (m_root.isEmpty()) {
        m_root = m_disk.getTitlerRootFolder();
        m_factory->setRootPath(m_root);
    }
    return m_root;
}

QString FolderRows::folderPath(const QString& name) const
{
    return m_root + QLatin1Char('/') + name;
}

bool FolderRows::checkItemisFolder(const QModelIndex& index) const
{
    return index.isValid() && m_model->isForder(index);
}

QModelIndex FolderRows::folderOf(const QModelIndex& index) const
{
    if (!index.isValid() || checkItemisFolder(index))
        return index.siblingAtColumn(FolderPickerFactory::NameColumn);
    return index.parent();
}

QString FolderRows::nameOf(const QModelIndex& index) const
{
    return index.siblingAtColumn(FolderPickerFactory::NameColumn).data().toString();
}

QModelIndex FolderRows::getFolderIndex(const QString& name, const QModelIndex& skipped) const
{
    QModelIndex found;
    for (int row = 0; row < m_model->rowCount(); ++row) {
        const QModelIndex index = m_model->index(row, FolderPickerFactory::NameColumn);
        if (index == skipped || !FolderNameRules::isSameName(nameOf(index), name))
            continue;
        if (nameOf(index) == name)
            return index;
        if (!found.isValid())
            found = index;
    }
    return found;
}

// The case of the name may differ, unless another folder has exactly this name.
bool FolderRows::isNameOf(const QString& name, const QString& folder) const
{
    if (folder.isEmpty() || !FolderNameRules::isSameName(name, folder))
        return false;
    return name == folder || nameOf(getFolderIndex(name)) != name;
}

bool FolderRows::hasTitles(const QModelIndex& folder) const
{
    return m_model->hasChildren(folder);
}

int FolderRows::titleCount(const QModelIndex& folder) const
{
    return m_model->rowCount(folder);
}

QFileInfo FolderRows::titleFile(const QModelIndex& title) const
{
    return m_factory->getNodeInfo(m_model->itemOf(title)->dataItem()->getSourceData());
}

void FolderRows::setDefauleItemAttribute(const QModelIndex& index, const QString& name)
{
    m_factory->setFolderAttribute(m_model->itemOf(index)->attributes(), name, QFileInfo());
}

void FolderRows::setAttributeAtDoEdit(const QModelIndex& index, const QString& name)
{
    m_factory->setFolderAttribute(m_model->itemOf(index)->attributes(), name,
                                  m_factory->getNewFolderInfo(name));
    setEditable(m_openFolder, false);
}

void FolderRows::insertChildrenIndex(const QModelIndex& index, const QString& name)
{
    m_model->setSourceData(index, m_factory->takeFolder(name));
}

void FolderRows::remove(const QModelIndex& index)
{
    if (index.isValid())
        m_model->removeRow(index.row(), index.parent());
}

void FolderRows::setOpenFolder(const QString& name)
{
    setEditable(m_openFolder, true);
    m_openFolder = name;
    setEditable(m_openFolder, false);
}

void FolderRows::setEditable(const QString& name, bool editable)
{
    const QModelIndex index = name.isEmpty() ? QModelIndex() : getFolderIndex(name);
    KSModelItem* item = m_model->itemOf(index);
    if (!item)
        return;
    item->attributes()->setAttribute(KSVIEW::ItemEditableRole, editable, FolderPickerFactory::NameColumn);
    item->attributes()->setAttribute(KSVIEW::ItemEditableRole, false, FolderPickerFactory::DateColumn);
}
