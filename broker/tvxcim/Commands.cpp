#include "tvxcim/Commands.h"

#include <chrono>
#include <condition_variable>
#include <mutex>
#include <set>

#include "model/MofInstanceText.h"
#include "model/PathText.h"

namespace tvxcim {

using tvxbroker::Broker;
using tvxbroker::Instance;
using tvxbroker::ObjectPath;
using tvxbroker::Response;

namespace {

const char *const defaultNameSpace = "root/cimv2";

const char *rcName(CMPIrc rc) {
    switch (rc) {
    case CMPI_RC_OK: return "CMPI_RC_OK";
    case CMPI_RC_ERR_FAILED: return "CMPI_RC_ERR_FAILED";
    case CMPI_RC_ERR_ACCESS_DENIED: return "CMPI_RC_ERR_ACCESS_DENIED";
    case CMPI_RC_ERR_INVALID_NAMESPACE: return "CMPI_RC_ERR_INVALID_NAMESPACE";
    case CMPI_RC_ERR_INVALID_PARAMETER: return "CMPI_RC_ERR_INVALID_PARAMETER";
    case CMPI_RC_ERR_INVALID_CLASS: return "CMPI_RC_ERR_INVALID_CLASS";
    case CMPI_RC_ERR_NOT_FOUND: return "CMPI_RC_ERR_NOT_FOUND";
    case CMPI_RC_ERR_NOT_SUPPORTED: return "CMPI_RC_ERR_NOT_SUPPORTED";
    case CMPI_RC_ERR_ALREADY_EXISTS: return "CMPI_RC_ERR_ALREADY_EXISTS";
    case CMPI_RC_ERR_NO_SUCH_PROPERTY: return "CMPI_RC_ERR_NO_SUCH_PROPERTY";
    case CMPI_RC_ERR_TYPE_MISMATCH: return "CMPI_RC_ERR_TYPE_MISMATCH";
    case CMPI_RC_ERR_INVALID_HANDLE: return "CMPI_RC_ERR_INVALID_HANDLE";
    default: return "CMPI status";
    }
}

ObjectPath classPath(const std::string &text) {
    const std::size_t colon = text.find(':');
    ObjectPath path;
    path.nameSpace = colon == std::string::npos ? defaultNameSpace : text.substr(0, colon);
    path.className = colon == std::string::npos ? text : text.substr(colon + 1);
    if (path.className.empty() || path.nameSpace.empty()) {
        throw RequestFailed("malformed class name '" + text + "'");
    }
    return path;
}

ObjectPath objectPath(const Broker &broker, const std::string &text) {
    try {
        return tvxbroker::parsePath(text, broker.schema());
    } catch (const std::exception &error) {
        throw RequestFailed("malformed object path '" + text + "': " + error.what());
    }
}

const Response &checked(const Response &response) {
    if (!response.ok()) throw RequestFailed(describeFailure(response));
    return response;
}

void printInstances(const Response &response, std::ostream &out) {
    for (const Instance &instance : checked(response).instances) {
        out << tvxbroker::formatInstanceMof(instance) << '\n';
    }
}

void printPaths(const Response &response, std::ostream &out) {
    for (const ObjectPath &path : checked(response).paths) out << tvxbroker::formatPath(path) << '\n';
}

// Waits for the first indication of each indication class, with the
// subscription made the way sfcb makes it.
void showFirstIndication(Broker &broker, const std::string &indicationClass, double seconds,
                         std::ostream &out) {
    std::mutex mutex;
    std::condition_variable arrived;
    std::optional<Instance> first;
    const int subscription = broker.subscribe([&](const std::string &, const Instance &ind) {
        std::lock_guard<std::mutex> lock(mutex);
        if (!first && tvxbroker::equalsIgnoreCase(ind.path.className, indicationClass)) {
            first = ind;
            arrived.notify_all();
        }
        return true;
    });
    const std::string query = "SELECT * FROM " + indicationClass;
    Response response = broker.activateFilter(defaultNameSpace, indicationClass, query, true);
    if (response.ok()) response = broker.enableIndications(defaultNameSpace, indicationClass);
    if (response.ok()) {
        std::unique_lock<std::mutex> lock(mutex);
        arrived.wait_for(lock, std::chrono::duration<double>(seconds), [&] { return first.has_value(); });
    }
    broker.unsubscribe(subscription);
    out << "== first indication of " << indicationClass << "\n";
    if (!response.ok()) {
        out << "   " << describeFailure(response) << "\n\n";
    } else if (first) {
        out << tvxbroker::formatInstanceMof(*first) << '\n';
    } else {
        out << "   none within " << seconds << " seconds\n\n";
    }
    broker.disableIndications(defaultNameSpace, indicationClass);
    broker.deActivateFilter(defaultNameSpace, indicationClass, query, true);
}

void demo(Broker &broker, const CommandLine &line, std::ostream &out) {
    std::set<std::string> shown;
    std::vector<ObjectPath> firstOfEachClass;
    for (const tvxbroker::ProviderRegistration &registration : broker.registrations()) {
        if (!registration.instance || !shown.insert(registration.className).second) continue;
        out << "== ei " << registration.className << "\n";
        const Response response = broker.enumInstances(classPath(registration.className), line.properties);
        if (!response.ok()) {
            out << "   " << describeFailure(response) << "\n\n";
            continue;
        }
        printInstances(response, out);
        if (!response.instances.empty() && !broker.schema().isAssociation(registration.className)) {
            firstOfEachClass.push_back(response.instances.front().path);
        }
    }
    for (const ObjectPath &path : firstOfEachClass) {
        const Response response = broker.associatorNames(path, "", "", "", "");
        if (!response.ok() || response.paths.empty()) continue;
        out << "== ain " << tvxbroker::formatPath(path) << "\n";
        printPaths(response, out);
        out << '\n';
    }
    shown.clear();
    for (const tvxbroker::ProviderRegistration &registration : broker.registrations()) {
        if (registration.indication && shown.insert(registration.className).second) {
            showFirstIndication(broker, registration.className, line.seconds, out);
        }
    }
}

}  // namespace

std::string describeFailure(const Response &response) {
    std::string text = std::string(rcName(response.rc)) + " (" +
                       std::to_string(static_cast<int>(response.rc)) + ")";
    if (response.message) text += ": " + *response.message;
    return text;
}

void runCommand(Broker &broker, const CommandLine &line, std::ostream &out) {
    const std::string &command = line.command;
    if (command == "demo") {
        demo(broker, line, out);
    } else if (command == "ei") {
        printInstances(broker.enumInstances(classPath(line.argument), line.properties), out);
    } else if (command == "ein") {
        printPaths(broker.enumInstanceNames(classPath(line.argument)), out);
    } else if (command == "gi") {
        printInstances(broker.getInstance(objectPath(broker, line.argument), line.properties), out);
    } else if (command == "ai") {
        printInstances(broker.associators(objectPath(broker, line.argument), line.assocClass,
                                          line.resultClass, line.role, line.resultRole,
                                          line.properties),
                       out);
    } else if (command == "ain") {
        printPaths(broker.associatorNames(objectPath(broker, line.argument), line.assocClass,
                                          line.resultClass, line.role, line.resultRole),
                   out);
    } else if (command == "ri") {
        printInstances(broker.references(objectPath(broker, line.argument), line.resultClass,
                                         line.role, line.properties),
                       out);
    } else if (command == "rin") {
        printPaths(broker.referenceNames(objectPath(broker, line.argument), line.resultClass,
                                         line.role),
                   out);
    }
}

}  // namespace tvxcim
