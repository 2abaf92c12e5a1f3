// Reads the class declarations of MOF text; qualifier declarations,
// instances and methods are parsed only far enough to be skipped.
#pragma once

#include <string>
#include <vector>

#include "model/ClassSchema.h"

namespace tvxbroker {

struct ClassAtLine {
    ClassDecl decl;
    int line;  // of the class keyword
};

// Throws std::runtime_error "origin:line: message" on a syntax error.
std::vector<ClassAtLine> readMofClasses(const std::string &text, const std::string &origin);

}  // namespace tvxbroker
