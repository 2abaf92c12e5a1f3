// Parameter lists: made, filled, read and freed for the caller. Texts handed
// out point into the list and stay valid until their entry is removed or the
// list is destroyed.
#include <limits>
#include <memory>

#include "api/ExportedApi.h"
#include "serving/ListRegistry.h"
#include "serving/ProfileStore.h"

using namespace hostsim;

namespace {

bool injected(Operation operation, std::optional<std::int64_t> number, std::optional<std::string> text = {}) {
    return ProfileStore::instance().consult({operation, number, std::move(text)}).fault != nullptr;
}

// The entry at `index`, or null past either end.
PRB_Param *entryAt(PRB_ParamList *list, int index) {
    if (list == nullptr || index < 0 || std::size_t(index) >= list->entries.size()) return nullptr;
    return &list->entries[std::size_t(index)];
}

}  // namespace

PRB_ParamList *PRB_ParamListCreate(int initialCount, int growBy) {
    // Both are sizing hints of the real library, which a deque does not need.
    if (initialCount < 0 || growBy < 0) return nullptr;
    if (injected(Operation::ParamListCreate, std::nullopt)) return nullptr;
    return ListRegistry::instance().handOut(std::make_unique<PRB_ParamList>());
}

void PRB_ParamListDestroy(PRB_ParamList *list) {
    if (list != nullptr) ListRegistry::instance().destroy(list);
}

int PRB_ParamListUsedCount(PRB_ParamList *list) {
    return list == nullptr ? 0 : int(list->entries.size());
}

int PRB_ParamListAddString(PRB_ParamList *list, const char *text) {
    if (list == nullptr || text == nullptr) return HOSTSIM_STATUS_BAD_ARGUMENT;
    if (injected(Operation::ParamListAddString, std::nullopt, std::string(text))) return HOSTSIM_STATUS_INJECTED;
    list->entries.push_back(PRB_Param{std::string(text)});
    return HOSTSIM_STATUS_OK;
}

int PRB_ParamListAddInt(PRB_ParamList *list, int64_t value) {
    if (list == nullptr) return HOSTSIM_STATUS_BAD_ARGUMENT;
    if (injected(Operation::ParamListAddInt, value)) return HOSTSIM_STATUS_INJECTED;
    list->entries.push_back(PRB_Param{value});
    return HOSTSIM_STATUS_OK;
}

int PRB_ParamListRemoveLastParam(PRB_ParamList *list) {
    if (list == nullptr) return HOSTSIM_STATUS_BAD_ARGUMENT;
    if (list->entries.empty()) return HOSTSIM_STATUS_NOT_FOUND;
    list->entries.pop_back();
    return HOSTSIM_STATUS_OK;
}

int PRB_ParamListGetString(PRB_ParamList *list, int index, char **text) {
    if (text == nullptr) return HOSTSIM_STATUS_BAD_ARGUMENT;
    *text = nullptr;
    if (list == nullptr) return HOSTSIM_STATUS_BAD_ARGUMENT;
    if (injected(Operation::ParamListGetString, index)) return HOSTSIM_STATUS_INJECTED;
    PRB_Param *entry = entryAt(list, index);
    if (entry == nullptr) return HOSTSIM_STATUS_NOT_FOUND;
    auto *value = std::get_if<std::string>(&entry->value);
    if (value == nullptr) return HOSTSIM_STATUS_WRONG_TYPE;
    *text = value->data();
    return HOSTSIM_STATUS_OK;
}

int PRB_ParamListGetInt32(PRB_ParamList *list, int index, int32_t *value) {
    if (value == nullptr) return HOSTSIM_STATUS_BAD_ARGUMENT;
    *value = 0;
    if (list == nullptr) return HOSTSIM_STATUS_BAD_ARGUMENT;
    if (injected(Operation::ParamListGetInt32, index)) return HOSTSIM_STATUS_INJECTED;
    PRB_Param *entry = entryAt(list, index);
    if (entry == nullptr) return HOSTSIM_STATUS_NOT_FOUND;
    const auto *number = std::get_if<std::int64_t>(&entry->value);
    if (number == nullptr || *number < std::numeric_limits<int32_t>::min() ||
        *number > std::numeric_limits<int32_t>::max()) {
        return HOSTSIM_STATUS_WRONG_TYPE;
    }
    *value = int32_t(*number);
    return HOSTSIM_STATUS_OK;
}

PRB_Param *PRB_ParamListGetParam(PRB_ParamList *list, int index) {
    if (list == nullptr || injected(Operation::ParamListGetParam, index)) return nullptr;
    return entryAt(list, index);
}

const char *PRB_ParamGetString(PRB_Param *param) {
    if (param == nullptr) return nullptr;
    const auto *text = std::get_if<std::string>(&param->value);
    return text == nullptr ? nullptr : text->c_str();
}
