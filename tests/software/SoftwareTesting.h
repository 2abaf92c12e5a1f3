// What the software tests share: the two images as the default host names
// them, and a boot configuration of the test's own that the provider reads
// for as long as it lives.
#pragma once

#include <gtest/gtest.h>
#include <unistd.h>

#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <string>

namespace softwaretest {

inline constexpr const char *kRunningId = "Talvex Corlai 5.1.0 build-1483097";
inline constexpr const char *kAltId = "Alt Boot Bank: Talvex Corlai 5.1.0 build-654321";

class BootBankFile {
public:
    explicit BootBankFile(const std::string &content) {
        write(content);
        ::setenv("TVX_ALTBOOTBANK_CFG", path.c_str(), 1);
    }
    ~BootBankFile() {
        ::unsetenv("TVX_ALTBOOTBANK_CFG");
        std::remove(path.c_str());
    }
    BootBankFile(const BootBankFile &) = delete;
    BootBankFile &operator=(const BootBankFile &) = delete;

    void write(const std::string &content) const { std::ofstream(path, std::ios::binary) << content; }

    const std::string path = testing::TempDir() + "boot_" + std::to_string(::getpid()) + ".cfg";
};

}  // namespace softwaretest
