// Packs the calls of IFileManagerController and sends them to the service.
#pragma once

#include "messaging/ptc/Proxy.h"
#include "messaging/services/IFileManagerController.h"

class FileManagerControllerRemoteProxy : public IFileManagerController, public PTC::Proxy
{
public:
    // Method ids of the wire.
    enum Method : long {
        METHOD_unregisterCallBack = 33,
        METHOD_unregisterNotify = 34,
        METHOD_updateTitlerStatus = 72,
        METHOD_renameFolderStart = 73,
        METHOD_updateTitlerFolderName = 74,
        METHOD_titlerEditStatus = 75,
        METHOD_titlerEditEndStatus = 76,
        METHOD_updateTitlerOrder = 77,
        METHOD_registerCallBack = 78,
        METHOD_registerNotify = 79,
    };
    static constexpr long INTERFACE_ID = 36;
    static constexpr long CALLBACK_ADAPTER_TYPE = 37;
    static constexpr long NOTIFY_ADAPTER_TYPE = 38;

    explicit FileManagerControllerRemoteProxy(long id);

    void unregisterCallBack(int clientId) override;
    void unregisterNotify(int clientId) override;
    void updateTitlerStatus(FileManagerDefine::tagTitleChangeStatusParam param) override;
    void renameFolderStart(FileManagerDefine::tagTitlerPathParam param) override;
    void updateTitlerFolderName(FileManagerDefine::tagChangeFolderNameParam param) override;
    void titlerEditStatus(FileManagerDefine::tagTitlerPathParam param) override;
    void titlerEditEndStatus(FileManagerDefine::tagTitlerPathParam param) override;
    void updateTitlerOrder(FileManagerDefine::tagTitlerPathParam param) override;
    void registerCallBack(IFileManagerControllerCallBack* target) override;
    void registerNotify(_tagFileManagerControllerNotify notify) override;
};
