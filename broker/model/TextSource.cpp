#include "model/TextSource.h"

#include <filesystem>
#include <fstream>
#include <iterator>
#include <stdexcept>
#include <system_error>

namespace tvxbroker {

std::string readTextFile(const std::string &path) {
    // A directory opens like a file and then reads as empty.
    std::error_code ignored;
    if (std::filesystem::is_directory(path, ignored)) throw std::runtime_error("cannot read " + path);
    std::ifstream in(path, std::ios::binary);
    if (!in) throw std::runtime_error("cannot read " + path);
    std::string text((std::istreambuf_iterator<char>(in)), std::istreambuf_iterator<char>());
    if (in.bad()) throw std::runtime_error("cannot read " + path);
    return text;
}

void throwAt(const std::string &origin, int line, const std::string &message) {
    throw std::runtime_error(origin + ":" + std::to_string(line) + ": " + message);
}

}  // namespace tvxbroker
