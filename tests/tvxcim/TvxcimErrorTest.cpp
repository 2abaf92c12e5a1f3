// Bad input and failed requests end in exactly one line on stderr, nothing
// on stdout and the documented exit status: 2 for a usage error, 1 for
// everything else. That each provider that cannot be loaded fails is the
// consistency suite's, and each path parse error the model's own test; here
// one of each kind stands for all.
#include <gtest/gtest.h>

#include <stdexcept>
#include <tuple>

#include "TvxcimRun.h"

namespace {

using namespace tvxcimtest;

constexpr const char *kMissingFile = "/nonexistent/tvxcim-test-file";

const std::string kUsageHint = " (tvxcim --help shows the usage)";

TEST(TvxcimErrorTest, BadInputEndsInOneLineAndItsStatus) {
    const std::tuple<const char *, Args, int, std::string> cases[] = {
        {"ValueNotQuoted", onTestProviders({"gi", "root/cimv2:Test_Widget.Name=zz"}), 1,
         "malformed object path 'root/cimv2:Test_Widget.Name=zz': "
         "value of Name must be quoted at position 28"},
        {"MissingLibrary", onTestProviders({"ei", "Test_Missing"}), 1,
         "CMPI_RC_ERR_FAILED (1): provider MissingLib: provider library "
         "libtvxnosuchlibrary.so not found in the provider directories"},
        {"StatusWithMessageEvenInJson", onTestProviders({"--json", "gi", R"(root/cimv2:Test_Widget.Name="zz")"}), 1,
         "CMPI_RC_ERR_NOT_FOUND (6): no widget zz"},
        {"StatusWithoutMessage",
         onTestProviders({"gi", R"(root/cimv2:Test_WidgetGadget.Owner="root/cimv2:Test_Widget.Name=\"alpha\"",)"
                                R"(Part="root/cimv2:Test_Gadget.Id=\"gadget-alpha\"")"}),
         1, "CMPI_RC_ERR_NOT_SUPPORTED (7)"},
        {"UnknownOption", onTestProviders({"--jsn", "ei", "Test_Widget"}), 2, "unknown option --jsn" + kUsageHint},
    };
    for (const auto &[what, args, status, message] : cases) {
        const Outcome run = runWith(args);
        EXPECT_EQ(run.status, status) << what;
        EXPECT_EQ(run.out, "") << what;
        EXPECT_EQ(run.err, "tvxcim: " + message + "\n") << what;
    }
}

TEST(TvxcimPreflightTest, RunsBeforeAnythingIsLoadedAndSeesTheCommandLine) {
    std::string seenCommand;
    const tvxcim::PreflightCheck hostReady = [&](const tvxcim::CommandLine &line) {
        seenCommand = line.command;
        throw std::runtime_error("host not ready");
    };
    const Outcome run = runWith({"--provider-dir", TVX_TESTPROVIDER_DIR, "--registration", kMissingFile, "--mof",
                                 kMissingFile, "ein", "Test_Widget"},
                                {hostReady});
    EXPECT_EQ(run.status, 1);
    EXPECT_EQ(run.err, "tvxcim: host not ready\n");
    EXPECT_EQ(seenCommand, "ein");
}

}  // namespace
