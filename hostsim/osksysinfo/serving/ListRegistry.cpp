#include "serving/ListRegistry.h"

namespace hostsim {

ListRegistry &ListRegistry::instance() {
    static ListRegistry registry;
    return registry;
}

PRB_ParamList *ListRegistry::handOut(std::unique_ptr<PRB_ParamList> list) {
    PRB_ParamList *const address = list.get();
    const std::lock_guard<std::mutex> lock(mutex_);
    live_.emplace(address, std::move(list));
    ++counts_.created;
    return address;
}

void ListRegistry::destroy(PRB_ParamList *list) {
    std::unique_ptr<PRB_ParamList> freed;  // freed after the lock is released
    const std::lock_guard<std::mutex> lock(mutex_);
    const auto found = live_.find(list);
    if (found == live_.end()) {
        ++counts_.foreign;
        return;
    }
    freed = std::move(found->second);
    live_.erase(found);
    ++counts_.destroyed;
}

ListCounts ListRegistry::counts() const {
    const std::lock_guard<std::mutex> lock(mutex_);
    return counts_;
}

}  // namespace hostsim
