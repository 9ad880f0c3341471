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

EditContextController::EditContextController() : m_archiveController(std::make_unique<ArchiveController>())
{
    qRegisterMetaType<titler_paramter>("titler_paramter");
}

EditContextController::~EditContextController() = default;

void EditContextController::showTitlerCreate(_CALL_TITLER_TYPE type)
{
    m_callType = type;
    m_isCreate = true;
    m_fileList.clear();
    Q_EMIT signalShowTitlerParameter({_titler_paramter::CREATE_OR_EDIT, {}});
}

void EditContextController::showTitlerEdit(const _SHOW_TITLER_PARAMTER& param)
{
    m_isCreate = false;
    m_callType = param.type;
    if (!param.path.empty())
        Q_EMIT signalShowTitlerParameter({_titler_paramter::CREATE_OR_EDIT, param.path});
}

void EditContextController::resultCallBack(ITitlerCallBack* callBack)
{
    m_callBack.reset(callBack);
}

bool EditContextController::isCreateNew()
{
    return m_callBack && m_isCreate;
}

bool EditContextController::isMainNeedMsg()
{
    return m_callBack && !m_isCreate && !m_fileList.isEmpty();
}

bool EditContextController::isNewCreateFile(std::wstring path)
{
    return m_fileList.contains(path);
}

void EditContextController::insertFilePath(std::wstring path)
{
    if (!m_fileList.contains(path))
        m_fileList.append(std::move(path));
}

void EditContextController::deleteFilePath(std::wstring path)
{
    m_fileList.removeAll(path);
}

void EditContextController::setITitlerNoCallBack()
{
    m_isCreate = false;
    m_fileList.clear();
}

void EditContextController::sentITitlerCallBack(const std::wstring& folder)
{
    if (!isCreateNew())
        return;
    orderFilePathList(QString::fromStdWString(folder));
    packSendData(folder, {m_fileList.cbegin(), m_fileList.cend()});
    setITitlerNoCallBack();
}

// Sorts the list by the order of the folder. If the order does not contain all files, the list stays as it
// is.
void EditContextController::orderFilePathList(const QString& folder)
{
    QList<std::wstring> ordered;
    const std::vector<ArchiveOrder*> rows = m_archiveController->getFileOrder(folder);
    for (const ArchiveOrder* row : rows) {
        const std::wstring path = QString::fromLocal8Bit(row->getArchivePath()).toStdWString();
        if (m_fileList.contains(path))
            ordered.append(path);
    }
    if (ordered.size() == m_fileList.size())
        m_fileList = ordered;
}

void EditContextController::packSendData(const std::wstring& folder, const std::vector<std::wstring>& paths)
{
    simplebuffer buffer = TitlerParams::packPaths(paths);
    _CALLBACK_TITLER_PARAMTER record;
    record.type = m_callType;
    record.path = folder;
    record.data = buffer.data;
    record.size = static_cast<int>(buffer.size);
    record.count = static_cast<int>(paths.size());
    m_callBack->finishTitlerCreateCallback(record);
    CSimpleBuffer::simplebuffer_destroy(&buffer);
}
