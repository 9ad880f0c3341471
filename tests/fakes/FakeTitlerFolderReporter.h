#pragma once

#include "library/ITitlerFolderReporter.h"

#include <QFileInfo>
#include <QList>
#include <QString>
#include <QStringList>
#include <utility>

// Replaces the link to the file manager as long as it exists: keeps what is reported about folders.
class FakeTitlerFolderReporter : public ITitlerFolderReporter
{
public:
    FakeTitlerFolderReporter() { setInstance(this); }
    ~FakeTitlerFolderReporter() override { setInstance(nullptr); }

    void editFolderStartStatus(QString folder) override { m_reports.append({"start", folder, {}}); }
    void editFolderEndStatus(QString folder) override { m_reports.append({"end", folder, {}}); }
    void updateTitlerOrder(QString folder) override { m_reports.append({"order", folder, {}}); }
    void renameFolderStartStatus(QString folder) override { m_reports.append({"rename", folder, {}}); }
    void changeTitlerFolderName(QString oldPath, QString newPath) override
    {
        m_reports.append({"renamed", oldPath, newPath});
    }

    // Returns the reports since the last call with the names of the folders: "start news", "renamed news to
    // sports".
    QStringList take()
    {
        return takeLines([](const QString& path) { return QFileInfo(path).fileName(); });
    }
    // The same with full paths.
    QStringList takePaths()
    {
        return takeLines([](const QString& path) { return path; });
    }

private:
    struct Report {
        QString what;
        QString folder;
        QString newPath; // null if the folder keeps its name
    };

    template <typename Shown>
    QStringList takeLines(Shown shown)
    {
        QStringList lines;
        for (const Report& report : std::exchange(m_reports, {})) {
            QString line = report.what + QLatin1Char(' ') + shown(report.folder);
            if (!report.newPath.isNull())
                line += QStringLiteral(" to ") + shown(report.newPath);
            lines.append(line);
        }
        return lines;
    }

    QList<Report> m_reports;
};
