#include "ethernet/GetPnicDetails.h"

#include <cstring>

#include "ethernet/AdapterRecord.h"
#include "ethernet/LinkSettings.h"
#include "frame/BoundedText.h"
#include "frame/LittleEndian.h"
#include "platform/ParamList.h"
#include "platform/SystemInfoSignature.h"

namespace EthernetProvider {
namespace {

constexpr int adapterListNode = 70;
constexpr int adapterRecordNode = 72;
constexpr int adapterMtuNode = 74;
constexpr unsigned int failed = 1;

enum class Step { added, stop, fail };

Step readAdapter(PRB_ParamList *adapters, int index, std::vector<PnicDetails> &pnics) {
    char *name = nullptr;
    if (PRB_ParamListGetString(adapters, index, &name) != 0 || name == nullptr) return Step::fail;

    // A list that cannot be made ends the walk with what was read so far.
    platform::ParamList params(PRB_ParamListCreate(1, 1));
    if (!params) return Step::stop;
    if (PRB_ParamListAddString(params.get(), name) != 0) return Step::fail;

    unsigned char mtu[4] = {};
    if (PRB_Get(adapterMtuNode, params.get(), mtu, sizeof mtu) != 0) return Step::fail;
    unsigned char record[adapterRecordSize] = {};
    if (PRB_Get(adapterRecordNode, params.get(), record, sizeof record) != 0) return Step::fail;
    params.reset();

    PnicDetails details;
    std::memset(&details, 0, sizeof details);
    frame::copyBounded(details.name, name);
    details.mtu = frame::littleEndian(mtu, sizeof mtu);
    queryLinkSettings(name, details);
    decodeAdapterRecord(record, details);
    pnics.push_back(details);
    return Step::added;
}

}  // namespace

unsigned int getPnicDetails(std::vector<PnicDetails> &pnics) {
    if (!platform::systemInfoUsable()) return failed;

    platform::ParamList adapters;
    if (PRB_GetInstanceListAlloc(adapterListNode, nullptr, adapters.receive()) != 0) return failed;

    const int count = PRB_ParamListUsedCount(adapters.get());
    for (int index = 0; index < count; ++index) {
        switch (readAdapter(adapters.get(), index, pnics)) {
            case Step::added: break;
            case Step::stop: return 0;
            case Step::fail: return failed;
        }
    }
    return 0;
}

}  // namespace EthernetProvider
