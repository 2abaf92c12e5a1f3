#include "CmpiString.h"

#include <strings.h>

#include <cstring>

CmpiString::CmpiString(const char *value) {
    if (value != nullptr) text = value;
}

CmpiString::CmpiString(const std::string &value) : text(value) {}

CmpiString::CmpiString(const CMPIString *handle) {
    if (handle == nullptr || handle->ft == nullptr) return;
    const char *value = handle->ft->getCharPtr(handle, nullptr);
    if (value != nullptr) text = value;
}

bool CmpiString::equals(const char *other) const {
    if (!text || other == nullptr) return !text && other == nullptr;
    return std::strcmp(text->c_str(), other) == 0;
}

bool CmpiString::equalsIgnoreCase(const char *other) const {
    if (!text || other == nullptr) return !text && other == nullptr;
    return strcasecmp(text->c_str(), other) == 0;
}
