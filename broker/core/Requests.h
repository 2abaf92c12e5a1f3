// Request routing: which registered providers answer a request, and the
// CMPI call to each. Client requests and provider up-calls both come here.
#pragma once

#include "core/BrokerState.h"

namespace tvxbroker::requests {

Response enumInstanceNames(Broker::State &state, const ObjectPath &classPath);
Response enumInstances(Broker::State &state, const ObjectPath &classPath,
                       const PropertyList &properties);
Response getInstance(Broker::State &state, const ObjectPath &path, const PropertyList &properties);
Response createInstance(Broker::State &state, const ObjectPath &path, const Instance &instance);
Response setInstance(Broker::State &state, const ObjectPath &path, const Instance &instance,
                     const PropertyList &properties);
Response deleteInstance(Broker::State &state, const ObjectPath &path);
Response execQuery(Broker::State &state, const ObjectPath &classPath, const std::string &query,
                   const std::string &language);

struct AssociationFilter {
    std::string assocClass;
    std::string resultClass;
    std::string role;
    std::string resultRole;
};

enum class AssociationCall { Associators, AssociatorNames, References, ReferenceNames };

Response association(Broker::State &state, AssociationCall call, const ObjectPath &path,
                     const AssociationFilter &filter, const PropertyList &properties);

enum class IndicationCall { Authorize, MustPoll, Activate, Deactivate, Enable, Disable };

struct IndicationRequest {
    std::string nameSpace;
    std::string indicationClass;
    std::string query;
    std::string owner;
    bool flag = false;  // first or last activation
};

Response indication(Broker::State &state, IndicationCall call, const IndicationRequest &request);

}  // namespace tvxbroker::requests
