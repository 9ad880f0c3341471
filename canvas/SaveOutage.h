#pragma once

#include <QObject>
#include <QTimer>
#include <set>
#include <string>
#include <vector>

// A time in which files cannot be written to the disk. Reports it to the operator once, retries every few
// seconds and logs the files concerned. The contents of the files are kept by RefusedWrites, or by
// FileSyncQueue when a file was renamed into place but could not be synced.
//
// One object for the process, made in the GUI thread on first use and never destroyed. GUI thread only.
class SaveOutage : public QObject
{
    Q_OBJECT

public:
    static constexpr int RETRY_INTERVAL = 5000; // ms

    static SaveOutage* instance();

    // Retries all refused writes. Returns whether none is left.
    bool retry();

private:
    // Whether the operator is told of files whose folder is missing. The folder may have been renamed, with
    // the notice still on its way, so these files are reported only after a retry.
    enum class FoldersAway { Pardoned, Told };

    SaveOutage();
    void begin();
    void retryLater();
    bool isOver();
    void end();
    void tell(FoldersAway foldersAway);
    void logRefused();

    QTimer m_timer;
    std::set<std::string> m_logged; // paths of the files logged
    unsigned long m_outage = 0;     // number of the last outage that RefusedWrites counted
    bool m_isTold = false;
    bool m_hasSyncFailed = false;
};
