// Tells the file manager which title folder is being edited or renamed. The application implements it.
#pragma once

#include <QString>

class ITitlerFolderReporter
{
public:
    virtual ~ITitlerFolderReporter() = default;

    // Full folder paths. An empty path is reported to nobody.
    virtual void editFolderStartStatus(QString folder) = 0;
    virtual void editFolderEndStatus(QString folder) = 0;
    // The order of the folder's titles has changed without a title coming or going.
    virtual void updateTitlerOrder(QString folder) = 0;

    // The operator has begun to rename the folder.
    virtual void renameFolderStartStatus(QString folder) = 0;
    // How that ended; both are the same when the folder kept its name.
    virtual void changeTitlerFolderName(QString oldPath, QString newPath) = 0;

    // The one reporter, not owned; null reports nothing. GUI thread.
    static ITitlerFolderReporter* instance() { return sInstance; }
    static void setInstance(ITitlerFolderReporter* reporter) { sInstance = reporter; }

private:
    inline static ITitlerFolderReporter* sInstance = nullptr;
};
