#include "tvxcim/CommandLine.h"

#include <cstdlib>
#include <set>
#include <sstream>

namespace tvxcim {

const char *const usageText =
    "usage: tvxcim [options] <command> [argument] [options]\n"
    "commands:\n"
    "  ei CLASS     instances of a class (CLASS or namespace:CLASS)\n"
    "  ein CLASS    instance names of a class\n"
    "  gi PATH      one instance, PATH as root/cimv2:Class.Key=\"value\",...\n"
    "  ai PATH      associated instances      ain PATH   associated names\n"
    "  ri PATH      association instances     rin PATH   association names\n"
    "  demo         every served class and association, then the first indications\n"
    "  listen       every indication as it arrives, until --seconds or Ctrl-C\n"
    "options:\n"
    "  --provider-dir DIR    where provider libraries are found (repeatable)\n"
    "  --registration FILE   sfcb provider registration (repeatable)\n"
    "  --mof FILE            class declarations (repeatable)\n"
    "  --properties A,B      property list (ei, gi, ai, ri); empty text: none\n"
    "  --assoc-class C  --result-class C  --role R  --result-role R\n"
    "  --seconds N           demo: wait at most N seconds for each first indication\n"
    "                        (10 by default); listen: stop after N seconds\n"
    "  --json                JSON instead of MOF, one object per line (see below)\n"
    "  --stock-sfcb          behave as stock sfcb 1.3, not the host's broker: provider\n"
    "                        threads give objects back by memory mark and release,\n"
    "                        and contexts have only the seven published entries\n"
    "  --help                this text\n"
    "  Without --provider-dir, --registration and --mof: this build's product\n"
    "  (libtvxprovider.so) and stand-in host providers (libtvxhostproviders.so),\n"
    "  each with its MOF and registration, on the simulated host.\n"
    "JSON: an instance is {\"className\", \"path\", \"properties\"}, a path\n"
    "  {\"text\", \"namespace\", \"className\", \"keys\"}, where \"text\" is the PATH\n"
    "  form above; properties and keys map each name to {\"type\", \"value\"}, the\n"
    "  type being the MOF type name, \"reference\" or \"instance\", with \"[]\" for an\n"
    "  array. NULL is null, an array a JSON array, a reference a path. uint64 and\n"
    "  sint64 values are decimal strings, so that no JSON reader rounds them; other\n"
    "  integers and reals are numbers (NaN and infinities as \"NaN\", \"Infinity\",\n"
    "  \"-Infinity\"). Each demo section is one object with a \"section\" member.\n"
    "exit status: 0 done, 1 bad input or a failed request, 2 a usage error\n";

namespace {

std::vector<std::string> splitList(const std::string &text) {
    std::vector<std::string> items;
    std::stringstream stream(text);
    std::string item;
    while (std::getline(stream, item, ',')) {
        if (!item.empty()) items.push_back(item);
    }
    return items;
}

double parseSeconds(const std::string &text) {
    char *end = nullptr;
    const double value = std::strtod(text.c_str(), &end);
    if (text.empty() || *end != '\0' || !(value >= 0) || value > 86400) {
        throw UsageError("--seconds takes a number of seconds from 0 to 86400, not '" + text + "'");
    }
    return value;
}

CommandLine helpOnly() {
    CommandLine line;
    line.help = true;
    return line;
}

}  // namespace

CommandLine parseCommandLine(const std::vector<std::string> &args) {
    static const std::set<std::string> commands = {"ei", "ein", "gi",   "ai",    "ain",
                                                   "ri", "rin", "demo", "listen"};
    CommandLine line;
    std::vector<std::string> words;  // the command and its argument; options may come between
    std::size_t i = 0;
    auto value = [&](const std::string &option) -> std::string {
        if (i + 1 >= args.size()) throw UsageError(option + " needs a value");
        return args[++i];
    };
    for (; i < args.size(); ++i) {
        const std::string &option = args[i];
        if (option.rfind("--", 0) != 0) words.push_back(option);
        else if (option == "--provider-dir") line.providerDirs.push_back(value(option));
        else if (option == "--registration") line.registrations.push_back(value(option));
        else if (option == "--mof") line.mofFiles.push_back(value(option));
        else if (option == "--properties") line.properties = splitList(value(option));
        else if (option == "--assoc-class") line.assocClass = value(option);
        else if (option == "--result-class") line.resultClass = value(option);
        else if (option == "--role") line.role = value(option);
        else if (option == "--result-role") line.resultRole = value(option);
        else if (option == "--seconds") line.seconds = parseSeconds(value(option));
        else if (option == "--json") line.json = true;
        else if (option == "--stock-sfcb") line.stockSfcb = true;
        else if (option == "--help") return helpOnly();
        else throw UsageError("unknown option " + option);
    }
    if (words.empty()) throw UsageError("no command given");
    line.command = words.front();
    if (commands.count(line.command) == 0) throw UsageError("unknown command " + line.command);
    const std::size_t wordsTaken = line.command == "demo" || line.command == "listen" ? 1 : 2;
    if (wordsTaken == 2) {
        if (words.size() < 2) throw UsageError(line.command + " needs an argument");
        line.argument = words[1];
    }
    if (words.size() > wordsTaken) throw UsageError("unexpected argument " + words[wordsTaken]);
    if (line.registrations.empty()) throw UsageError("no provider registration: use --registration");
    if (line.mofFiles.empty()) throw UsageError("no class declarations: use --mof");
    if (line.providerDirs.empty()) throw UsageError("no provider directory: use --provider-dir");
    return line;
}

}  // namespace tvxcim
