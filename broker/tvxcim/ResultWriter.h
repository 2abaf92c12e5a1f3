// Where tvxcim puts what requests answered: MOF instance syntax and path
// text, or one JSON object per line. The demo's sections go through here
// too, so that its output stays in one format.
#pragma once

#include <memory>
#include <optional>
#include <ostream>
#include <string>
#include <vector>

#include "core/Broker.h"

namespace tvxcim {

class ResultWriter {
public:
    virtual ~ResultWriter() = default;

    virtual void instance(const tvxbroker::Instance &instance) = 0;
    virtual void path(const tvxbroker::ObjectPath &path) = 0;
    // Hands what has been written on, for output read as it comes.
    virtual void flush() = 0;

    // The demo's sections. `response` may have failed.
    virtual void enumeration(const std::string &className, const tvxbroker::Response &response) = 0;
    virtual void associatorNames(const tvxbroker::ObjectPath &from,
                                 const std::vector<tvxbroker::ObjectPath> &names) = 0;
    // `subscription` is the answer to setting up the subscription; `first`
    // is empty when nothing arrived within `seconds`.
    virtual void firstIndication(const std::string &className, const tvxbroker::Response &subscription,
                                 const std::optional<tvxbroker::Instance> &first, double seconds) = 0;
};

std::unique_ptr<ResultWriter> makeMofWriter(std::ostream &out);
std::unique_ptr<ResultWriter> makeJsonWriter(std::ostream &out);

}  // namespace tvxcim
