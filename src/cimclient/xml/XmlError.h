// What the XML decoder throws. It never leaves the codec: the faces of the codec turn it into the
// exceptions of the client, or into the server's refusal.

#pragma once

#include <cstdint>
#include <string>

namespace Pegasus {

struct XmlError {
    enum class Kind {
        Syntax,       ///< not well-formed XML 1.0, or a part of it that is refused (DOCTYPE)
        InvalidUtf8,  ///< an octet that UTF-8 does not allow where it stands
        Limit,        ///< nested too deep, too many attributes, too large
        Truncated,    ///< the text ends before the document does
        Content,      ///< well-formed, but not what the reader expects there
    };

    Kind kind;
    /// Octets from the beginning of the document to the fault.
    std::uint64_t offset;
    /// For people, UTF-8, ends in "at byte <offset>".
    std::string message;
};

}  // namespace Pegasus
