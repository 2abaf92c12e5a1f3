// A scalar's literal text as paths and MOF write it; the first byte picks
// the type. A value that reads must write back to text that reads the same.
#include <cmath>

#include "FuzzInput.h"
#include "model/ValueText.h"

namespace {

const CMPIType scalarTypes[] = {CMPI_boolean, CMPI_char16, CMPI_uint8,  CMPI_uint16, CMPI_uint32,
                                CMPI_uint64,  CMPI_sint8,  CMPI_sint16, CMPI_sint32, CMPI_sint64,
                                CMPI_real32,  CMPI_real64, CMPI_string, CMPI_dateTime};

bool sameValue(const tvxbroker::CimValue &a, const tvxbroker::CimValue &b) {
    return a == b || (std::isnan(a.real) && std::isnan(b.real) && a.type == b.type);
}

std::optional<tvxbroker::CimValue> read(CMPIType type, const std::string &text) {
    std::uint64_t codeUnit = 0;
    if (type == CMPI_char16) {
        if (!tvxbroker::readChar16(text, codeUnit)) return std::nullopt;
        return tvxbroker::CimValue::makeUnsigned(CMPI_char16, codeUnit);
    }
    std::string problem;
    std::optional<tvxbroker::CimValue> value = tvxbroker::bareScalarValue(type, "P", text, problem);
    if (!value && problem.empty()) std::abort();
    return value;
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t *data, std::size_t size) {
    if (size == 0) return 0;
    const CMPIType type = scalarTypes[data[0] % (sizeof scalarTypes / sizeof scalarTypes[0])];
    const std::optional<tvxbroker::CimValue> value = read(type, tvxfuzz::textOf(data + 1, size - 1));
    if (!value) return 0;
    std::string text;
    bool quoted = false;
    if (!tvxbroker::scalarText(*value, text, quoted)) std::abort();
    const std::optional<tvxbroker::CimValue> again = read(type, text);
    if (!again || !sameValue(*again, *value)) std::abort();
    return 0;
}
