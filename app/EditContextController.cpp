#include "app/EditContextController.h"

#include "document/ArchiveController.h"
#include "document/ArchiveOrder.h"
#include "messaging/services/TitlerParams.h"

#include <QString>

EditContextController* EditContextController::mInstance = nullptr;

EditContextController* EditContextController::getInstance()
{
    if (!mInstance) {
        mInstance = new EditContextController;
        IEditContext::setInstance(mInstance);
    }
    return mInstance;
}

void EditContextController::clearInstance()
{
    IEditContext::setInstance(nullptr);
    delete mInstance;
    mInstance = nullptr;
}

EditContextController::EditContextController() : mArchiveController(std::make_unique<ArchiveController>())
{
    qRegisterMetaType<titler_paramter>("titler_paramter");
}

EditContextController::~EditContextController() = default;

void EditContextController::showTitlerCreate(_CALL_TITLER_TYPE type)
{
    mCallType = type;
    mIsCreate = true;
    mFileList.clear();
    Q_EMIT signalShowTitlerParameter({_titler_paramter::CREATE_OR_EDIT, {}});
}

void EditContextController::showTitlerEdit(const _SHOW_TITLER_PARAMTER& param)
{
    mIsCreate = false;
    mCallType = param.type;
    if (!param.path.empty())
        Q_EMIT signalShowTitlerParameter({_titler_paramter::CREATE_OR_EDIT, param.path});
}

void EditContextController::resultCallBack(ITitlerCallBack* callBack)
{
    mCallBack.reset(callBack);
}

bool EditContextController::isCreateNew()
{
    return mCallBack && mIsCreate;
}

bool EditContextController::isMainNeedMsg()
{
    return mCallBack && !mIsCreate && !mFileList.isEmpty();
}

bool EditContextController::isNewCreateFile(std::wstring path)
{
    return mFileList.contains(path);
}

void EditContextController::insertFilePath(std::wstring path)
{
    if (!mFileList.contains(path))
        mFileList.append(std::move(path));
}

void EditContextController::deleteFilePath(std::wstring path)
{
    mFileList.removeAll(path);
}

void EditContextController::setITitlerNoCallBack()
{
    mIsCreate = false;
    mFileList.clear();
}

void EditContextController::sentITitlerCallBack(const std::wstring& folder)
{
    if (!isCreateNew())
        return;
    orderFilePathList(QString::fromStdWString(folder));
    packSendData(folder, {mFileList.cbegin(), mFileList.cend()});
    setITitlerNoCallBack();
}

// Sorts the list by the order of the folder. If the order does not contain all files, the list stays as it
// is.
void EditContextController::orderFilePathList(const QString& folder)
{
    QList<std::wstring> ordered;
    const std::vector<ArchiveOrder*> rows = mArchiveController->getFileOrder(folder);
    for (const ArchiveOrder* row : rows) {
        const std::wstring path = QString::fromLocal8Bit(row->getArchivePath()).toStdWString();
        if (mFileList.contains(path))
            ordered.append(path);
    }
    if (ordered.size() == mFileList.size())
        mFileList = ordered;
}

void EditContextController::packSendData(const std::wstring& folder, const std::vector<std::wstring>& paths)
{
    simplebuffer buffer = TitlerParams::packPaths(paths);
    _CALLBACK_TITLER_PARAMTER record;
    record.type = mCallType;
    record.path = folder;
    record.data = buffer.data;
    record.size = static_cast<int>(buffer.size);
    record.count = static_cast<int>(paths.size());
    mCallBack->finishTitlerCreateCallback(record);
    CSimpleBuffer::simplebuffer_destroy(&buffer);
}
