#pragma once

#include <QList>
#include <QObject>
#include <memory>
#include <string>
#include <vector>

#include "app/TitlerParamter.h"
#include "library/IEditContext.h"
#include "messaging/services/ITitler.h"
#include "messaging/services/TitlerDefine.h"

class ArchiveController;

// Keeps the request of a session until it is answered: the process that sent it, whether titles are to be
// created, and the files created in the session. The window is shown on signalShowTitlerParameter() and calls
// sentITitlerCallBack() when the operator closes it.
//
// GUI thread only.
class EditContextController : public QObject, public IEditContext
{
    Q_OBJECT

public:
    static EditContextController* getInstance();
    static void clearInstance();

    void showTitlerCreate(_CALL_TITLER_TYPE type);
    void showTitlerEdit(const _SHOW_TITLER_PARAMTER& param);

    // Takes ownership of the proxy to the process that sent the request. It is kept across sessions until
    // another one replaces it; null is allowed.
    void resultCallBack(ITitlerCallBack* callBack);

    // Titles are identified by the plain file name, as in the order file of the folder.
    bool isCreateNew() override;
    bool isMainNeedMsg();
    bool isNewCreateFile(std::wstring path) override;
    void insertFilePath(std::wstring path) override;
    void deleteFilePath(std::wstring path) override;

    // Ends the session without sending a result.
    void setITitlerNoCallBack();

    // Sends the titles created in a create session, in the order of the folder, and ends the session. Does
    // nothing without a callback or outside a create session.
    void sentITitlerCallBack(const std::wstring& folder);

Q_SIGNALS:
    void signalShowTitlerParameter(titler_paramter paramter);

private:
    EditContextController();
    ~EditContextController() override;

    void orderFilePathList(const QString& folder);
    void packSendData(const std::wstring& folder, const std::vector<std::wstring>& paths);

    static EditContextController* mInstance;

    std::unique_ptr<ITitlerCallBack> m_callBack;
    bool m_isCreate = false;
    _CALL_TITLER_TYPE m_callType = -1;
    QList<std::wstring> m_fileList;
    std::unique_ptr<ArchiveController> m_archiveController;
};
