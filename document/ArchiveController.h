// Title storage as the widgets use it: QString instead of bytes, and what ArchiveManager lacks: copies of
// pictures, free names, new order files, and the removal of titles that no order file names. A cheap object;
// each user holds its own, on any thread.
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

class ArchiveController
{
public:
    ArchiveController();
    ~ArchiveController();
    ArchiveController(const ArchiveController&) = delete;
    ArchiveController& operator=(const ArchiveController&) = delete;

    // Full paths of the title folders.
    QList<std::string> getFolderList();

    // The titles of a folder in its order, or by name where it has none. The caller owns them.
    QList<Archive*> getArchiveList(QString folder);

    // Reads one title into the record.
    bool getOneArchive(QString path, Archive* archive);

    // Writes the title to the path in its record; path is only tested for being empty.
    bool saveNewArchive(QString path, Archive* archive);
    bool deleteArchive(QString path);
    bool saveArchiveListOrder(QString folder, QList<ArchiveOrder*> rows);

    // Looks at the order of a folder that is being opened: where it is missing or torn, a new one is made of
    // the names of its titles (what the disk refuses is kept). Returns whether the order can be trusted: it
    // is whole, or there was nothing to put in order. Where it cannot, nothing may be removed because the
    // order does not name it.
    bool prepareOrder(QString folder);

    // Saves the order of the titles that are listed. Rows of the old order for files that are in the folder
    // but are not known, because they could not be read, keep their place. What the disk refuses is kept, too
    // (RefusedWrites). Returns whether the order is on its way to the disk and can be trusted: where the old
    // one could not be read there may have been titles that it did not name.
    bool saveListedOrder(QString folder, QList<ArchiveOrder*> listed,
                         const std::unordered_set<std::string>& known);

    // The rows of a folder's order file. They stay valid as long as this controller, however often it is
    // asked.
    std::vector<ArchiveOrder*> getFileOrder(QString folder);

    QString getLastArchivePath();
    int setLastArchivePath(QString path);
    QString getLastFolderPath();
    int setLastFolderPath(QString path);

    // Copy pictures between the folders of two titles, from the names in one record to those in the other. 0
    // when a file that is there could not be copied, else 1.
    int copyArchiveBg(Archive* from, Archive* to);
    int copyArchiveThumbnail(Archive* from, Archive* to);

    // "UserTemplate_" and the three digits of a free number; empty when there is none.
    QString getFreeNameInUserTemplate(QString folder);

    // Makes an order file for a folder that has XML files but no rows. Whether it did.
    bool createNewOrderAccordingToFilesUnderFolder(QString folder);

    // The same for all title folders; gives those that got a new order file.
    QList<std::string> reCreateOrderXml();

    // Deletes the titles of a folder, with their pictures, that its order file does not name, and reports
    // each. Looks at the names only when there are more or fewer files than rows. Does nothing without a
    // whole order file, or with one that the disk has not taken yet.
    void deleteUnusefulArchives(QString folder);

    std::vector<std::string> getTargetFileList(std::vector<ArchiveOrder*> rows, std::string folder);

    // The title files that are no targets.
    std::vector<std::string> getDeletedFileList(std::vector<std::string> files,
                                                std::vector<std::string> targets);

private:
    ArchiveManager* mArchiveManager;       // shared, not owned
    std::vector<ArchiveOrder*> mFileOrder; // the rows last fetched
    std::vector<std::unique_ptr<ArchiveOrder>> mFetchedRows;
};
