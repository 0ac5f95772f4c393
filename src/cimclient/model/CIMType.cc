#include <Pegasus/Common/CIMType.h>

#include <array>

namespace Pegasus {

const char* cimTypeToString(CIMType type) {
    static constexpr std::array<const char*, CIMTYPE_INSTANCE + 1> kNames = {
        "boolean", "uint8",    "sint8",     "uint16", "sint16",  "uint32",
        "sint32",  "uint64",   "sint64",    "real32", "real64",  "char16",
        "string",  "datetime", "reference", "object", "instance"};
    return type < kNames.size() ? kNames[type] : "unknown";
}

}  // namespace Pegasus
