#pragma once

#include "support/FolderLock.h"

#include <QString>
#include <QStringList>
#include <QTemporaryDir>

// A hidden folder within a folder of titles, in which the files of a title are completed before they replace
// those in the folder. It is removed with this object. Any thread.
class TitleStage
{
public:
    // Removes what killed processes have left in the folder.
    explicit TitleStage(const QString& folder);

    // Returns the names of the stages in the folder that killed processes have left.
    static QStringList abandonedIn(const QString& folder);

    bool isValid() const { return m_stage.isValid(); }
    // Returns why there is no stage.
    QString error() const { return m_stage.errorString(); }
    QString path() const { return m_stage.path(); }

    // Moves the files of a title into the folder: "STEM.xml", and all that begin with "STEM_"; without a stem
    // all files of the stage. The title file comes after its background and before its pictures, so that a
    // process that is killed meanwhile leaves at most pictures that are older than their title, which are
    // made again. Returns what went wrong, or an empty string; files that are not in the folder by then are
    // dropped.
    QString place(const QString& stem = {}) const;
    // Drops the files of a title.
    void drop(const QString& stem) const;

private:
    QStringList filesOf(const QString& stem) const;

    QString m_folder;
    QTemporaryDir m_stage;
    FolderLock m_lock; // shows that the stage is in use
};
