#pragma once

#include "library/ArchiveAction.h"
#include "touchui/KSMenu.h"

#include <QList>

// The option menu of a user template.
class UserTemplateMenu : public KSMenu
{
    Q_OBJECT

public:
    explicit UserTemplateMenu(QWidget* parent = nullptr);

    // Updates the texts after a change of language.
    void translateText();
    ArchiveAction* action(ArchiveAction::ARCHIVE_ACTION_TYPE type) const;

private:
    QList<ArchiveAction*> m_actions; // owned by this menu as their parent
};
