#pragma once

#include <QString>

// Reports to the file manager which title folder is being edited or renamed. The application implements it.
class ITitlerFolderReporter
{
public:
    virtual ~ITitlerFolderReporter() = default;

    // Report that editing has begun or ended. Full folder paths; an empty path is not reported.
    virtual void editFolderStartStatus(QString folder) = 0;
    virtual void editFolderEndStatus(QString folder) = 0;
    // Reports that the order of the titles in the folder has changed, without a title added or removed.
    virtual void updateTitlerOrder(QString folder) = 0;

    // Reports that the operator has begun to rename the folder.
    virtual void renameFolderStartStatus(QString folder) = 0;
    // Reports the end of a rename; both paths are equal when the folder kept its name.
    virtual void changeTitlerFolderName(QString oldPath, QString newPath) = 0;

    // Returns the instance, which is not owned; null when nothing is reported. GUI thread.
    static ITitlerFolderReporter* instance() { return s_instance; }
    static void setInstance(ITitlerFolderReporter* reporter) { s_instance = reporter; }

private:
    inline static ITitlerFolderReporter* s_instance = nullptr;
};
