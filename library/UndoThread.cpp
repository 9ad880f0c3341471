#include "library/UndoThread.h"

#include "library/ArchiveList.h"

#include <QMutexLocker>

UndoThread::UndoThread(ArchiveList* list, QObject* parent) : QThread(parent), m_list(list)
{
}

UndoThread::~UndoThread()
{
    wait();
}

void UndoThread::run()
{
    QMutexLocker lock(&m_mutex);
    m_list->startPicker();
}
