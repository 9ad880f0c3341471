#pragma once

#include "library/ArchiveAction.h"
#include "touchui/KSMenu.h"

#include <QList>

// The option menu of the title list.
class ArchiveMenu : public KSMenu
{
    Q_OBJECT

public:
    explicit ArchiveMenu(QWidget* parent = nullptr);

    // Updates the texts after a change of language.
    void translateText();

    // Enables the entries. onItem: the menu was opened on a title. hasCopy: the clipboard contains a title.
    void enableFor(bool onItem, bool hasCopy);

    ArchiveAction* action(ArchiveAction::ARCHIVE_ACTION_TYPE type) const;

private:
    QList<ArchiveAction*> m_actions; // owned by this menu as their parent
};
