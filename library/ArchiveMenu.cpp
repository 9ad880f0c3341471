#include "library/ArchiveMenu.h"

ArchiveMenu::ArchiveMenu(QWidget* parent) : QMenu(parent)
{
    setStyleSheet(QStringLiteral(
        "QMenu { background-color: rgb(50, 50, 50); border: 1px solid rgb(102, 102, 102); padding: 6px; }"
        "QMenu::item { color: rgb(220, 220, 220); padding: 12px 28px; min-width: 250px; }"
        "QMenu::item:disabled { color: rgb(102, 102, 102); }"
        "QMenu::item:selected:enabled { background-color: rgb(0, 129, 255); }"));
    for (ArchiveAction::ARCHIVE_ACTION_TYPE type :
         {ArchiveAction::ACTION_CREATE, ArchiveAction::ACTION_COPY, ArchiveAction::ACTION_PASTE,
          ArchiveAction::ACTION_DELETE, ArchiveAction::ACTION_ADD_USER}) {
        auto* entry = new ArchiveAction(QString(), type, this);
        mActions.append(entry);
        addAction(entry);
    }
    translateText();
    connect(this, &QMenu::aboutToHide, this, &ArchiveMenu::signalMenuAboutToClose);
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
    // There is no store of user templates yet.
    action(ArchiveAction::ACTION_ADD_USER)->setEnabled(false);
}

ArchiveAction* ArchiveMenu::action(ArchiveAction::ARCHIVE_ACTION_TYPE type) const
{
    for (ArchiveAction* entry : mActions) {
        if (entry->getActionType() == type)
            return entry;
    }
    return nullptr;
}
