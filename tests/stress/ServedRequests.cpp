#include "ServedRequests.h"

#include <set>

#include "model/PathText.h"

namespace stress {

using namespace tvxbroker;

namespace {

void addInstanceRequests(Broker &broker, const ObjectPath &classPath, std::vector<ServedRequest> &requests) {
    const std::string &cls = classPath.className;
    requests.push_back({"ein " + cls, [=](Broker &b) { return b.enumInstanceNames(classPath); }});
    requests.push_back({"ei " + cls, [=](Broker &b) { return b.enumInstances(classPath, std::nullopt); }});
    requests.push_back({"exec " + cls, [=](Broker &b) { return b.execQuery(classPath, "SELECT * FROM " + cls, "WQL"); }});
    const Response served = broker.enumInstances(classPath, std::nullopt);
    if (served.instances.empty()) return;
    const Instance instance = served.instances.front();
    const ObjectPath &path = instance.path;
    const std::string text = formatPath(path);
    requests.push_back({"gi " + text, [=](Broker &b) { return b.getInstance(path, std::nullopt); }, path});
    requests.push_back({"ci " + text, [=](Broker &b) { return b.createInstance(path, instance); }, path});
    requests.push_back({"mi " + text, [=](Broker &b) { return b.setInstance(path, instance, std::nullopt); }, path});
    requests.push_back({"di " + text, [=](Broker &b) { return b.deleteInstance(path); }, path});
}

void addAssociationRequests(Broker &broker, const ObjectPath &classPath, std::vector<ServedRequest> &requests) {
    const std::string &cls = classPath.className;
    const Response served = broker.enumInstances(classPath, std::nullopt);
    if (served.instances.empty()) return;
    for (const NamedValue &end : served.instances.front().properties) {
        if (end.value.type != CMPI_ref || end.value.null || !end.value.reference) continue;
        const ObjectPath from = *end.value.reference;
        const std::string text = formatPath(from);
        requests.push_back({"ai " + text, [=](Broker &b) { return b.associators(from, cls, "", "", "", std::nullopt); }});
        requests.push_back({"ain " + text, [=](Broker &b) { return b.associatorNames(from, cls, "", "", ""); }});
        requests.push_back({"ri " + text, [=](Broker &b) { return b.references(from, cls, "", std::nullopt); }});
        requests.push_back({"rin " + text, [=](Broker &b) { return b.referenceNames(from, cls, ""); }});
    }
}

void addIndicationRequests(const ObjectPath &classPath, std::vector<ServedRequest> &requests) {
    const std::string ns = classPath.nameSpace, cls = classPath.className, query = "SELECT * FROM " + cls;
    requests.push_back({"authorize " + cls, [=](Broker &b) { return b.authorizeFilter(ns, cls, query, "root"); }});
    requests.push_back({"mustPoll " + cls, [=](Broker &b) { return b.mustPoll(ns, cls, query); }});
}

}  // namespace

std::vector<ServedRequest> servedRequests(Broker &broker) {
    std::vector<ServedRequest> requests;
    std::set<std::string> seen;
    for (const ProviderRegistration &registration : broker.registrations()) {
        const ObjectPath classPath{"", registration.namespaces.front(), registration.className, {}};
        if (!seen.insert(toLowerAscii(registration.className)).second) continue;
        if (registration.instance) addInstanceRequests(broker, classPath, requests);
        if (registration.association) addAssociationRequests(broker, classPath, requests);
        if (registration.indication) addIndicationRequests(classPath, requests);
    }
    return requests;
}

}  // namespace stress
