#include "library/FolderPickerFactory.h"

#include "document/FolderOrder.h"
#include "library/FolderEditor.h"
#include "library/FolderNameRules.h"
#include "support/ConfinedPath.h"
#include "touchui/KSModelAttributeItem.h"
#include "touchui/KSVIEW.h"

#include <QDateTime>
#include <QDir>
#include <QModelIndex>

const QString FolderPickerFactory::DATE_FORMAT = QStringLiteral("yyyy-MM-dd hh:mm");
const QString FolderPickerFactory::FOLDER_ICON = QStringLiteral(":/FolderPicker/Picker_Icon_Enabel");

namespace
{

const QLatin1String TITLE_EXTENSION(".xml");

// A node holds the number of a folder and, in the lower bits, the position of a title in it, counted from 1.
constexpr int TITLE_BITS = 16;
constexpr quintptr TITLE_MASK = (quintptr(1) << TITLE_BITS) - 1;

int folderOf(void* node)
{
    return static_cast<int>(reinterpret_cast<quintptr>(node) >> TITLE_BITS);
}

int titleOf(void* node)
{
    return static_cast<int>(reinterpret_cast<quintptr>(node) & TITLE_MASK) - 1;
}

void* nodeOf(int folder, int title = -1)
{
    return reinterpret_cast<void*>((static_cast<quintptr>(folder) << TITLE_BITS) |
                                   static_cast<quintptr>(title + 1));
}

} // namespace

FolderPickerFactory::FolderPickerFactory(QObject* parent) : KSModelDataFactory(parent)
{
    setColumnDataType(NameColumn, NameDataType);
    setColumnDataType(DateColumn, DateDataType);
}

QWidget* FolderPickerFactory::createControl(QWidget* parent, _controlType, const QModelIndex& index)
{
    if (getColumnDataType(index.column()) != NameDataType || !index.data(KSVIEW::ItemIsForderRole).toBool())
        return nullptr;
    auto* editor = new FolderEditor(parent);
    Q_EMIT signalCreateEditor(editor);
    return editor;
}

void FolderPickerFactory::importSourceData()
{
    m_folders.clear();
    m_titleInfos.clear();
    m_titleNames.clear();
    m_hasTitles.clear();
    if (m_rootPath.isEmpty())
        return;
    const QStringList names =
        QDir(m_rootPath).entryList(QDir::Dirs | QDir::NoDotAndDotDot, QDir::Name | QDir::IgnoreCase);
    for (const QString& name : names)
        if (m_disk.isTitleFolder(m_rootPath, name))
            m_folders.append(folderOf(takeFolder(name)));
}

void* FolderPickerFactory::takeFolder(const QString& name)
{
    int number = m_numbers.value(name);
    if (number == 0) {
        number = static_cast<int>(m_folderNames.size()) + 1;
        m_numbers.insert(name, number);
        m_folderNames.insert(number, name);
    }
    forgetTitles(number);
    return nodeOf(number);
}

void FolderPickerFactory::renameFolder(const QString& oldName, const QString& newName)
{
    const int number = m_numbers.take(oldName);
    if (number == 0)
        return;
    // Another folder that had the new name does not exist any more; its number gets an empty name.
    if (const int gone = m_numbers.value(newName); gone != 0)
        m_folderNames[gone] = QString();
    m_numbers.insert(newName, number);
    m_folderNames[number] = newName;
    forgetTitles(number);
}

void FolderPickerFactory::getChildInfo(const QString& path, int folder)
{
    QStringList names;
    const QList<QFileInfo> titles = getTitlerFiles(folder, path);
    for (const QFileInfo& title : titles)
        names.append(title.completeBaseName());
    m_titleInfos.insert(folder, titles);
    m_titleNames.insert(folder, names);
}

QList<QFileInfo> FolderPickerFactory::getTitlerFiles(int, const QString& path)
{
    return firstTitlerFiles(path, static_cast<qsizetype>(TITLE_MASK) - 1);
}

QList<QFileInfo> FolderPickerFactory::firstTitlerFiles(const QString& path, qsizetype most) const
{
    QList<QFileInfo> titles;
    if (m_disk.isNullDirectory(QFileInfo(path)))
        return titles;
    for (const ArchiveOrder& row : FolderOrder::rowsToShow(path.toStdString())) {
        const QString name = QString::fromStdString(row.getArchivePath());
        if (!FolderNameRules::isFolderName(name) || !name.endsWith(TITLE_EXTENSION, Qt::CaseInsensitive))
            continue;
        const QFileInfo info(path + QLatin1Char('/') + name);
        if (info.isFile() && !ConfinedPath::namedByOrder(path.toStdString(), name.toStdString()).empty())
            titles.append(info);
        if (titles.size() >= most)
            break;
    }
    return titles;
}

void FolderPickerFactory::forgetTitles(int folder)
{
    m_titleInfos.remove(folder);
    m_titleNames.remove(folder);
    m_hasTitles.remove(folder);
}

// The result is kept, since a view calls this for every row that it paints.
bool FolderPickerFactory::hasTitles(int folder)
{
    if (m_titleInfos.contains(folder))
        return !m_titleInfos.value(folder).isEmpty();
    const QString name = m_folderNames.value(folder);
    if (name.isEmpty())
        return false;
    auto known = m_hasTitles.constFind(folder);
    if (known == m_hasTitles.constEnd())
        known =
            m_hasTitles.insert(folder, !firstTitlerFiles(m_rootPath + QLatin1Char('/') + name, 1).isEmpty());
    return *known;
}

void FolderPickerFactory::ensureChildInfo(int folder)
{
    const QString name = m_folderNames.value(folder);
    if (!name.isEmpty() && !m_titleInfos.contains(folder))
        getChildInfo(m_rootPath + QLatin1Char('/') + name, folder);
}

void* FolderPickerFactory::getNextNode(void* node)
{
    const int folder = folderOf(node);
    const int title = titleOf(node);
    if (title >= 0) {
        ensureChildInfo(folder);
        return title + 1 < m_titleInfos.value(folder).size() ? nodeOf(folder, title + 1) : nullptr;
    }
    const qsizetype place = m_folders.indexOf(folder);
    return place >= 0 && place + 1 < m_folders.size() ? nodeOf(m_folders.at(place + 1)) : nullptr;
}

bool FolderPickerFactory::hasChildNode(void* node)
{
    return node == nullptr ? !m_folders.isEmpty() : titleOf(node) < 0 && hasTitles(folderOf(node));
}

void* FolderPickerFactory::getChildNode(void* node)
{
    if (node == nullptr)
        return m_folders.isEmpty() ? nullptr : nodeOf(m_folders.constFirst());
    if (titleOf(node) >= 0)
        return nullptr;
    ensureChildInfo(folderOf(node));
    return m_titleInfos.value(folderOf(node)).isEmpty() ? nullptr : nodeOf(folderOf(node), 0);
}

QFileInfo FolderPickerFactory::getNewFolderInfo(const QString& name) const
{
    return QFileInfo(m_rootPath + QLatin1Char('/') + name);
}

QFileInfo FolderPickerFactory::getNodeInfo(void* node)
{
    const int folder = folderOf(node);
    const QString name = m_folderNames.value(folder);
    if (name.isEmpty())
        return {};
    if (titleOf(node) < 0)
        return getNewFolderInfo(name);
    ensureChildInfo(folder);
    return m_titleInfos.value(folder).value(titleOf(node));
}

void FolderPickerFactory::InstallItemAttribute(KSModelAttributeItem* item, void* node)
{
    const QFileInfo info = getNodeInfo(node);
    if (titleOf(node) < 0)
        setFolderAttribute(item, m_folderNames.value(folderOf(node)), info);
    else
        setAttributes(item, m_titleNames.value(folderOf(node)).value(titleOf(node)), info.lastModified(),
                      false);
}

void FolderPickerFactory::setFolderAttribute(KSModelAttributeItem* item, const QString& name,
                                             const QFileInfo& info) const
{
    setAttributes(item, name, info.exists() ? info.lastModified() : QDateTime::currentDateTime(), true);
}

void FolderPickerFactory::setAttributes(KSModelAttributeItem* item, const QString& name,
                                        const QDateTime& date, bool folder) const
{
    setDisplayAttribute(item, name, date.toString(DATE_FORMAT));
    setDecorationAttribute(item, folder);
    setEditAttribute(item, name);
    setFontAttribute(item);
    setTextAlignmentAttribute(item);
    setItemEditableAttribute(item, folder);
    setitemOtherAttribute(item, date, folder);
}

void FolderPickerFactory::setDisplayAttribute(KSModelAttributeItem* item, const QString& name,
                                              const QString& date) const
{
    item->setAttributeMaxKey(Qt::DisplayRole, DateColumn);
    item->setAttribute(Qt::DisplayRole, name, NameColumn);
    item->setAttribute(Qt::DisplayRole, date, DateColumn);
}

void FolderPickerFactory::setDecorationAttribute(KSModelAttributeItem* item, bool folder) const
{
    if (!folder)
        return;
    item->setAttributeMaxKey(Qt::DecorationRole, DateColumn);
    item->setAttribute(Qt::DecorationRole, m_folderIcon, NameColumn);
}

void FolderPickerFactory::setEditAttribute(KSModelAttributeItem* item, const QString& name) const
{
    item->setAttributeMaxKey(Qt::EditRole, DateColumn);
    item->setAttribute(Qt::EditRole, name, NameColumn);
}

void FolderPickerFactory::setFontAttribute(KSModelAttributeItem* item) const
{
    item->setAttribute(Qt::FontRole, m_font, NameColumn);
}

void FolderPickerFactory::setTextAlignmentAttribute(KSModelAttributeItem* item) const
{
    item->setAttribute(Qt::TextAlignmentRole, static_cast<int>(Qt::AlignLeft | Qt::AlignVCenter), NameColumn);
}

// Makes only the name cells of folders editable.
void FolderPickerFactory::setItemEditableAttribute(KSModelAttributeItem* item, bool folder) const
{
    item->setAttributeMaxKey(KSVIEW::ItemEditableRole, DateColumn);
    item->setAttribute(KSVIEW::ItemEditableRole, folder, NameColumn);
    item->setAttribute(KSVIEW::ItemEditableRole, false, DateColumn);
}

void FolderPickerFactory::setitemOtherAttribute(KSModelAttributeItem* item, const QDateTime& date,
                                                bool folder) const
{
    item->setAttribute(KSVIEW::ItemIsForderRole, folder, NameColumn);
    item->setAttribute(KSVIEW::ItemDateRole, date, NameColumn);
}
