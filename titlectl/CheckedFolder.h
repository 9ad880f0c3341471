#pragma once

#include "document/FolderOrder.h"

#include <QHash>
#include <QSet>
#include <QString>
#include <QStringList>

// A folder of titles as it is on the disk, for the rules of the check. Read once by the constructor; any
// thread.
class CheckedFolder
{
public:
    explicit CheckedFolder(QString path);

    const QString& path() const { return m_path; }
    QString pathOf(const QString& name) const { return m_path + QLatin1Char('/') + name; }
    FolderOrder::State orderState() const { return m_orderState; }
    // Returns the rows of the order file, whatever they name.
    const QStringList& rows() const { return m_rows; }
    // Returns the names of the title files that are there, sorted.
    const QStringList& titleFiles() const { return m_titleFiles; }
    // Returns the names of all other files that are there, sorted.
    const QStringList& otherFiles() const { return m_otherFiles; }
    // Returns whether a title that can be read names this file, or one that cannot be read may do so.
    bool isNamedByTitle(const QString& name) const;

private:
    void collectNames(const QString& titleFile);

    QString m_path;
    FolderOrder::State m_orderState = FolderOrder::State::Missing;
    QStringList m_rows;
    QStringList m_titleFiles;
    QStringList m_otherFiles;
    QSet<QString> m_named;
    QStringList m_unreadableStems; // each with "_" behind it
};
