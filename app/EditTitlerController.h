#pragma once

#include <QObject>
#include <QString>
#include <string>

#include "app/ServiceLink.h"
#include "document/ITitleChangeReporter.h"
#include "library/ITitlerFolderReporter.h"
#include "messaging/services/FileManagerDefine.h"
#include "messaging/services/IFileManagerController.h"

// The link to the file manager service: reports changes that this program makes in the title folders, and
// forwards notices of changes by other processes (fonts and templates imported, templates deleted or renamed,
// folders renamed or deleted).
//
// changeTitlerStatus() may be called from any thread, everything else from the GUI thread only.
class EditTitlerController : public QObject,
                             public IFileManagerControllerCallBack,
                             public IFileManagerControllerNotify,
                             public ITitleChangeReporter,
                             public ITitlerFolderReporter
{
    Q_OBJECT

public:
    static EditTitlerController* getInstance();
    static void clearInstance();

    void setFactory(TitlerToolFactory* factory);

    // Full folder paths.
    void editFolderStartStatus(QString folder) override;
    void editFolderEndStatus(QString folder) override;
    void renameFolderStartStatus(QString folder) override;
    void changeTitlerStatus(FileManagerDefine::emTITLECHANGE_TYPE type, QString path) override;
    void changeTitlerFolderName(QString oldPath, QString newPath) override;
    void updateTitlerOrder(QString folder) override;

    void getClientID(int id) override;
    void importNotify(FileManagerDefine::tagImportNotify notify) override;
    void deleteNotify(FileManagerDefine::tagDeleteNotify notify) override;
    void renameTitlerTemplateNotify(FileManagerDefine::tagRenameNotify notify) override;
    void updateTitlerFolderInFileManagerDelete(std::wstring folder) override;
    void updateFolderNameInCurrentProjectNotify(FileManagerDefine::tagChangeFolderNameParam param) override;

Q_SIGNALS:
    void importNewFontFamilies(QString path);
    void importNewUserTemplate(QString path);
    void deleteUserTemplate(QString path);
    void renameUserTemplate(QString first, QString third, QString fourth);
    void folderDeleteFromFileManager(std::wstring folder);
    void folderNameChangeFromFileManager(FileManagerDefine::tagChangeFolderNameParam param);

private:
    EditTitlerController() = default;
    ~EditTitlerController() override;

    static EditTitlerController* mpInstance;

    ServiceLink<IFileManagerController> m_link;
};
