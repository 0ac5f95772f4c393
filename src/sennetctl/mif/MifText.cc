#include "mif/MifText.h"

namespace sennetctl {

namespace {

std::string fromTwoOctets(std::string_view file, bool bigEndian) {
    std::string octets;
    for (std::size_t i = 2; i + 1 < file.size(); i += 2) {
        const char high = file[bigEndian ? i : i + 1];
        const char low = file[bigEndian ? i + 1 : i];
        octets += high == 0 ? low : '?';
    }
    return octets;
}

}  // namespace

MifText mifTextOf(std::string_view file) {
    constexpr std::string_view kUtf8Mark = "\xEF\xBB\xBF";
    if (file.substr(0, 2) == "\xFE\xFF" || file.substr(0, 2) == "\xFF\xFE") {
        return {fromTwoOctets(file, file[0] == '\xFE'), MifText::Encoding::TwoOctetUnicode};
    }
    if (file.substr(0, kUtf8Mark.size()) == kUtf8Mark) {
        return {std::string(file.substr(kUtf8Mark.size())), MifText::Encoding::Utf8WithMark};
    }
    return {std::string(file), MifText::Encoding::Octets};
}

}  // namespace sennetctl
