// Fuzzes the decoding of requests: any octets end in a request, whose getters give a value or a
// CIMException, or in a CimRequestError.

#include <Pegasus/Common/Exception.h>

#include <cstddef>
#include <cstdint>
#include <string_view>

#include "xml/CimRequest.h"
#include "xml/MemorySource.h"

namespace {

template <typename Getter>
void call(Getter getter) {
    try {
        getter();
    } catch (const Pegasus::CIMException&) {
        // The answer to an invalid parameter.
    }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const std::string_view text(reinterpret_cast<const char*>(data), size);
    Pegasus::MemorySource source(text);
    try {
        const Pegasus::CimRequest request = Pegasus::decodeRequest(source);
        for (const Pegasus::CimParameter& parameter : request.parameters) {
            call([&] { request.flag(parameter.name, true); });
            call([&] { request.className(parameter.name); });
            call([&] { request.instanceName(parameter.name); });
            call([&] { request.propertyList(parameter.name); });
            call([&] { request.text(parameter.name); });
        }
        call([&] { request.requireOnly({"ClassName", "LocalOnly"}); });
    } catch (const Pegasus::CimRequestError&) {
        // Refused.
    }
    return 0;
}
