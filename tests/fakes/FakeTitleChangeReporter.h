#pragma once

#include "document/ITitleChangeReporter.h"

#include <QFileInfo>
#include <QList>
#include <QMutex>
#include <QMutexLocker>
#include <QPair>
#include <QSemaphore>
#include <QString>
#include <utility>

// Replaces the link to the file manager as long as it exists: keeps what is reported, from any thread. It can
// also hold the threads that write pictures.
class FakeTitleChangeReporter : public ITitleChangeReporter
{
public:
    using Reports = QList<QPair<int, QString>>; // kind of change, and path or name

    enum class Pictures { Pass, Hold };

    // With Hold each report that pictures were written waits until goOn is released.
    explicit FakeTitleChangeReporter(Pictures pictures = Pictures::Pass) : m_pictures(pictures)
    {
        setInstance(this);
    }
    ~FakeTitleChangeReporter() override { setInstance(nullptr); }

    void changeTitlerStatus(FileManagerDefine::emTITLECHANGE_TYPE type, QString path) override
    {
        {
            QMutexLocker lock(&m_mutex);
            m_reports.append({static_cast<int>(type), path});
        }
        // Other reports come from the GUI thread, which must not be blocked.
        if (m_pictures == Pictures::Hold && type == FileManagerDefine::TITLE_PICTURES_CHANGED) {
            reached.release();
            goOn.acquire();
        }
    }

    // Returns the reports since the last call, with full paths.
    Reports takePaths()
    {
        QMutexLocker lock(&m_mutex);
        return std::exchange(m_reports, {});
    }
    // The same with the names of the files, without folder and ending.
    Reports take()
    {
        Reports reports = takePaths();
        for (auto& report : reports)
            report.second = QFileInfo(report.second).completeBaseName();
        return reports;
    }

    QSemaphore reached; // released when the files of a job are written
    QSemaphore goOn;    // released by the test, once per job

private:
    const Pictures m_pictures;
    QMutex m_mutex;
    Reports m_reports;
};
