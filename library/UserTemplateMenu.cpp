#include "library/UserTemplateMenu.h"

UserTemplateMenu::UserTemplateMenu(QWidget* parent) : KSMenu(parent)
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

void UserTemplateMenu::translateText()
{
    action(ArchiveAction::ACTION_CREATE)->setText(tr("Create New"));
    action(ArchiveAction::ACTION_COPY)->setText(tr("Copy"));
    action(ArchiveAction::ACTION_PASTE)->setText(tr("Paste"));
    action(ArchiveAction::ACTION_DELETE)->setText(tr("Delete"));
    action(ArchiveAction::ACTION_ADD_USER)->setText(tr("Add Template"));
}

ArchiveAction* UserTemplateMenu::action(ArchiveAction::ARCHIVE_ACTION_TYPE type) const
{
    for (ArchiveAction* entry : m_actions)
        if (entry->getActionType() == type)
            return entry;
    return nullptr;
}
