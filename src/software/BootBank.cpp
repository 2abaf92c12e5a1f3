#include "software/BootBank.h"

#include <cctype>
#include <cstdio>
#include <cstdlib>
#include <cstring>
#include <limits>
#include <optional>
#include <vector>

#include "frame/BoundedText.h"

namespace Software {
namespace {

constexpr const char buildPrefix[] = "build=";
constexpr std::size_t buildPrefixLength = sizeof buildPrefix - 1;

struct FileCloser {
    void operator()(std::FILE *file) const { std::fclose(file); }
};

// The value of the first line that starts with "build=", up to a NUL byte
// if the line holds one.
std::optional<std::string> firstBuildValue(std::FILE *file) {
    char *line = nullptr;
    std::size_t capacity = 0;
    std::optional<std::string> value;
    ssize_t length;
    while ((length = ::getline(&line, &capacity, file)) >= 0) {
        const std::string text(line, static_cast<std::size_t>(length));
        if (text.compare(0, buildPrefixLength, buildPrefix) == 0) {
            value = text.substr(buildPrefixLength);
            value->resize(std::strlen(value->c_str()));
            break;
        }
    }
    std::free(line);
    return value;
}

void removeTrailingSpace(std::string &text) {
    while (!text.empty() && std::isspace(static_cast<unsigned char>(text.back()))) text.pop_back();
}

// A plain decimal up to the largest signed 32-bit number, as the platform's
// 32-bit reading gives it back unchanged.
std::optional<std::int32_t> plainNumber(const std::string &text) {
    constexpr std::int64_t largest = std::numeric_limits<std::int32_t>::max();
    if (text.empty() || (text.size() > 1 && text[0] == '0')) return std::nullopt;
    std::int64_t value = 0;
    for (const char c : text) {
        if (c < '0' || c > '9') return std::nullopt;
        value = value * 10 + (c - '0');
        if (value > largest) return std::nullopt;
    }
    return static_cast<std::int32_t>(value);
}

}  // namespace

std::int32_t buildNumberOf(const std::string &buildText) {
    std::vector<std::string> parts(1);
    for (const char c : buildText) {
        if (c == '.') {
            parts.emplace_back();
        } else {
            parts.back() += c;
        }
    }
    if (parts.size() != 1 && parts.size() != 3) return -1;
    std::int32_t number = -1;
    for (const std::string &part : parts) {
        const std::optional<std::int32_t> value = plainNumber(part);
        if (!value) return -1;
        number = *value;
    }
    return number;
}

std::string bootBankFileInUse() {
    const char *chosen = std::getenv(bootBankFileVariable);
    return chosen != nullptr && *chosen != '\0' ? chosen : bootBankFile;
}

std::unique_ptr<SystemVersionInfo> readBootBank(const char *path) {
    const std::unique_ptr<std::FILE, FileCloser> file(std::fopen(path, "r"));
    if (!file) return nullptr;
    return readBootBank(file.get());
}

std::unique_ptr<SystemVersionInfo> readBootBank(std::FILE *file) {
    auto record = std::make_unique<SystemVersionInfo>();
    std::optional<std::string> value = firstBuildValue(file);
    if (!value) return record;
    removeTrailingSpace(*value);
    const std::size_t hyphen = value->find('-');
    if (hyphen == std::string::npos) return record;
    frame::copyBounded(record->versionText, value->c_str(), hyphen);
    frame::copyBounded(record->productName, corlaiProductName);
    record->buildNumber = buildNumberOf(value->substr(hyphen + 1));
    return record;
}

}  // namespace Software
