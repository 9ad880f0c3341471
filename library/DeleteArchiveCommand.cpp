#include "library/DeleteArchiveCommand.h"

#include "document/ArchiveOrder.h"
#include "library/ArchiveItem.h"
#include "library/ArchiveList.h"
#include "library/TitleReports.h"

DeleteArchiveCommand::DeleteArchiveCommand(ArchiveList* list, ArchiveItem* item, int position,
                                           bool isSelected, QUndoCommand* parent)
    : QUndoCommand(parent), m_list(list), m_item(item), m_position(position), m_isSelected(isSelected)
{
}

void DeleteArchiveCommand::redo()
{
    if (!ArchiveItem::isUsable(m_item))
        return;
    const QString path = m_item->getArchiveDataPath();
    // The selection may differ on redo, since selecting a title is not an undo step while the stack is clean.
    m_isSelected = m_isSelected || m_list->getSelectedArchive() == m_item;
    m_item->hide();
    m_list->removeWidgetItem(m_item);
    m_list->saveArchiveListOrder();
    TitleReports::titleChanged(FileManagerDefine::TITLE_DELETED, path);
    if (TitleReports::isNewInContext(path)) {
        TitleReports::removeFromContext(path);
        m_isNewInContext = true;
    }
    if (m_isSelected)
        m_list->selectArchive(qMin(m_position, m_list->count() - 1));
}

void DeleteArchiveCommand::undo()
{
    if (!ArchiveItem::isUsable(m_item))
        return;
    const QString path = m_item->getArchiveDataPath();
    m_list->addWidgetItem(m_item, m_position);
    m_list->saveArchiveListOrder();
    if (m_isSelected)
        m_list->selectArchive(m_position);
    if (m_isNewInContext)
        TitleReports::addToContext(path);
    TitleReports::titleChanged(FileManagerDefine::TITLE_ADDED, path);
}

QList<ArchiveOrder*> DeleteArchiveCommand::getArchiveOrderList() const
{
    return m_list->getArchiveOrderList();
}
