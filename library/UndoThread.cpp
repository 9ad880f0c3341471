#include "library/UndoThread.h"

#include "library/ArchiveList.h"

#include <QMutexLocker>

UndoThread::UndoThread(ArchiveList* list, QObject* parent) : QThread(parent), mList(list)
{
}

UndoThread::~UndoThread()
{
    wait();
}

void UndoThread::run()
{
    QMutexLocker lock(&mMutex);
    mList->startPicker();
}
