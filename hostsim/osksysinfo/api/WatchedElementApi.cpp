// The watched elements for the stand-in host providers, which live in another
// library: copies they own, so a profile loaded meanwhile frees nothing they
// still read.
#include <deque>
#include <string>
#include <vector>

#include "api/ExportedApi.h"
#include "serving/ProfileStore.h"

using namespace hostsim;

namespace {

// One answer and everything its views point into. The texts sit in a deque
// and the keys in a vector sized up front, so no pointer handed out moves.
struct WatchedElementsCopy : HostSimWatchedElements {
    WatchedElementsCopy(const std::vector<WatchedElementProfile> &served, std::uint64_t poll)
        : HostSimWatchedElements{nullptr, 0} {
        std::size_t keyCount = 0;
        for (const WatchedElementProfile &element : served) keyCount += element.keys.size();
        keys.reserve(keyCount);
        views.reserve(served.size());
        for (const WatchedElementProfile &element : served) {
            const HostSimWatchedKey *firstKey = keys.data() + keys.size();
            for (const WatchedKey &key : element.keys) {
                keys.push_back(HostSimWatchedKey{keep(key.name), copy(key.value)});
            }
            views.push_back(HostSimWatchedElement{keep(element.className), keep(element.nameSpace),
                                                  element.hostName ? keep(*element.hostName) : nullptr, firstKey,
                                                  element.keys.size(), copy(element.healthStateOfPoll(poll))});
        }
        elements = views.data();
        count = views.size();
    }

    const char *keep(const std::string &text) { return texts.emplace_back(text).c_str(); }

    HostSimValue copy(const ScriptedValue &value) {
        const char *text = value.type == HOSTSIM_VALUE_STRING ? keep(value.text) : nullptr;
        return HostSimValue{value.type, value.unsignedValue, value.signedValue, text};
    }

    std::deque<std::string> texts;
    std::vector<HostSimWatchedKey> keys;
    std::vector<HostSimWatchedElement> views;
};

}  // namespace

int HostSim_GetWatchedElements(const char *className, int enumeration, HostSimWatchedElements **answer) {
    if (answer == nullptr) return HOSTSIM_STATUS_BAD_ARGUMENT;
    *answer = nullptr;
    if (className == nullptr) return HOSTSIM_STATUS_BAD_ARGUMENT;
    const WatchedPoll watched = ProfileStore::instance().watchedPoll(className, enumeration != 0);
    if (!watched.profile) return HOSTSIM_STATUS_NO_PROFILE;
    // The profile is never changed once served, and `watched` holds it.
    static const std::vector<WatchedElementProfile> none;
    *answer = new WatchedElementsCopy(watched.elements != nullptr ? *watched.elements : none, watched.poll);
    return HOSTSIM_STATUS_OK;
}

void HostSim_FreeWatchedElements(HostSimWatchedElements *answer) {
    delete static_cast<WatchedElementsCopy *>(answer);
}
