#include "tvxcim/Tvxcim.h"

#include <filesystem>
#include <mutex>
#include <stdexcept>
#include <system_error>

#include "core/Broker.h"
#include "tvxcim/Commands.h"

namespace tvxcim {

namespace {

void checkProviderDirectories(const CommandLine &line) {
    for (const std::string &dir : line.providerDirs) {
        std::error_code error;
        if (!std::filesystem::is_directory(dir, error)) {
            throw std::runtime_error("provider directory " + dir + " does not exist");
        }
    }
}

// Holds back what the broker reports on its own until the command is over,
// so that a report the final error line repeats is written only once.
class BrokerReports {
public:
    std::function<void(const std::string &)> sink() {
        return [this](const std::string &text) {
            const std::lock_guard<std::mutex> lock(mutex);
            reports.push_back(text);
        };
    }

    void write(std::ostream &err, const std::string &failure) {
        const std::lock_guard<std::mutex> lock(mutex);
        for (const std::string &text : reports) {
            if (failure.find(text) == std::string::npos) err << "tvxbroker: " << text << '\n';
        }
    }

private:
    std::mutex mutex;
    std::vector<std::string> reports;
};

void serve(const CommandLine &line, std::ostream &out, BrokerReports &reports) {
    tvxbroker::BrokerConfig config =
        tvxbroker::loadBrokerConfig(line.providerDirs, line.registrations, line.mofFiles);
    config.diagnostics = reports.sink();
    if (line.stockSfcb) config.threadRelease = tvxbroker::ThreadRelease::MarkRelease;
    tvxbroker::Broker broker(std::move(config));
    const std::unique_ptr<ResultWriter> writer = line.json ? makeJsonWriter(out) : makeMofWriter(out);
    runCommand(broker, line, *writer);
    // Providers may still write to standard error as they are cleaned up.
    writer->flush();
    broker.shutdown();
}

}  // namespace

std::vector<PreflightCheck> standardPreflightChecks() { return {checkProviderDirectories}; }

int runTvxcim(const std::vector<std::string> &args, std::ostream &out, std::ostream &err,
              const std::vector<PreflightCheck> &checks) {
    CommandLine line;
    try {
        line = parseCommandLine(args);
    } catch (const UsageError &error) {
        err << "tvxcim: " << error.what() << " (tvxcim --help shows the usage)\n";
        return 2;
    }
    if (line.help) {
        out << usageText;
        return 0;
    }
    BrokerReports reports;
    std::string failure;
    try {
        for (const PreflightCheck &check : checks) check(line);
        serve(line, out, reports);
    } catch (const std::exception &error) {
        failure = error.what();
    }
    reports.write(err, failure);
    if (failure.empty()) return 0;
    err << "tvxcim: " << failure << '\n';
    return 1;
}

}  // namespace tvxcim
