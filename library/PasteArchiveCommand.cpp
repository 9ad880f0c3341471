#include "library/PasteArchiveCommand.h"

#include "library/ArchiveItem.h"
#include "library/ArchiveList.h"
#include "library/TitleReports.h"

PasteArchiveCommand::PasteArchiveCommand(ArchiveList* list, Archive* archive, int operationPosition,
                                         int selectedPosition, QUndoCommand* parent)
    : QUndoCommand(parent)
    , m_list(list)
    , m_item(list->createPasteUndoItem(archive, nullptr))
    // The title on which the menu was opened may have been removed meanwhile.
    , m_operationPosition(qBound(-1, operationPosition, list->count() - 1))
    , m_selectedPosition(selectedPosition)
{
}

void PasteArchiveCommand::redo()
{
    setText(QStringLiteral("PasteArchiveCommand-redo"));
    if (!ArchiveItem::isUsable(m_item))
        return;
    const QString path = m_item->getArchiveDataPath();
    m_list->addWidgetItem(m_item, m_operationPosition + 1);
    m_list->saveArchiveListOrder();
    TitleReports::addToContext(path);
    TitleReports::titleChanged(FileManagerDefine::TITLE_ADDED, path);
    m_list->selectArchive(m_operationPosition + 1);
    if (m_doneOnce == 0) {
        m_list->selectOperationArchive(m_operationPosition + 1);
        m_doneOnce = 1;
    }
}

void PasteArchiveCommand::undo()
{
    setText(QStringLiteral("PasteArchiveCommand-undo"));
    if (!ArchiveItem::isUsable(m_item))
        return;
    const QString path = m_item->getArchiveDataPath();
    m_item->hide();
    m_list->removeWidgetItem(m_item);
    m_list->saveArchiveListOrder();
    TitleReports::titleChanged(FileManagerDefine::TITLE_DELETED, path);
    TitleReports::removeFromContext(path);
    m_list->selectArchive(m_selectedPosition);
}
