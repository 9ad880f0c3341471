#include "library/MoveArchiveCommand.h"

#include "library/ArchiveItem.h"
#include "library/ArchiveList.h"
#include "library/ITitlerFolderReporter.h"

MoveArchiveCommand::MoveArchiveCommand(ArchiveList* list, ArchiveItem* item, int source, int destination,
                                       QUndoCommand* parent)
    : QUndoCommand(parent), m_list(list), m_item(item), m_source(source), m_destination(destination)
{
}

void MoveArchiveCommand::redo()
{
    if (m_skipFirst)
        m_skipFirst = false;
    else
        moveTo(m_destination);
}

void MoveArchiveCommand::undo()
{
    moveTo(m_source);
    m_list->slotMenuAboutToClose();
}

void MoveArchiveCommand::moveTo(int position)
{
    if (!ArchiveItem::isUsable(m_item))
        return;
    m_list->removeWidgetItem(m_item);
    m_list->addWidgetItem(m_item, position);
    m_list->saveArchiveListOrder();
    if (ITitlerFolderReporter* reporter = ITitlerFolderReporter::instance())
        reporter->updateTitlerOrder(m_list->getCurrentPath());
}

QList<ArchiveOrder*> MoveArchiveCommand::getArchiveOrderList() const
{
    return m_list->getArchiveOrderList();
}
