// How the title list opens folders: on request, for one file, and after a folder was renamed.
#include "canvas/CanvasScene.h"
#include "document/Archive.h"
#include "document/ArchiveController.h"
#include "library/ArchiveItem.h"
#include "library/ArchiveList.h"
#include "library/ArchiveRow.h"
#include "library/IEditContext.h"
#include "library/ITitlerFolderReporter.h"
#include "library/ListMessages.h"
#include "support/LogManager.h"

#include <QDir>
#include <QFileInfo>

namespace
{

bool isCreateNew()
{
    IEditContext* context = IEditContext::instance();
    return context && context->isCreateNew();
}

} // namespace

void ArchiveList::openFolder(const QString& path)
{
    endInitThread();
    mController->setLastFolderPath(path);
    setDefaultItemState(mSelectedItem);
    clearOperationItemState(mOperationItem);
    // Each start notice needs its end, or the old folder would stay locked for the sibling processes.
    ITitlerFolderReporter* reporter = ITitlerFolderReporter::instance();
    if (reporter && !mCurrentPath.isEmpty())
        reporter->editFolderEndStatus(mCurrentPath);
    mCurrentPath = path;
    clearOldArchiveList();
    resetPositions();
    initArchiveListRefreshData();
}

void ArchiveList::refreshArchiveList(QString path)
{
    openFolder(path);
    requestContents();
    if (!isEmpty() && !isCreateNew()) {
        selectArchive(0);
    } else if (!checkArchiveListIsFull()) {
        Q_EMIT signalUpdateCanvas(nullptr);
        Q_EMIT startTemplatePicker();
    } else {
        selectArchive(0);
        ListMessages::post(MessageDef::MESSAGE_LIST_FULL_ON_CREATE, ListMessages::limitText());
    }
}

void ArchiveList::refreshArchiveListInFile(QString path, QString fileName)
{
    LOG_DEBUG_OPERATE(L"ArchiveList", 200, L" File:" + fileName.toStdWString());
    openFolder(path);
    requestContents();

    const bool isFound = selectTitle(path + QLatin1Char('/') + fileName);
    if (isCreateNew()) {
        offerTemplateOrReportFull();
    } else if (!isFound) {
        if (isEmpty()) {
            Q_EMIT signalUpdateCanvas(nullptr);
            Q_EMIT startTemplatePicker();
        } else {
            selectArchive(0);
        }
    }
}

bool ArchiveList::selectTitle(const QString& path)
{
    const int index = findTitle(path);
    if (index < 0)
        return false;
    archiveItem(index);
    if (ArchiveRow* row = archiveRow(index); row && row->isUnreadable()) {
        removeUnreadable();
        return false;
    }
    selectArchive(index);
    return true;
}

void ArchiveList::offerTemplateOrReportFull()
{
    if (checkArchiveListIsFull())
        ListMessages::post(MessageDef::MESSAGE_LIST_FULL_ON_CREATE, ListMessages::limitText());
    else
        Q_EMIT startTemplatePicker();
}

void ArchiveList::refreshArchiveListForChangeFolderName(QString before, QString after)
{
    LOG_DEBUG_OPERATE(L"ArchiveList", 200,
                      L"ArchiveList_refreshArchiveListForChangeFolderName() Enter Before:" +
                          before.toStdWString() + L" After:" + after.toStdWString());
    if (QDir::cleanPath(before) != QDir::cleanPath(mCurrentPath)) // a request may end with a "/"
        return;
    endInitThread();
    mController->setLastFolderPath(after);
    if (mMainScene)
        mMainScene->folderRenamed(before, after);
    const int selected = getItemIndex(mSelectedItem);
    const QString fileName = QFileInfo(titlePath(selected)).fileName();
    setDefaultItemState(mSelectedItem);
    mCurrentPath = after;
    clearOldArchiveList();
    resetPositions();
    initArchiveListRefreshData();
    if (isEmpty()) {
        Q_EMIT startTemplatePicker();
        return;
    }
    // Places may differ until all titles are read, names do not.
    if (fileName.isEmpty() || !selectTitle(after + QLatin1Char('/') + fileName))
        selectArchive(qBound(0, selected, count() - 1));
}
