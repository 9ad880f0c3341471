#pragma once

#include <QMutex>
#include <QThread>

class ArchiveList;

// Opens the picker of a title list once, from outside the GUI thread. Not related to the undo stack.
class UndoThread : public QThread
{
    Q_OBJECT

public:
    // The list must outlive the thread.
    UndoThread(ArchiveList* list, QObject* parent);
    ~UndoThread() override;

protected:
    void run() override;

private:
    ArchiveList* m_list;
    QMutex m_mutex;
};
