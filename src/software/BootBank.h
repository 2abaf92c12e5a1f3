// The version of the image in the alternate boot bank, read from the first
// "build=" line of its boot configuration: build=<version>-<build>.
#pragma once

#include <cstdint>
#include <cstdio>
#include <memory>
#include <string>

#include "software/SystemVersionInfo.h"

namespace Software {

constexpr const char *bootBankFile = "/altbootbank/boot.cfg";
// Names another boot configuration for a machine without a boot bank of its
// own (the simulated host of the demo and the tests).
constexpr const char *bootBankFileVariable = "TVX_ALTBOOTBANK_CFG";

// The file the provider reads: the variable's value when it is set and not
// empty, else bootBankFile.
std::string bootBankFileInUse();

// Null when the file cannot be opened. Otherwise a record: all zero without
// a build line or without a hyphen in its value; else the version text
// before the first hyphen (cut to its field), the product "Talvex Corlai"
// and the build number of the text after it.
std::unique_ptr<SystemVersionInfo> readBootBank(const char *path);

// The record of an opened boot configuration; never null.
std::unique_ptr<SystemVersionInfo> readBootBank(std::FILE *file);

// The build number of a build text: the number itself, or the third of
// three joined by dots, each a plain decimal without sign or leading zero
// up to 2147483647; -1 for anything else.
std::int32_t buildNumberOf(const std::string &buildText);

}  // namespace Software
