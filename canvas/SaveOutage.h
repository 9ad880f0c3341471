#pragma once

#include <QObject>
#include <QTimer>
#include <set>
#include <string>
#include <vector>

// The time in which the disk refuses what is saved. Reports it to the operator once, tries again every few
// seconds and logs which files are concerned. The files themselves are kept by RefusedWrites, and by
// FileSyncQueue where the disk failed after they were in their place.
//
// One object for the process, made in the GUI thread when it is first used; never destroyed. GUI thread only.
class SaveOutage : public QObject
{
    Q_OBJECT

public:
    static constexpr int RETRY_INTERVAL = 5000; // ms

    static SaveOutage* instance();

    // Tries again to write all that the disk has refused. Returns whether nothing of it is left.
    bool retry();

private:
    // A file whose folder is away may belong to a folder that was renamed, of which a notice is on its way:
    // the operator hears of it when it has been tried again.
    enum class FoldersAway { Pardoned, Told };

    SaveOutage();
    void begin();
    void retryLater();
    bool isOver();
    void end();
    void tell(FoldersAway foldersAway);
    void logRefused();

    QTimer m_timer;
    std::set<std::string> m_logged; // paths
    unsigned long m_outage = 0;     // the last one that RefusedWrites counted
    bool m_isTold = false;
    bool m_hasSyncFailed = false;
};
