#include "messaging/services/FileManagerControllerNotifyAdapter.h"

#include "messaging/ptc/Event.h"
#include "messaging/services/FileManagerControllerParams.h"
#include "messaging/services/IFileManagerControllerNotify.h"

FileManagerControllerNotifyAdapter::FileManagerControllerNotifyAdapter(long id) : PTC::CallbackAdapter(id)
{
}

void FileManagerControllerNotifyAdapter::setTarget(void* target)
{
    m_target = static_cast<IFileManagerControllerNotify*>(target);
}

void FileManagerControllerNotifyAdapter::receive(PTC::Event* event)
{
    if (m_target == nullptr) {
        return;
    }
    switch (event->getMethodId()) {
    case METHOD_importNotify: {
        FileManagerDefine::tagImportNotify param{};
        FileManagerControllerParams::deserialize_importNotify_param(param, event->getData(),
                                                                    event->getSize());
        m_target->importNotify(param);
        break;
    }
    case METHOD_deleteNotify: {
        FileManagerDefine::tagDeleteNotify param{};
        FileManagerControllerParams::deserialize_deleteNotify_param(param, event->getData(),
                                                                    event->getSize());
        m_target->deleteNotify(param);
        break;
    }
    case METHOD_renameTitlerTemplateNotify: {
        FileManagerDefine::tagRenameNotify param{};
        FileManagerControllerParams::deserialize_renameTitlerTemplateNotify_param(param, event->getData(),
                                                                                  event->getSize());
        m_target->renameTitlerTemplateNotify(param);
        break;
    }
    case METHOD_updateTitlerFolderInFileManagerDelete: {
        std::wstring param;
        FileManagerControllerParams::deserialize_updateTitlerFolderInFileManagerDelete_param(
            param, event->getData(), event->getSize());
        m_target->updateTitlerFolderInFileManagerDelete(param);
        break;
    }
    case METHOD_updateFolderNameInCurrentProjectNotify: {
        FileManagerDefine::tagChangeFolderNameParam param{};
        FileManagerControllerParams::deserialize_updateFolderNameInCurrentProjectNotify_param(
            param, event->getData(), event->getSize());
        m_target->updateFolderNameInCurrentProjectNotify(param);
        break;
    }
    default:
        break;
    }
}
