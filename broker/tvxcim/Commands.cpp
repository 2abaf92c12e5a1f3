#include "tvxcim/Commands.h"

#include <stdexcept>

#include "model/PathText.h"
#include "tvxcim/Demo.h"
#include "tvxcim/Listen.h"
#include "tvxcim/StatusText.h"

namespace tvxcim {

using tvxbroker::Broker;
using tvxbroker::ClassSchema;
using tvxbroker::Instance;
using tvxbroker::ObjectPath;
using tvxbroker::Response;

namespace {

std::runtime_error unknownClass(const std::string &className, const std::string &where) {
    return std::runtime_error("unknown class " + className + where + ": no MOF file declares it");
}

// CLASS or namespace:CLASS, in the spelling the MOF declares.
ObjectPath classPath(const ClassSchema &schema, const std::string &text) {
    const std::size_t colon = text.find(':');
    ObjectPath path;
    path.nameSpace = colon == std::string::npos ? defaultNameSpace : text.substr(0, colon);
    const std::string className = colon == std::string::npos ? text : text.substr(colon + 1);
    if (className.empty() || path.nameSpace.empty()) {
        throw std::runtime_error("malformed class name '" + text + "': use CLASS or namespace:CLASS");
    }
    const tvxbroker::ClassDecl *decl = schema.find(className);
    if (decl == nullptr) throw unknownClass(className, "");
    path.className = decl->name;
    return path;
}

ObjectPath objectPath(const ClassSchema &schema, const std::string &text) {
    try {
        return tvxbroker::parsePath(text, schema);
    } catch (const tvxbroker::UnknownClassError &error) {
        throw unknownClass(error.className(), " in object path '" + text + "'");
    } catch (const tvxbroker::PathParseError &error) {
        throw std::runtime_error("malformed object path '" + text + "': " + error.what());
    }
}

// The class filters of the association commands, checked as the path is.
void checkFilterClass(const ClassSchema &schema, const std::string &className, const char *option) {
    if (!className.empty() && schema.find(className) == nullptr) {
        throw unknownClass(className, std::string(" given to ") + option);
    }
}

const Response &checked(const Response &response) {
    if (!response.ok()) throw std::runtime_error(describeFailure(response));
    return response;
}

void writeInstances(const Response &response, ResultWriter &writer) {
    for (const Instance &instance : checked(response).instances) writer.instance(instance);
}

void writePaths(const Response &response, ResultWriter &writer) {
    for (const ObjectPath &path : checked(response).paths) writer.path(path);
}

void runOnClass(Broker &broker, const CommandLine &line, ResultWriter &writer) {
    const ObjectPath target = classPath(broker.schema(), line.argument);
    if (line.command == "ei") {
        writeInstances(broker.enumInstances(target, line.properties), writer);
    } else {
        writePaths(broker.enumInstanceNames(target), writer);
    }
}

void runOnPath(Broker &broker, const CommandLine &line, ResultWriter &writer) {
    const ObjectPath target = objectPath(broker.schema(), line.argument);
    checkFilterClass(broker.schema(), line.assocClass, "--assoc-class");
    checkFilterClass(broker.schema(), line.resultClass, "--result-class");
    const std::string &command = line.command;
    if (command == "gi") {
        writeInstances(broker.getInstance(target, line.properties), writer);
    } else if (command == "ai") {
        writeInstances(broker.associators(target, line.assocClass, line.resultClass, line.role,
                                          line.resultRole, line.properties),
                       writer);
    } else if (command == "ain") {
        writePaths(broker.associatorNames(target, line.assocClass, line.resultClass, line.role,
                                          line.resultRole),
                   writer);
    } else if (command == "ri") {
        writeInstances(broker.references(target, line.resultClass, line.role, line.properties), writer);
    } else if (command == "rin") {
        writePaths(broker.referenceNames(target, line.resultClass, line.role), writer);
    }
}

}  // namespace

void runCommand(Broker &broker, const CommandLine &line, ResultWriter &writer) {
    if (line.command == "demo") {
        runDemo(broker, line, writer);
    } else if (line.command == "listen") {
        runListen(broker, line, writer);
    } else if (line.command == "ei" || line.command == "ein") {
        runOnClass(broker, line, writer);
    } else {
        runOnPath(broker, line, writer);
    }
}

}  // namespace tvxcim
