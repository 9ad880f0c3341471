#include "appliance/ServiceDescription.h"

#include "appliance/JsonRecords.h"
#include "messaging/services/IAPPEventFilter.h"
#include "messaging/services/IFileManagerController.h"
#include "messaging/services/IMessageCenter.h"
#include "messaging/services/IPowerManager.h"
#include "messaging/services/IProjectDataManager.h"
#include "messaging/services/IShowTitlerController.h"
#include "messaging/services/ISoftKeyBoardController.h"
#include "messaging/services/ISystemSetupManager.h"

namespace
{

QJsonObject decodeNothing(const char*, void*, long)
{
    return QJsonObject();
}

template <typename Parameter>
QJsonObject decode(const char* name, void* data, long size)
{
    Parameter parameter{};
    RecordPacking::deserialize(parameter, data, size);
    if constexpr (RecordPacking::HasFields<Parameter>)
        return JsonRecords::toJson(parameter);
    else
        return {{QLatin1String(name), JsonRecords::toValue(parameter)}};
}

template <typename Interface>
ServiceMethod describeMethod(long id, const char* name, void (Interface::*)(), const char* parameter)
{
    return {id, name, ServiceMethod::Kind::Call, parameter, decodeNothing};
}

template <typename Interface, typename Parameter>
ServiceMethod describeMethod(long id, const char* name, void (Interface::*)(Parameter), const char* parameter)
{
    using Packed = ServiceCall::Packed<Parameter>;
    return {id, name, Packed::KIND, parameter, decode<typename Packed::Type>};
}

template <typename Interface>
ServiceDescription describe()
{
    ServiceDescription service{Interface::NAME,
                               Interface::INTERFACE_ID,
                               Interface::CALLBACK_ADAPTER_TYPE,
                               Interface::NOTIFY_ADAPTER_TYPE,
                               {}};
    Interface::forEachMethod([&](long id, const char* name, auto method, const char* parameter) {
        service.methods.push_back(describeMethod(id, name, method, parameter));
    });
    return service;
}

} // namespace

std::vector<ServiceDescription> describeServices()
{
    return {describe<IAPPEventFilter>(),         describe<IFileManagerController>(),
            describe<IMessageCenter>(),          describe<IPowerManager>(),
            describe<IProjectDataManager>(),     describe<IShowTitlerController>(),
            describe<ISoftKeyBoardController>(), describe<ISystemSetupManager>()};
}
