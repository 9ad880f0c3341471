#include "app/EditTitlerController.h"

#include <QThread>
#include <cstdint>
#include <mutex>

namespace
{
std::mutex instanceMutex;
}

EditTitlerController* EditTitlerController::mpInstance = nullptr;

EditTitlerController* EditTitlerController::getInstance()
{
    const std::lock_guard lock(instanceMutex);
    if (!mpInstance) {
        mpInstance = new EditTitlerController;
        ITitleChangeReporter::setInstance(mpInstance);
        ITitlerFolderReporter::setInstance(mpInstance);
    }
    return mpInstance;
}

void EditTitlerController::clearInstance()
{
    ITitleChangeReporter::setInstance(nullptr);
    ITitlerFolderReporter::setInstance(nullptr);
    delete mpInstance;
    mpInstance = nullptr;
}

EditTitlerController::~EditTitlerController() = default;

void EditTitlerController::setFactory(TitlerToolFactory* factory)
{
    m_link.connectTo(factory, this);
}

void EditTitlerController::getClientID(int id)
{
    m_link.clientIdCame(id, this);
}

void EditTitlerController::editFolderStartStatus(QString folder)
{
    if (m_link)
        m_link->titlerEditStatus({m_link.clientId(), folder.toStdWString()});
}

void EditTitlerController::editFolderEndStatus(QString folder)
{
    if (m_link)
        m_link->titlerEditEndStatus({m_link.clientId(), folder.toStdWString()});
}

void EditTitlerController::renameFolderStartStatus(QString folder)
{
    if (m_link)
        m_link->renameFolderStart({m_link.clientId(), folder.toStdWString()});
}

// Queued to the GUI thread, since the picture thread calls this, too, and a sender must be used in one thread
// only.
void EditTitlerController::changeTitlerStatus(FileManagerDefine::emTITLECHANGE_TYPE type, QString path)
{
    if (QThread::currentThread() != thread()) {
        QMetaObject::invokeMethod(
            this, [this, type, path] { changeTitlerStatus(type, path); }, Qt::QueuedConnection);
        return;
    }
    if (m_link)
        m_link->updateTitlerStatus({m_link.clientId(), path.toStdWString(), type});
}

void EditTitlerController::changeTitlerFolderName(QString oldPath, QString newPath)
{
    if (m_link)
        m_link->updateTitlerFolderName({m_link.clientId(), oldPath.toStdWString(), newPath.toStdWString()});
}

void EditTitlerController::updateTitlerOrder(QString folder)
{
    if (m_link)
        m_link->updateTitlerOrder({m_link.clientId(), folder.toStdWString()});
}

void EditTitlerController::importNotify(FileManagerDefine::tagImportNotify notify)
{
    const std::uint64_t fileType = static_cast<std::uint32_t>(notify.fileType) |
                                   static_cast<std::uint64_t>(static_cast<std::uint32_t>(notify.fileTypeHigh))
                                       << 32;
    if (fileType == FileManagerDefine::FILE_TYPE_FONT)
        Q_EMIT importNewFontFamilies(QString::fromStdWString(notify.path));
    else if (fileType == FileManagerDefine::FILE_TYPE_TITLER_TEMPLATE)
        Q_EMIT importNewUserTemplate(QString::fromStdWString(notify.path));
}

void EditTitlerController::deleteNotify(FileManagerDefine::tagDeleteNotify notify)
{
    if (notify.result == 0 && notify.fileType == FileManagerDefine::FILE_TYPE_TITLER_TEMPLATE)
        Q_EMIT deleteUserTemplate(QString::fromStdWString(notify.path));
}

void EditTitlerController::renameTitlerTemplateNotify(FileManagerDefine::tagRenameNotify notify)
{
    if (notify.fileType != FileManagerDefine::FILE_TYPE_TITLER_TEMPLATE)
        return;
    Q_EMIT renameUserTemplate(QString::fromStdWString(notify.strings[0]),
                              QString::fromStdWString(notify.strings[2]),
                              QString::fromStdWString(notify.strings[3]));
}

void EditTitlerController::updateTitlerFolderInFileManagerDelete(std::wstring folder)
{
    Q_EMIT folderDeleteFromFileManager(std::move(folder));
}

void EditTitlerController::updateFolderNameInCurrentProjectNotify(
    FileManagerDefine::tagChangeFolderNameParam param)
{
    Q_EMIT folderNameChangeFromFileManager(std::move(param));
}
