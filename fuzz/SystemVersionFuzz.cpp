// The user library's system version record, as the software identity
// provider reads it: identity text, alternate-bank mark and release date.
#include "FuzzInput.h"
#include "software/InstanceId.h"
#include "software/SoftwareIdentity.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size) {
    SystemVersionInfo record;
    tvxfuzz::fillRecord(record, data, size);
    Software::isAltBootBankId(Software::makeInstanceId(record).c_str());
    Software::recordReleaseDate(record);
    return 0;
}
