// Fuzzes the decoding of answers: any octets end in a result or in an exception of the client, and
// in the same whether they arrive at once or in small pieces, which keep the decoder from
// recognising what repeats.
//
// Octets that do not begin as XML does are taken for the members of instances, one instance a line,
// and an answer is made of them that has each twice: so repetition need not be found by chance.

#include <Pegasus/Common/Exception.h>

#include <algorithm>
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

// An instance of class T_Other where the line begins with "#".
std::string instanceOf(std::string_view members) {
    const bool isOther = members.starts_with('#');
    const std::string className = isOther ? "T_Other" : "T_Thing";
    std::string xml = "<VALUE.NAMEDINSTANCE><INSTANCENAME CLASSNAME=\"" + className +
                      "\"><KEYBINDING NAME=\"K\"><KEYVALUE>1</KEYVALUE></KEYBINDING>"
                      "</INSTANCENAME><INSTANCE CLASSNAME=\"" +
                      className + "\">";
    xml += members.substr(isOther ? 1 : 0);
    return xml + "</INSTANCE></VALUE.NAMEDINSTANCE>";
}

std::string answerOf(std::string_view lines) {
    std::string instances;
    for (std::size_t begin = 0; begin <= lines.size();) {
        const std::size_t end = std::min(lines.find('\n', begin), lines.size());
        instances += instanceOf(lines.substr(begin, end - begin));
        begin = end + 1;
    }
    return "<CIM CIMVERSION=\"2.0\" DTDVERSION=\"2.0\"><MESSAGE ID=\"7\" PROTOCOLVERSION=\"1.0\">"
           "<SIMPLERSP><IMETHODRESPONSE NAME=\"EnumerateInstances\"><IRETURNVALUE>" +
           instances + instances + "</IRETURNVALUE></IMETHODRESPONSE></SIMPLERSP></MESSAGE></CIM>";
}

void requireSameInPieces(std::string_view text) {
    const std::string outcome = instancesOutcome(text, 7);
    // Where pieces are larger, some of what repeats is recognised and some is cut.
    if (instancesOutcome(text, text.size() + 1) != outcome ||
        instancesOutcome(text, 300) != outcome) {
        std::abort();
    }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const std::string_view text(reinterpret_cast<const char*>(data), size);
    if (!text.starts_with('<')) {
        requireSameInPieces(answerOf(text));
        return 0;
    }
    requireSameInPieces(text);
    if (classOutcome(text, size + 1) != classOutcome(text, 7)) {
        std::abort();
    }
    return 0;
}
