#include "profile/JsonText.h"

#include <algorithm>

#include "profile/ProfileError.h"

namespace hostsim {

namespace {

// Accepts everything up to the first error and keeps where it was found:
// the library's number-overflow exception carries no place of its own.
class ErrorFinder : public nlohmann::json_sax<nlohmann::json> {
public:
    std::size_t offset = 0;

    bool null() override { return true; }
    bool boolean(bool) override { return true; }
    bool number_integer(number_integer_t) override { return true; }
    bool number_unsigned(number_unsigned_t) override { return true; }
    bool number_float(number_float_t, const string_t &) override { return true; }
    bool string(string_t &) override { return true; }
    bool binary(binary_t &) override { return true; }
    bool start_object(std::size_t) override { return true; }
    bool key(string_t &) override { return true; }
    bool end_object() override { return true; }
    bool start_array(std::size_t) override { return true; }
    bool end_array() override { return true; }
    bool parse_error(std::size_t at, const std::string &, const nlohmann::json::exception &) override {
        offset = at;
        return false;
    }
};

// "line L, column C" of a byte offset, counted as the library counts them
// for its syntax errors.
std::string placeOf(const std::string &text, std::size_t offset) {
    const auto end = text.begin() + static_cast<std::ptrdiff_t>(std::min(offset, text.size()));
    const auto lineStart = std::find(std::make_reverse_iterator(end), text.rend(), '\n').base();
    return "line " + std::to_string(std::count(text.begin(), end, '\n') + 1) + ", column " +
           std::to_string(end - lineStart);
}

// The library's message without its "[json.exception.<kind>.<id>] " prefix.
std::string reasonOf(const nlohmann::json::exception &error) {
    const std::string what = error.what();
    const std::string::size_type close = what.find("] ");
    return close == std::string::npos ? what : what.substr(close + 2);
}

}  // namespace

nlohmann::json parseJson(const std::string &text) {
    try {
        return nlohmann::json::parse(text);
    } catch (const nlohmann::json::parse_error &error) {
        // Keep "line L, column C: ..." and drop the library's own prefix.
        std::string reason = reasonOf(error);
        const std::string prefix = "parse error at ";
        if (reason.compare(0, prefix.size(), prefix) == 0) reason.erase(0, prefix.size());
        throw ProfileError("not valid JSON: " + reason);
    } catch (const nlohmann::json::exception &error) {
        ErrorFinder finder;
        nlohmann::json::sax_parse(text, &finder);
        throw ProfileError("not valid JSON: " + placeOf(text, finder.offset) + ": " + reasonOf(error));
    }
}

}  // namespace hostsim
