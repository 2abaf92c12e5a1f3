// tvxcim: a CIM client that runs the embedded broker in-process on a
// provider registration and answers one request.
#include <iostream>

#include "tvxcim/Commands.h"

int main(int argc, char **argv) {
    using namespace tvxcim;
    try {
        const CommandLine line = parseCommandLine(std::vector<std::string>(argv + 1, argv + argc));
        tvxbroker::Broker broker(
            tvxbroker::loadBrokerConfig(line.providerDirs, line.registration, line.mofFiles));
        runCommand(broker, line, std::cout);
        broker.shutdown();
        return 0;
    } catch (const UsageError &error) {
        std::cerr << "tvxcim: " << error.what() << "\n" << usageText;
        return 2;
    } catch (const std::exception &error) {
        std::cerr << "tvxcim: " << error.what() << "\n";
        return 1;
    }
}
