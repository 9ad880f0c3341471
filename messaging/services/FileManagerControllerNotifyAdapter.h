// Unpacks the events of the service FileManagerController and calls the target, in the receiver's thread.
#pragma once

#include "messaging/ptc/CallbackAdapter.h"

class IFileManagerControllerNotify;

class FileManagerControllerNotifyAdapter : public PTC::CallbackAdapter
{
public:
    // Method ids of the wire.
    enum Method : long {
        METHOD_importNotify = 1,
        METHOD_deleteNotify = 2,
        METHOD_renameTitlerTemplateNotify = 3,
        METHOD_updateTitlerFolderInFileManagerDelete = 4,
        METHOD_updateFolderNameInCurrentProjectNotify = 5,
    };

    explicit FileManagerControllerNotifyAdapter(long id);

    void receive(PTC::Event* event) override;
    // target is an IFileManagerControllerNotify*; not owned.
    void setTarget(void* target) override;

private:
    IFileManagerControllerNotify* m_target = nullptr;
};
