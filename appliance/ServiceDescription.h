// What the services of the appliance take: their methods by id, with the parameters as JSON.
#pragma once

#include <QJsonObject>

#include <vector>

struct ServiceMethod {
    enum class Kind { Call, RegisterCallBack, RegisterNotify };

    long id;
    const char* name;
    Kind kind;
    QJsonObject (*decode)(void* data, long size); // bad data gives zero values
};

struct ServiceDescription {
    const char* name;
    long interfaceId;
    long callBackAdapterType;
    long notifyAdapterType; // 0 for none
    std::vector<ServiceMethod> methods;
};

// The eight services that a titler calls.
std::vector<ServiceDescription> describeServices();
