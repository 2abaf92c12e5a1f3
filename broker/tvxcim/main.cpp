// tvxcim: a CIM client that runs the embedded broker in-process on
// provider registrations and answers one request. Without any of the
// library options it serves what a broker on the host would: the product
// library of this build and the stand-in host providers, on the host the
// stand-in platform libraries simulate.
#include <algorithm>
#include <cstdlib>
#include <iostream>
#include <stdexcept>

#include "hostsim/HostSimControl.h"
#include "tvxcim/Tvxcim.h"

namespace {

bool namesItsLibrary(const std::vector<std::string> &args) {
    return std::any_of(args.begin(), args.end(), [](const std::string &arg) {
        return arg == "--provider-dir" || arg == "--registration" || arg == "--mof";
    });
}

std::vector<std::string> withHostLibraries(std::vector<std::string> args) {
    std::vector<std::string> options = {
        "--provider-dir", TVX_PROVIDER_DIR, "--provider-dir", TVX_HOST_PROVIDER_DIR,
        "--registration", TVX_PROVIDER_REG, "--registration", TVX_HOST_PROVIDER_REG,
    };
    for (const char *mof : {TVX_PRODUCT_MOFS, TVX_HOST_PROVIDER_MOF}) {
        options.push_back("--mof");
        options.push_back(mof);
    }
    args.insert(args.begin(), options.begin(), options.end());
    return args;
}

// A profile that cannot be read would only show as failed requests later.
void checkHostProfile(const tvxcim::CommandLine &) {
    const char *profile = std::getenv("TVX_HOST_PROFILE");
    if (profile == nullptr || *profile == '\0') return;
    char error[1024];
    if (HostSim_CheckProfileFile(profile, error, sizeof error) != 0) {
        throw std::runtime_error(std::string("host profile ") + error);
    }
}

}  // namespace

int main(int argc, char **argv) {
    std::vector<std::string> args(argv + 1, argv + argc);
    if (!namesItsLibrary(args)) args = withHostLibraries(std::move(args));
    std::vector<tvxcim::PreflightCheck> checks = tvxcim::standardPreflightChecks();
    checks.push_back(checkHostProfile);
    return tvxcim::runTvxcim(args, std::cout, std::cerr, checks);
}
