#include "platform/OmcFarEnds.h"

#include <algorithm>
#include <cctype>
#include <string>
#include <unordered_map>
#include <utility>

#include "CmpiStatus.h"
#include "platform/OmcObjectIdentity.h"
#include "platform/OmcPropertyNames.h"
#include "platform/TextKeys.h"

namespace OMC {

namespace {

// The string keys of a path, names lowered and sorted. Paths that name the
// same object (sameObject) have the same text keys, so this buckets them
// and sameObject decides within a bucket.
std::string textKeySignature(const CmpiObjectPath &path) {
    const std::optional<platform::TextKeyList> keys = platform::textKeysOf(path, false);
    std::string signature;
    for (const auto &key : *keys) signature += key.first + '\0' + key.second + '\0';
    return signature;
}

// Fills `found` for the far ends listed in `members`, all of one class, from
// one enumeration of that class.
void fetchClass(const CmpiBroker &broker, const CmpiContext &ctx, const std::vector<CmpiObjectPath> &farEnds,
                const std::vector<std::size_t> &members, const char **properties,
                std::vector<CmpiInstance> &found) {
    const CmpiObjectPath &sample = farEnds[members.front()];
    std::unordered_map<std::string, std::vector<std::size_t>> bySignature;
    for (std::size_t member : members) bySignature[textKeySignature(farEnds[member])].push_back(member);
    PropertyNames wanted(properties, sample);
    CmpiEnumeration instances;
    try {
        instances = broker.enumInstances(ctx, CmpiObjectPath(sample.getNameSpace(), sample.getClassName().charPtr()),
                                         properties != nullptr ? wanted.list() : nullptr);
    } catch (const CmpiStatus &) {
        return;
    }
    while (instances.hasNext()) {
        const CmpiInstance instance = instances.getNext();
        const CmpiObjectPath path = instance.getObjectPath();
        const auto bucket = bySignature.find(textKeySignature(path));
        if (bucket == bySignature.end()) continue;
        for (std::size_t member : bucket->second) {
            if (found[member].isNull() && sameObject(path, farEnds[member])) found[member] = instance;
        }
    }
}

}  // namespace

std::vector<CmpiInstance> fetchFarEnds(const CmpiBroker &broker, const CmpiContext &ctx,
                                       const std::vector<CmpiObjectPath> &farEnds,
                                       const char **properties) {
    std::vector<CmpiInstance> found(farEnds.size());
    std::vector<bool> grouped(farEnds.size(), false);
    for (std::size_t first = 0; first < farEnds.size(); ++first) {
        if (grouped[first]) continue;
        const CmpiString className = farEnds[first].getClassName();
        std::vector<std::size_t> members;
        for (std::size_t other = first; other < farEnds.size(); ++other) {
            if (!grouped[other] && farEnds[other].getClassName().equalsIgnoreCase(className)) {
                grouped[other] = true;
                members.push_back(other);
            }
        }
        fetchClass(broker, ctx, farEnds, members, properties, found);
    }
    found.erase(std::remove_if(found.begin(), found.end(), [](const CmpiInstance &instance) { return instance.isNull(); }),
                found.end());
    return found;
}

}  // namespace OMC
