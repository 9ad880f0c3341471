#pragma once

#include <QAction>

// One entry of the title list's option menu.
class ArchiveAction : public QAction
{
    Q_OBJECT

public:
    // The number 4 is not used.
    enum ARCHIVE_ACTION_TYPE {
        ACTION_CREATE = 0,
        ACTION_COPY = 1,
        ACTION_PASTE = 2,
        ACTION_DELETE = 3,
        ACTION_ADD_USER = 5,
    };

    ArchiveAction(const QString& text, ARCHIVE_ACTION_TYPE type, QObject* parent)
        : QAction(text, parent), m_type(type)
    {
    }

    ARCHIVE_ACTION_TYPE getActionType() const { return m_type; }
    void setActionType(ARCHIVE_ACTION_TYPE type) { m_type = type; }

private:
    ARCHIVE_ACTION_TYPE m_type;
};
