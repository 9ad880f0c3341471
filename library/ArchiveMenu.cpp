#include "library/ArchiveMenu.h"

ArchiveMenu::ArchiveMenu(QWidget* parent) : KSMenu(parent)
{
    for (ArchiveAction::ARCHIVE_ACTION_TYPE type :
         {ArchiveAction::ACTION_CREATE, ArchiveAction::ACTION_COPY, ArchiveAction::ACTION_PASTE,
          ArchiveAction::ACTION_DELETE, ArchiveAction::ACTION_ADD_USER}) {
        auto* entry = new ArchiveAction(QString(), type, this);
        m_actions.append(entry);
        addAction(entry);
    }
    translateText();
}

void ArchiveMenu::translateText()
{
    action(ArchiveAction::ACTION_CREATE)->setText(tr("Create New"));
    action(ArchiveAction::ACTION_COPY)->setText(tr("Copy"));
    action(ArchiveAction::ACTION_PASTE)->setText(tr("Paste"));
    action(ArchiveAction::ACTION_DELETE)->setText(tr("Delete"));
    action(ArchiveAction::ACTION_ADD_USER)->setText(tr("Save as Template"));
}

void ArchiveMenu::enableFor(bool onItem, bool hasCopy)
{
    action(ArchiveAction::ACTION_CREATE)->setEnabled(true);
    action(ArchiveAction::ACTION_COPY)->setEnabled(onItem);
    action(ArchiveAction::ACTION_PASTE)->setEnabled(hasCopy);
    action(ArchiveAction::ACTION_DELETE)->setEnabled(onItem);
    action(ArchiveAction::ACTION_ADD_USER)->setEnabled(onItem);
}

ArchiveAction* ArchiveMenu::action(ArchiveAction::ARCHIVE_ACTION_TYPE type) const
{
    for (ArchiveAction* entry : m_actions)
        if (entry->getActionType() == type)
            return entry;
    return nullptr;
}
