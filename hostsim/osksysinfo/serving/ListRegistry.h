// Owns every parameter list handed to a caller and counts them, so tests can
// prove each list is freed; destroying something that is not a live list is
// counted instead of freeing it.
#pragma once

#include <cstddef>
#include <memory>
#include <mutex>
#include <unordered_map>

#include "serving/ParamList.h"

namespace hostsim {

struct ListCounts {
    std::size_t created = 0;
    std::size_t destroyed = 0;
    std::size_t foreign = 0;
};

class ListRegistry {
public:
    static ListRegistry &instance();

    PRB_ParamList *handOut(std::unique_ptr<PRB_ParamList> list);
    void destroy(PRB_ParamList *list);
    ListCounts counts() const;

private:
    mutable std::mutex mutex_;
    std::unordered_map<PRB_ParamList *, std::unique_ptr<PRB_ParamList>> live_;
    ListCounts counts_;
};

}  // namespace hostsim
