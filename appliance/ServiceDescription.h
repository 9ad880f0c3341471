#pragma once

#include "messaging/services/ServiceCall.h"

#include <QJsonObject>

#include <vector>

struct ServiceMethod {
    using Kind = ServiceCall::Kind;

    long id;
    const char* name;
    Kind kind;
    const char* parameter; // name of the parameter; "" if there is none
    // Returns the fields of the parameter, or a single value under its name. Invalid data gives zero values.
    QJsonObject (*decode)(const char* parameter, void* data, long size);
};

// Describes the services of the appliance: their methods by id, with the parameters as JSON.
struct ServiceDescription {
    const char* name;
    long interfaceId;
    long callBackAdapterType;
    long notifyAdapterType; // 0 if there is none
    std::vector<ServiceMethod> methods;
};

// Returns the eight services that a titler calls.
std::vector<ServiceDescription> describeServices();
