// Opens the picker of a title list from outside the GUI thread, once. Takes no part in the undo stack.
#pragma once

#include <QMutex>
#include <QThread>

class ArchiveList;

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
    ArchiveList* mList;
    QMutex mMutex;
};
