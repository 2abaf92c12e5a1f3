// Runs tvxcim in-process on the test provider library and keeps what it
// wrote, so that a test can check both streams and the exit status.
#pragma once

#include <sstream>
#include <string>
#include <vector>

#include "tvxcim/Tvxcim.h"

namespace tvxcimtest {

using Args = std::vector<std::string>;

struct Outcome {
    int status = -1;
    std::string out;
    std::string err;
};

inline Outcome runWith(const Args &args,
                       const std::vector<tvxcim::PreflightCheck> &checks = tvxcim::standardPreflightChecks()) {
    std::ostringstream out;
    std::ostringstream err;
    const int status = tvxcim::runTvxcim(args, out, err, checks);
    return {status, out.str(), err.str()};
}

// The options that load the test providers, followed by `rest`.
inline Args onTestProviders(const Args &rest) {
    Args args = {"--provider-dir", TVX_TESTPROVIDER_DIR, "--registration", TVX_TESTPROVIDER_REG,
                 "--mof", TVX_TESTPROVIDER_MOF};
    args.insert(args.end(), rest.begin(), rest.end());
    return args;
}

inline Outcome runOnTestProviders(const Args &rest) { return runWith(onTestProviders(rest)); }

inline std::vector<std::string> lines(const std::string &text) {
    std::vector<std::string> result;
    std::istringstream stream(text);
    for (std::string line; std::getline(stream, line);) result.push_back(line);
    return result;
}

inline const char *const kAlpha = R"(root/cimv2:Test_Widget.Name="alpha")";
inline const char *const kGadgetAlpha = R"(root/cimv2:Test_Gadget.Id="gadget-alpha")";

}  // namespace tvxcimtest
