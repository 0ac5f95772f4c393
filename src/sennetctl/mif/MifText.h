#pragma once

// The text of a MIF file in ISO 8859-1, the character set of the format.

#include <string>
#include <string_view>

namespace sennetctl {

struct MifText {
    enum class Encoding { Octets, TwoOctetUnicode, Utf8WithMark };

    std::string octets;
    Encoding encoding = Encoding::Octets;
};

/// Takes two-octet Unicode (a file that begins FE FF or FF FE) and a UTF-8 byte-order mark away.
/// Characters beyond the character set become question marks.
MifText mifTextOf(std::string_view file);

}  // namespace sennetctl
