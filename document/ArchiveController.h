// Title storage as the widgets use it: QString instead of bytes, and what ArchiveManager lacks: copies of
// pictures, free names, new order files, and the removal of titles that no order file names. A cheap object;
// each user holds its own, on any thread.
#pragma once

#include <QList>
#include <QString>
#include <memory>
#include <string>
#include <vector>

class Archive;
class ArchiveManager;
class ArchiveOrder;

class ArchiveController
{
public:
    ArchiveController();
    ~ArchiveController();
    ArchiveController(const ArchiveController&) = delete;
    ArchiveController& operator=(const ArchiveController&) = delete;

    // Full paths of the title folders.
    QList<std::string> getFolderList();

    // The titles of a folder in its order. The caller owns them.
    QList<Archive*> getArchiveList(QString folder);

    // Reads one title into the record.
    bool getOneArchive(QString path, Archive* archive);

    // Writes the title to the path in its record; path is only tested for being empty.
    bool saveNewArchive(QString path, Archive* archive);
    bool deleteArchive(QString path);
    bool saveArchiveListOrder(QString folder, QList<ArchiveOrder*> rows);

    // The rows of a folder's order file. They stay valid as long as this controller, however often it is
    // asked.
    std::vector<ArchiveOrder*> getFileOrder(QString folder);

    QString getLastArchivePath();
    int setLastArchivePath(QString path);
    QString getLastFolderPath();
    int setLastFolderPath(QString path);

    // Copy pictures between the folders of two titles, from the names in one record to those in the other. 1.
    int copyArchiveBg(Archive* from, Archive* to);
    int copyArchiveThumbnail(Archive* from, Archive* to);

    // "UserTemplate_" and the three digits of a free number; empty when there is none.
    QString getFreeNameInUserTemplate(QString folder);

    // Makes an order file for a folder that has XML files but no rows. Whether it did.
    bool createNewOrderAccordingToFilesUnderFolder(QString folder);

    // The same for all title folders; gives those that got a new order file.
    QList<std::string> reCreateOrderXml();

    // Deletes the titles of a folder, with their pictures, that its order file does not name, and reports
    // each. Looks at the names only when there are more or fewer files than rows.
    void deleteUnusefulArchives(QString folder);

    std::vector<std::string> getTargetFileList(std::vector<ArchiveOrder*> rows, std::string folder);

    // The title files that are no targets.
    std::vector<std::string> getDeletedFileList(std::vector<std::string> files,
                                                std::vector<std::string> targets);

private:
    QList<Archive*> readableArchives(const std::string& folder);

    ArchiveManager* mArchiveManager;       // shared, not owned
    std::vector<ArchiveOrder*> mFileOrder; // the rows last fetched
    std::vector<std::unique_ptr<ArchiveOrder>> mFetchedRows;
};
