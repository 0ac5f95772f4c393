#include "cim/CimText.h"

#include <Pegasus/Common/CIMStatusCode.h>

namespace sennetctl {

namespace {

const char* statusName(Pegasus::Uint32 code) {
    static constexpr const char* kNames[] = {
        "CIM_ERR_SUCCESS",           "CIM_ERR_FAILED",
        "CIM_ERR_ACCESS_DENIED",     "CIM_ERR_INVALID_NAMESPACE",
        "CIM_ERR_INVALID_PARAMETER", "CIM_ERR_INVALID_CLASS",
        "CIM_ERR_NOT_FOUND",         "CIM_ERR_NOT_SUPPORTED"};
    return code < std::size(kNames) ? kNames[code] : "CIM status";
}

}  // namespace

std::string reasonOf(const Pegasus::Exception& failure) {
    std::string message = textOf(failure.getMessage());
    const auto* reported = dynamic_cast<const Pegasus::CIMException*>(&failure);
    if (reported == nullptr) {
        return message;
    }
    const auto code = static_cast<Pegasus::Uint32>(reported->getCode());
    return std::string(statusName(code)) + " (" + std::to_string(code) + "): " + message;
}

}  // namespace sennetctl
