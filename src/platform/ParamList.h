// Owns one list handed out by the system-information library, so every
// return path gives it back.
#pragma once

#include "platform/OskSysInfo.h"

namespace platform {

class ParamList {
public:
    explicit ParamList(PRB_ParamList *list = nullptr) noexcept : list_(list) {}
    ParamList(const ParamList &) = delete;
    ParamList &operator=(const ParamList &) = delete;
    ~ParamList() { reset(); }

    PRB_ParamList *get() const noexcept { return list_; }
    explicit operator bool() const noexcept { return list_ != nullptr; }

    // For the library calls that fill a list pointer; drops what was held.
    PRB_ParamList **receive() noexcept {
        reset();
        return &list_;
    }

    void reset() noexcept {
        if (list_ != nullptr) PRB_ParamListDestroy(list_);
        list_ = nullptr;
    }

private:
    PRB_ParamList *list_;
};

}  // namespace platform
