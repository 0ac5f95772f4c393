// Fuzzes the decoding of answers: any octets end in a result or in an exception of the client, and
// in the same whether they arrive at once or in small pieces.

#include <Pegasus/Common/Exception.h>

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <string>
#include <string_view>

#include "xml/CimXmlReader.h"
#include "xml/CimXmlWriter.h"
#include "xml/MemorySource.h"

namespace {

std::string instancesOutcome(std::string_view text, std::size_t pieceSize) {
    Pegasus::MemorySource source(text, pieceSize);
    std::string outcome;
    try {
        const auto instances = Pegasus::decodeEnumerateInstancesResponse(source, "7");
        for (const Pegasus::CIMInstance& instance : instances) {
            Pegasus::appendNamedInstance(outcome, instance);
        }
    } catch (const Pegasus::Exception& error) {
        outcome = error.getMessage().getCString();
    }
    return outcome;
}

std::string classOutcome(std::string_view text, std::size_t pieceSize) {
    Pegasus::MemorySource source(text, pieceSize);
    std::string outcome;
    try {
        const Pegasus::CIMClass cimClass = Pegasus::decodeGetClassResponse(source, "7");
        if (!cimClass.isUninitialized()) {
            Pegasus::appendClassElement(outcome, cimClass);
        }
    } catch (const Pegasus::Exception& error) {
        outcome = error.getMessage().getCString();
    }
    return outcome;
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const std::string_view text(reinterpret_cast<const char*>(data), size);
    if (instancesOutcome(text, size + 1) != instancesOutcome(text, 7) ||
        classOutcome(text, size + 1) != classOutcome(text, 7)) {
        std::abort();
    }
    return 0;
}
