// What the services of the appliance take: their methods by id, with the parameters as JSON.
#pragma once

#include "messaging/services/ServiceCall.h"

#include <QJsonObject>

#include <vector>

struct ServiceMethod {
    using Kind = ServiceCall::Kind;

    long id;
    const char* name;
    Kind kind;
    const char* parameter; // name of the parameter, "" without one
    // Returns the fields of the parameter, or a single value under its name; zero values for bad data.
    QJsonObject (*decode)(const char* parameter, void* data, long size);
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
