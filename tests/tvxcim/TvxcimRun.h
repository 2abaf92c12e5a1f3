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
    Outcome run;
    run.status = tvxcim::runTvxcim(args, out, err, checks);
    run.out = out.str();
    run.err = err.str();
    return run;
}

// The options that load providers from `dir` as `registration` and `mof`
// describe them, followed by `rest`.
inline Args withFiles(const std::string &dir, const std::string &registration, const std::string &mof,
                      const Args &rest) {
    Args args = {"--provider-dir", dir, "--registration", registration, "--mof", mof};
    args.insert(args.end(), rest.begin(), rest.end());
    return args;
}

inline Args onTestProviders(const Args &rest) {
    return withFiles(TVX_TESTPROVIDER_DIR, TVX_TESTPROVIDER_REG, TVX_TESTPROVIDER_MOF, rest);
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
