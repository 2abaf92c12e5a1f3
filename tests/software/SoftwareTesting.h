// A boot configuration of the software tests' own, which the provider
// reads for as long as it lives.
#pragma once

#include <gtest/gtest.h>
#include <unistd.h>

#include <cstdio>
#include <cstdlib>
#include <fstream>
#include <string>

namespace softwaretest {

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
