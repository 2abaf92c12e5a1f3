// The JSON form: one object per line, so that the output of every command,
// the demo included, can be read line by line or fed to jq as it is. A demo
// section is {"section": "ei" | "ain" | "first indication", ...}; a failed
// one carries "error": {"rc", "rcName", "message"} instead of its results.
#include "tvxcim/InstanceJson.h"
#include "tvxcim/ResultWriter.h"
#include "tvxcim/StatusText.h"

namespace tvxcim {

namespace {

using tvxbroker::Instance;
using tvxbroker::ObjectPath;
using tvxbroker::Response;

Json errorJson(const Response &response) {
    Json error = Json::object();
    error["rc"] = static_cast<int>(response.rc);
    error["rcName"] = rcName(response.rc);
    error["message"] = response.message ? Json(*response.message) : Json(nullptr);
    return error;
}

Json section(const char *name) {
    Json json = Json::object();
    json["section"] = name;
    return json;
}

class JsonWriter : public ResultWriter {
public:
    explicit JsonWriter(std::ostream &stream) : out(stream) {}

    void instance(const Instance &instance) override { write(instanceJson(instance)); }

    void path(const ObjectPath &path) override { write(pathJson(path)); }

    void flush() override { out.flush(); }

    void enumeration(const std::string &className, const Response &response) override {
        Json json = section("ei");
        json["className"] = className;
        if (response.ok()) {
            Json instances = Json::array();
            for (const Instance &each : response.instances) instances.push_back(instanceJson(each));
            json["instances"] = std::move(instances);
        } else {
            json["error"] = errorJson(response);
        }
        write(json);
    }

    void associatorNames(const ObjectPath &from, const std::vector<ObjectPath> &names) override {
        Json json = section("ain");
        json["path"] = pathJson(from);
        Json paths = Json::array();
        for (const ObjectPath &name : names) paths.push_back(pathJson(name));
        json["names"] = std::move(paths);
        write(json);
    }

    void firstIndication(const std::string &className, const Response &subscription,
                         const std::optional<Instance> &first, double seconds) override {
        Json json = section("first indication");
        json["className"] = className;
        if (!subscription.ok()) {
            json["error"] = errorJson(subscription);
        } else {
            json["indication"] = first ? instanceJson(*first) : Json(nullptr);
            json["seconds"] = seconds;
        }
        write(json);
    }

private:
    void write(const Json &json) { out << jsonLine(json) << '\n'; }

    std::ostream &out;
};

}  // namespace

std::unique_ptr<ResultWriter> makeJsonWriter(std::ostream &out) { return std::make_unique<JsonWriter>(out); }

}  // namespace tvxcim
