// The object-path text of the command-line client:
//   root/cimv2:Class.Key1="text",Key2=42,Flag=TRUE,Ref="root/cimv2:Other.K=\"v\""
// The host of a path has no place in it.
#pragma once

#include <cstddef>
#include <stdexcept>
#include <string>

#include "model/CimValue.h"
#include "model/ClassSchema.h"

namespace tvxbroker {

// what() is "<problem> at position <n>", n counting bytes from 0.
class PathParseError : public std::runtime_error {
public:
    PathParseError(const std::string &problem, std::size_t position);
    std::size_t position() const { return position_; }

private:
    std::size_t position_;
};

// The path names a class the schema does not declare.
class UnknownClassError : public PathParseError {
public:
    UnknownClassError(const std::string &className, std::size_t position);
    const std::string &className() const { return className_; }

private:
    std::string className_;
};

// Keys in stored order; a null key is written NULL, an embedded instance as
// its path. Throws std::invalid_argument for an array key.
std::string formatPath(const ObjectPath &path);

// Class and key names take their declared spelling and each value the
// declared type of its property (bare NULL gives a null value).
ObjectPath parsePath(const std::string &text, const ClassSchema &schema);

}  // namespace tvxbroker
