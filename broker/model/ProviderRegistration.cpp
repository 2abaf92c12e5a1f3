#include "model/ProviderRegistration.h"

#include <sstream>
#include <utility>

#include "model/CimValue.h"
#include "model/TextSource.h"

namespace tvxbroker {

namespace {

std::string trim(const std::string &s) {
    const char *space = " \t\r\f\v";
    const std::size_t first = s.find_first_not_of(space);
    if (first == std::string::npos) return {};
    return s.substr(first, s.find_last_not_of(space) - first + 1);
}

std::vector<std::string> words(const std::string &s) {
    std::istringstream in(s);
    std::vector<std::string> result;
    for (std::string word; in >> word;) result.push_back(word);
    return result;
}

const char *missingField(const ProviderRegistration &r) {
    if (r.providerName.empty()) return "provider";
    if (r.location.empty()) return "location";
    if (!r.instance && !r.association && !r.indication && !r.method) return "type";
    if (r.namespaces.empty()) return "namespace";
    return nullptr;
}

class RegistrationReader {
public:
    explicit RegistrationReader(const std::string &origin) : origin_(origin) {}

    void readLine(const std::string &rawLine) {
        ++line_;
        const std::string text = trim(rawLine);
        if (text.empty() || text[0] == '#') return;
        if (text[0] == '[') {
            startBlock(text);
        } else {
            readKeyLine(text);
        }
    }

    std::vector<ProviderRegistration> finish() {
        finishBlock();
        return std::move(done_);
    }

private:
    void startBlock(const std::string &text) {
        finishBlock();
        const std::string name = trim(text.substr(1, text.size() - 1 - (text.back() == ']' ? 1 : 0)));
        if (text.back() != ']' || !isCimName(name)) fail(line_, "expected '[ClassName]'");
        for (const ProviderRegistration &earlier : done_) {
            if (equalsIgnoreCase(earlier.className, name)) fail(line_, "class " + name + " is registered twice");
        }
        current_ = ProviderRegistration{};
        current_.className = name;
        blockLine_ = line_;
    }

    void readKeyLine(const std::string &text) {
        const std::size_t colon = text.find(':');
        if (colon == std::string::npos) fail(line_, "expected 'key: value'");
        if (blockLine_ == 0) fail(line_, "'key: value' line before any [ClassName] block");
        const std::string key = trim(text.substr(0, colon));
        const std::string value = trim(text.substr(colon + 1));
        if (equalsIgnoreCase(key, "provider")) {
            current_.providerName = value;
        } else if (equalsIgnoreCase(key, "location")) {
            current_.location = value;
        } else if (equalsIgnoreCase(key, "type")) {
            for (const std::string &word : words(value)) setType(word);
        } else if (equalsIgnoreCase(key, "namespace")) {
            for (const std::string &word : words(value)) current_.namespaces.push_back(word);
        } else if (equalsIgnoreCase(key, "group")) {
            setGroup(value);
        } else if (equalsIgnoreCase(key, "unload")) {
            setUnload(value);
        } else {
            fail(line_, "unknown key '" + key + "'");
        }
    }

    // sfcb would take the first of several words and silently drop the rest.
    void setGroup(const std::string &value) {
        if (words(value).size() != 1) fail(line_, "group takes one name, not '" + value + "'");
        current_.group = value;
    }

    // sfcb knows no other value and compares it case-sensitively; how long an
    // idle provider stays is sfcb.cfg's providerTimeoutInterval.
    void setUnload(const std::string &value) {
        if (value != "never") fail(line_, "unload takes only 'never', not '" + value + "'");
        current_.unloadNever = true;
    }

    void setType(const std::string &word) {
        if (equalsIgnoreCase(word, "instance")) {
            current_.instance = true;
        } else if (equalsIgnoreCase(word, "association")) {
            current_.association = true;
        } else if (equalsIgnoreCase(word, "indication")) {
            current_.indication = true;
        } else if (equalsIgnoreCase(word, "method")) {
            current_.method = true;
        } else {
            fail(line_, "unknown provider type '" + word + "'");
        }
    }

    void finishBlock() {
        if (blockLine_ == 0) return;
        if (const char *field = missingField(current_)) {
            fail(blockLine_, "block [" + current_.className + "] has no " + field);
        }
        done_.push_back(std::move(current_));
        blockLine_ = 0;
    }

    [[noreturn]] void fail(int line, const std::string &message) const { throwAt(origin_, line, message); }

    const std::string &origin_;
    int line_ = 0;
    int blockLine_ = 0;  // 0 outside a block
    ProviderRegistration current_;
    std::vector<ProviderRegistration> done_;
};

}  // namespace

std::vector<ProviderRegistration> parseRegistration(const std::string &text, const std::string &origin) {
    RegistrationReader reader(origin);
    std::istringstream in(text);
    for (std::string line; std::getline(in, line);) reader.readLine(line);
    return reader.finish();
}

std::vector<ProviderRegistration> readRegistrationFile(const std::string &path) {
    return parseRegistration(readTextFile(path), path);
}

}  // namespace tvxbroker
