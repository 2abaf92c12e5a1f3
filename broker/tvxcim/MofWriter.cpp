// The text form: instances in MOF instance syntax, each followed by a blank
// line; paths one per line; demo sections under "== " headings.
#include "model/MofInstanceText.h"
#include "model/PathText.h"
#include "tvxcim/ResultWriter.h"
#include "tvxcim/StatusText.h"

namespace tvxcim {

namespace {

using tvxbroker::Instance;
using tvxbroker::ObjectPath;
using tvxbroker::Response;

class MofWriter : public ResultWriter {
public:
    explicit MofWriter(std::ostream &stream) : out(stream) {}

    void instance(const Instance &instance) override {
        out << tvxbroker::formatInstanceMof(instance) << '\n';
    }

    void path(const ObjectPath &path) override { out << tvxbroker::formatPath(path) << '\n'; }

    void flush() override { out.flush(); }

    void enumeration(const std::string &className, const Response &response) override {
        out << "== ei " << className << "\n";
        if (!failure(response)) {
            for (const Instance &each : response.instances) instance(each);
        }
    }

    void associatorNames(const ObjectPath &from, const std::vector<ObjectPath> &names) override {
        out << "== ain " << tvxbroker::formatPath(from) << "\n";
        for (const ObjectPath &name : names) path(name);
        out << '\n';
    }

    void firstIndication(const std::string &className, const Response &subscription,
                         const std::optional<Instance> &first, double seconds) override {
        out << "== first indication of " << className << "\n";
        if (failure(subscription)) return;
        if (first) {
            instance(*first);
        } else {
            out << "   none within " << seconds << " seconds\n\n";
        }
    }

private:
    bool failure(const Response &response) {
        if (response.ok()) return false;
        out << "   " << describeFailure(response) << "\n\n";
        return true;
    }

    std::ostream &out;
};

}  // namespace

std::unique_ptr<ResultWriter> makeMofWriter(std::ostream &out) { return std::make_unique<MofWriter>(out); }

}  // namespace tvxcim
