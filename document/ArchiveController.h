#pragma once

#include <QList>
#include <QString>
#include <memory>
#include <string>
#include <unordered_set>
#include <vector>

class Archive;
class ArchiveManager;
class ArchiveOrder;

// Provides the widgets with title storage in terms of QString. Adds to ArchiveManager the copying of
// pictures, free names, new order files, and the removal of titles that no order file lists. Cheap to
// construct: each user constructs its own, in any thread.
class ArchiveController
{
public:
    ArchiveController();
    ~ArchiveController();
    ArchiveController(const ArchiveController&) = delete;
    ArchiveController& operator=(const ArchiveController&) = delete;

    // Returns the full paths of the title folders.
    QList<std::string> getFolderList();

    // Returns the titles of a folder in its order, or by name if it has no order file. The caller owns them.
    QList<Archive*> getArchiveList(QString folder);

    // Reads one title into the record. Returns false if it cannot be read.
    bool getOneArchive(QString path, Archive* archive);

    // Writes the title to the path in its record; path is only tested for being empty.
    bool saveNewArchive(QString path, Archive* archive);
    bool deleteArchive(QString path);
    bool saveArchiveListOrder(QString folder, QList<ArchiveOrder*> rows);

    // Checks the order file of a folder that is being opened. If it is missing or damaged, a new one is made
    // with the titles sorted by name (if it cannot be written it is kept, see RefusedWrites). Returns whether
    // the order is reliable: it was complete, or the folder has no titles. If it is not reliable, titles that
    // it does not list must not be removed.
    bool prepareOrder(QString folder);

    // Saves the order of the listed titles. Rows of the old order that are not in known, because their titles
    // could not be read, keep their place if their files exist. If the write fails the order is kept
    // (RefusedWrites). Returns whether the order was written and is reliable; it is not if the old order was
    // unreadable and unknown titles exist.
    bool saveListedOrder(QString folder, QList<ArchiveOrder*> listed,
                         const std::unordered_set<std::string>& known);

    // Returns the rows of a folder's order file. They remain valid until this controller is destroyed, also
    // after further calls.
    std::vector<ArchiveOrder*> getFileOrder(QString folder);

    QString getLastArchivePath();
    int setLastArchivePath(QString path);
    QString getLastFolderPath();
    int setLastFolderPath(QString path);

    // Copy the pictures of one title to the folder of another, under the names in the other's record. Return
    // 0 if an existing file could not be copied, else 1.
    int copyArchiveBg(Archive* from, Archive* to);
    int copyArchiveThumbnail(Archive* from, Archive* to);

    // Returns "UserTemplate_" and a free number of three digits, or an empty string if there is none.
    QString getFreeNameInUserTemplate(QString folder);

    // Creates an order file for a folder that has XML files but no rows. Returns whether it was created.
    bool createNewOrderAccordingToFilesUnderFolder(QString folder);

    // Calls createNewOrderAccordingToFilesUnderFolder for all title folders; returns those that got a new
    // order file.
    QList<std::string> reCreateOrderXml();

    // Deletes, with their pictures, the titles of a folder that its order file does not list, and reports
    // each deletion. Compares names only if the numbers of files and rows differ. Does nothing if the order
    // file is incomplete or not written yet.
    void deleteUnusefulArchives(QString folder);

    std::vector<std::string> getTargetFileList(std::vector<ArchiveOrder*> rows, std::string folder);

    // Returns the title files that are not among the targets.
    std::vector<std::string> getDeletedFileList(std::vector<std::string> files,
                                                std::vector<std::string> targets);

private:
    ArchiveManager* m_archiveManager;       // shared, not owned
    std::vector<ArchiveOrder*> m_fileOrder; // the result of the last getFileOrder()
    std::vector<std::unique_ptr<ArchiveOrder>> m_fetchedRows;
};
