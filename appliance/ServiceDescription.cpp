#include "appliance/ServiceDescription.h"

#include "appliance/JsonRecords.h"
#include "messaging/services/APPEventFilterRemoteProxy.h"
#include "messaging/services/FileManagerControllerRemoteProxy.h"
#include "messaging/services/MessageCenterRemoteProxy.h"
#include "messaging/services/PowerManagerRemoteProxy.h"
#include "messaging/services/ProjectDataManagerRemoteProxy.h"
#include "messaging/services/RecordPacking.h"
#include "messaging/services/ShowTitlerControllerRemoteProxy.h"
#include "messaging/services/SoftKeyBoardControllerRemoteProxy.h"
#include "messaging/services/SystemSetupManagerRemoteProxy.h"

namespace
{

template <typename Record>
QJsonObject decodeRecord(void* data, long size)
{
    Record record{};
    RecordPacking::deserialize(record, data, size);
    return JsonRecords::toJson(record);
}

QJsonObject decodeClientId(void* data, long size)
{
    int clientId = 0;
    RecordPacking::deserialize(clientId, data, size);
    return QJsonObject{{"clientId", clientId}};
}

QJsonObject decodeBar(void* data, long size)
{
    int bar = 0;
    RecordPacking::deserialize(bar, data, size);
    return QJsonObject{{"bar", bar}};
}

QJsonObject decodeNothing(void*, long)
{
    return QJsonObject();
}

using Kind = ServiceMethod::Kind;

ServiceDescription describeAPPEventFilter()
{
    using P = APPEventFilterRemoteProxy;
    return {
        "APPEventFilter",
        P::INTERFACE_ID,
        P::CALLBACK_ADAPTER_TYPE,
        P::NOTIFY_ADAPTER_TYPE,
        {
            {P::METHOD_postAPPEventFilter, "postAPPEventFilter", Kind::Call,
             decodeRecord<APPEventDefine::_tagAPPEvent>},
            {P::METHOD_postRestoreOriginal, "postRestoreOriginal", Kind::Call,
             decodeRecord<APPEventDefine::_tagAPPEvent>},
            {P::METHOD_postRestoreFocus, "postRestoreFocus", Kind::Call, decodeNothing},
            {P::METHOD_unregisterCallBack, "unregisterCallBack", Kind::Call, decodeClientId},
            {P::METHOD_unregisterNotify, "unregisterNotify", Kind::Call, decodeClientId},
            {P::METHOD_registerCallBack, "registerCallBack", Kind::RegisterCallBack,
             decodeRecord<_tagCallBackInfo>},
            {P::METHOD_registerNotify, "registerNotify", Kind::RegisterNotify, decodeRecord<_tagNotifyInfo>},
        }};
}

ServiceDescription describeFileManagerController()
{
    using P = FileManagerControllerRemoteProxy;
    return {
        "FileManagerController",
        P::INTERFACE_ID,
        P::CALLBACK_ADAPTER_TYPE,
        P::NOTIFY_ADAPTER_TYPE,
        {
            {P::METHOD_unregisterCallBack, "unregisterCallBack", Kind::Call, decodeClientId},
            {P::METHOD_unregisterNotify, "unregisterNotify", Kind::Call, decodeClientId},
            {P::METHOD_updateTitlerStatus, "updateTitlerStatus", Kind::Call,
             decodeRecord<FileManagerDefine::tagTitleChangeStatusParam>},
            {P::METHOD_renameFolderStart, "renameFolderStart", Kind::Call,
             decodeRecord<FileManagerDefine::tagTitlerPathParam>},
            {P::METHOD_updateTitlerFolderName, "updateTitlerFolderName", Kind::Call,
             decodeRecord<FileManagerDefine::tagChangeFolderNameParam>},
            {P::METHOD_titlerEditStatus, "titlerEditStatus", Kind::Call,
             decodeRecord<FileManagerDefine::tagTitlerPathParam>},
            {P::METHOD_titlerEditEndStatus, "titlerEditEndStatus", Kind::Call,
             decodeRecord<FileManagerDefine::tagTitlerPathParam>},
            {P::METHOD_updateTitlerOrder, "updateTitlerOrder", Kind::Call,
             decodeRecord<FileManagerDefine::tagTitlerPathParam>},
            {P::METHOD_registerCallBack, "registerCallBack", Kind::RegisterCallBack,
             decodeRecord<_tagCallBackInfo>},
            {P::METHOD_registerNotify, "registerNotify", Kind::RegisterNotify, decodeRecord<_tagNotifyInfo>},
        }};
}

ServiceDescription describeMessageCenter()
{
    using P = MessageCenterRemoteProxy;
    return {
        "MessageCenter",
        P::INTERFACE_ID,
        P::CALLBACK_ADAPTER_TYPE,
        P::NOTIFY_ADAPTER_TYPE,
        {
            {P::METHOD_setTopWindow, "setTopWindow", Kind::Call,
             decodeRecord<MessageDefine::_tagTopWindowParam>},
            {P::METHOD_getTopWindow, "getTopWindow", Kind::Call, decodeClientId},
            {P::METHOD_postMessage, "postMessage", Kind::Call, decodeRecord<MessageDefine::_tagMessageParam>},
            {P::METHOD_closeMessage, "closeMessage", Kind::Call, decodeRecord<MessageDefine::_tagCloseParam>},
            {P::METHOD_showBar, "showBar", Kind::Call, decodeBar},
            {P::METHOD_unregisterCallBack, "unregisterCallBack", Kind::Call, decodeClientId},
            {P::METHOD_unregisterNotify, "unregisterNotify", Kind::Call, decodeClientId},
            {P::METHOD_registerCallBack, "registerCallBack", Kind::RegisterCallBack,
             decodeRecord<_tagCallBackInfo>},
            {P::METHOD_registerNotify, "registerNotify", Kind::RegisterNotify, decodeRecord<_tagNotifyInfo>},
        }};
}

ServiceDescription describePowerManager()
{
    using P = PowerManagerRemoteProxy;
    return {
        "PowerManager",
        P::INTERFACE_ID,
        P::CALLBACK_ADAPTER_TYPE,
        P::NOTIFY_ADAPTER_TYPE,
        {
            {P::METHOD_closeClient, "closeClient", Kind::Call, decodeClientId},
            {P::METHOD_unregisterCallBack, "unregisterCallBack", Kind::Call, decodeClientId},
            {P::METHOD_unregisterNotify, "unregisterNotify", Kind::Call, decodeClientId},
            {P::METHOD_inProcessing, "inProcessing", Kind::Call, decodeNothing},
            {P::METHOD_powerOff, "powerOff", Kind::Call, decodeNothing},
            {P::METHOD_willPowerOff, "willPowerOff", Kind::Call, decodeNothing},
            {P::METHOD_registerCallBack, "registerCallBack", Kind::RegisterCallBack,
             decodeRecord<_tagCallBackInfo>},
            {P::METHOD_registerNotify, "registerNotify", Kind::RegisterNotify, decodeRecord<_tagNotifyInfo>},
        }};
}

ServiceDescription describeProjectDataManager()
{
    using P = ProjectDataManagerRemoteProxy;
    return {"ProjectDataManager",
            P::INTERFACE_ID,
            P::CALLBACK_ADAPTER_TYPE,
            P::NOTIFY_ADAPTER_TYPE,
            {
                {P::METHOD_unregisterCallBack, "unregisterCallBack", Kind::Call, decodeClientId},
                {P::METHOD_unregisterNotifyCallBack, "unregisterNotifyCallBack", Kind::Call, decodeClientId},
                {P::METHOD_registerCallBack, "registerCallBack", Kind::RegisterCallBack,
                 decodeRecord<_tagCallBackInfo>},
                {P::METHOD_registerNotifyCallBack, "registerNotifyCallBack", Kind::RegisterNotify,
                 decodeRecord<_tagNotifyInfo>},
            }};
}

ServiceDescription describeShowTitlerController()
{
    using P = ShowTitlerControllerRemoteProxy;
    return {"ShowTitlerController",
            P::INTERFACE_ID,
            P::CALLBACK_ADAPTER_TYPE,
            0,
            {
                {P::METHOD_setFolderStatus, "setFolderStatus", Kind::Call,
                 decodeRecord<SubCommonDefine::tagFOLDER_TYPE>},
                {P::METHOD_registerCallBack, "registerCallBack", Kind::RegisterCallBack,
                 decodeRecord<_tagCallBackInfo>},
            }};
}

ServiceDescription describeSoftKeyBoardController()
{
    using P = SoftKeyBoardControllerRemoteProxy;
    return {
        "SoftKeyBoardController",
        P::INTERFACE_ID,
        P::CALLBACK_ADAPTER_TYPE,
        0,
        {
            {P::METHOD_show, "show", Kind::Call, decodeRecord<SubCommonDefine::tagSoftKeyBoardInitData>},
            {P::METHOD_close, "close", Kind::Call, decodeNothing},
            {P::METHOD_dummyClose, "dummyClose", Kind::Call, decodeNothing},
            {P::METHOD_simpleClose, "simpleClose", Kind::Call, decodeNothing},
            {P::METHOD_sendKey, "sendKey", Kind::Call, decodeRecord<SubCommonDefine::tagSoftKeyBoardKeyData>},
            {P::METHOD_sendLimitInfo, "sendLimitInfo", Kind::Call,
             decodeRecord<SubCommonDefine::taLimitInfo>},
            {P::METHOD_closeLimitBalloon, "closeLimitBalloon", Kind::Call, decodeNothing},
            {P::METHOD_registerCallBack, "registerCallBack", Kind::RegisterCallBack,
             decodeRecord<_tagCallBackInfo>},
            {P::METHOD_showMask, "showMask", Kind::Call, decodeNothing},
            {P::METHOD_hideMask, "hideMask", Kind::Call, decodeNothing},
        }};
}

ServiceDescription describeSystemSetupManager()
{
    using P = SystemSetupManagerRemoteProxy;
    return {"SystemSetupManager",
            P::INTERFACE_ID,
            P::CALLBACK_ADAPTER_TYPE,
            P::NOTIFY_ADAPTER_TYPE,
            {
                {P::METHOD_getLanguageInfo, "getLanguageInfo", Kind::Call, decodeClientId},
                {P::METHOD_getInformation, "getInformation", Kind::Call, decodeClientId},
                {P::METHOD_unregisterCallBack, "unregisterCallBack", Kind::Call, decodeClientId},
                {P::METHOD_unregisterNotifyCallBack, "unregisterNotifyCallBack", Kind::Call, decodeClientId},
                {P::METHOD_registerCallBack, "registerCallBack", Kind::RegisterCallBack,
                 decodeRecord<_tagCallBackInfo>},
                {P::METHOD_registerNotifyCallBack, "registerNotifyCallBack", Kind::RegisterNotify,
                 decodeRecord<_tagNotifyInfo>},
            }};
}

} // namespace

std::vector<ServiceDescription> describeServices()
{
    return {describeAPPEventFilter(),         describeFileManagerController(), describeMessageCenter(),
            describePowerManager(),           describeProjectDataManager(),    describeShowTitlerController(),
            describeSoftKeyBoardController(), describeSystemSetupManager()};
}
