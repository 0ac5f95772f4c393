// Reads any octets as SMBIOS tables: the first 32 as the entry point, the rest as structures. What
// is taken out of a structure must have been in the bytes.

#include <cstddef>
#include <cstdint>
#include <string_view>

#include "Require.h"
#include "system/computer/SmbiosTable.h"

namespace {

constexpr std::size_t kEntryPointBytes = 32;
constexpr std::size_t kMaxLength = 255;

void requireBounds(const cimomd::SmbiosStructure& structure) {
    const std::size_t length = structure.length();
    require(length >= cimomd::SmbiosStructure::kHeaderBytes && length <= kMaxLength);
    for (std::size_t offset = 0; offset <= kMaxLength + 1; ++offset) {
        require(structure.byte(offset).has_value() == (offset < length));
        require(structure.word(offset).has_value() == (offset + 2 <= length));
        require(structure.doubleWord(offset).has_value() == (offset + 4 <= length));
        const auto text = structure.text(offset);
        require(!text || (offset < length && !text->empty()));
    }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const std::string_view bytes(reinterpret_cast<const char*>(data), size);
    cimomd::parseSmbiosEntryPoint(bytes.substr(0, kEntryPointBytes));
    if (size <= kEntryPointBytes)
        return 0;
    const std::string_view table = bytes.substr(kEntryPointBytes);
    std::size_t described = 0;
    for (const cimomd::SmbiosStructure& structure : cimomd::parseSmbiosStructures(table)) {
        requireBounds(structure);
        described += structure.length() + 1;
    }
    require(described <= table.size());
    return 0;
}
