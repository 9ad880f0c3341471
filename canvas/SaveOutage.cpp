#include "canvas/SaveOutage.h"

#include "canvas/MessageBoxController.h"
#include "document/ITitleChangeReporter.h"
#include "support/FileSyncQueue.h"
#include "support/LogManager.h"
#include "support/RefusedWrites.h"

#include <QFileInfo>
#include <QString>
#include <algorithm>
#include <cstring>
#include <utility>

namespace
{

const int LOG_NUMBER = 400;

void log(const std::string& text)
{
    LOG_DEBUG_OPERATE(L"SaveOutage", LOG_NUMBER, QString::fromStdString(text).toStdWString());
}

bool hasFolder(const RefusedWrites::File& file)
{
    return QFileInfo(QFileInfo(QString::fromStdString(file.path)).path()).isDir();
}

// Reports the titles whose pictures were written to the file manager.
void reportPictures(const std::vector<RefusedWrites::File>& written)
{
    std::set<std::string> titles;
    for (const RefusedWrites::File& file : written)
        if (!file.title.empty())
            titles.insert(file.title);
    if (ITitleChangeReporter* reporter = ITitleChangeReporter::instance()) {
        for (const std::string& title : titles)
            reporter->changeTitlerStatus(FileManagerDefine::TITLE_PICTURES_CHANGED,
                                         QString::fromStdString(title));
    }
}

} // namespace

SaveOutage* SaveOutage::instance()
{
    // Never destroyed, since threads may report to it until the process ends.
    static SaveOutage* const outage = new SaveOutage;
    return outage;
}

SaveOutage::SaveOutage()
{
    m_timer.setInterval(RETRY_INTERVAL);
    connect(&m_timer, &QTimer::timeout, this, &SaveOutage::retryLater);
    const auto listener = [this] {
        QMetaObject::invokeMethod(this, &SaveOutage::begin, Qt::QueuedConnection);
    };
    RefusedWrites::setListener(listener);
    FileSyncQueue::setListener(listener);
}

void SaveOutage::begin()
{
    m_hasSyncFailed = m_hasSyncFailed || FileSyncQueue::hasFailed();
    if (isOver())
        return;
    // An ordinary save may have ended the last outage before this one began.
    const unsigned long outage = RefusedWrites::outages();
    if (std::exchange(m_outage, outage) != outage && !m_hasSyncFailed)
        end();
    if (!m_timer.isActive())
        m_timer.start();
    logRefused();
    tell(FoldersAway::Pardoned);
}

bool SaveOutage::retry()
{
    reportPictures(RefusedWrites::retry());
    FileSyncQueue::retryFailed();
    if (isOver())
        end();
    return RefusedWrites::isEmpty();
}

void SaveOutage::retryLater()
{
    retry();
    if (!isOver())
        tell(FoldersAway::Told);
}

bool SaveOutage::isOver()
{
    return RefusedWrites::isEmpty() && (!m_hasSyncFailed || FileSyncQueue::unsynced().empty());
}

void SaveOutage::end()
{
    if (m_isTold)
        log("the disk takes again what is saved");
    m_timer.stop();
    m_logged.clear();
    m_isTold = false;
    m_hasSyncFailed = false;
}

void SaveOutage::tell(FoldersAway foldersAway)
{
    MessageBoxController* const messages = MessageBoxController::getInstance();
    if (m_isTold || !messages)
        return;
    const std::vector<RefusedWrites::File> files = RefusedWrites::files();
    if (foldersAway == FoldersAway::Pardoned && !m_hasSyncFailed &&
        std::none_of(files.begin(), files.end(), hasFolder))
        return;
    m_isTold = true;
    messages->postMessage(MessageDef::MESSAGE_DISK_FULL_ON_CREATE, tr("File"));
}

void SaveOutage::logRefused()
{
    for (const RefusedWrites::File& file : RefusedWrites::files())
        if (m_logged.insert(file.path).second)
            log("cannot write " + file.path + ": " + std::strerror(file.error));
    if (!m_hasSyncFailed)
        return;
    for (const std::string& path : FileSyncQueue::unsynced())
        if (m_logged.insert(path).second)
            log("cannot sync " + path);
}
