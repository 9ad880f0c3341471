// Remembers what a request asked for, from the request to the answer: who asked, whether titles are to be
// created, and which files were made in the session. The window shows what signalShowTitlerParameter tells
// and calls sentITitlerCallBack when the operator closes.
//
// GUI thread only.
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

class EditContextController : public QObject, public IEditContext
{
    Q_OBJECT

public:
    static EditContextController* getInstance();
    static void clearInstance();

    void showTitlerCreate(_CALL_TITLER_TYPE type);
    void showTitlerEdit(const _SHOW_TITLER_PARAMTER& param);

    // The proxy to the asker: taken over, kept across sessions, replaced by a later one. Null is allowed.
    void resultCallBack(ITitlerCallBack* callBack);

    // Titles are told by the plain file name, as in the order file of the folder.
    bool isCreateNew() override;
    bool isMainNeedMsg();
    bool isNewCreateFile(std::wstring path) override;
    void insertFilePath(std::wstring path) override;
    void deleteFilePath(std::wstring path) override;

    // Ends the session: no result will be sent.
    void setITitlerNoCallBack();

    // Sends the titles made in a create session, in the order of the folder, and ends the session. Without a
    // callback, or outside a create session, nothing happens.
    void sentITitlerCallBack(const std::wstring& folder);

Q_SIGNALS:
    void signalShowTitlerParameter(titler_paramter paramter);

private:
    EditContextController();
    ~EditContextController() override;

    void orderFilePathList(const QString& folder);
    void packSendData(const std::wstring& folder, const std::vector<std::wstring>& paths);

    static EditContextController* mInstance;

    std::unique_ptr<ITitlerCallBack> mCallBack;
    bool mIsCreate = false;
    _CALL_TITLER_TYPE mCallType = -1;
    QList<std::wstring> mFileList;
    std::unique_ptr<ArchiveController> mArchiveController;
};
