// Unpacks the answers of the service FileManagerController and calls the target, in the receiver's thread.
#pragma once

#include "messaging/ptc/CallbackAdapter.h"

class IFileManagerControllerCallBack;

class FileManagerControllerCallBackAdapter : public PTC::CallbackAdapter
{
public:
    // Method ids of the wire.
    enum Method : long {
        METHOD_getClientID = 1,
    };

    explicit FileManagerControllerCallBackAdapter(long id);

    void receive(PTC::Event* event) override;
    // target is an IFileManagerControllerCallBack*; not owned.
    void setTarget(void* target) override;

private:
    IFileManagerControllerCallBack* m_target = nullptr;
};
