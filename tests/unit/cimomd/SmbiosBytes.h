#pragma once

// SMBIOS tables put together field by field, at the offsets of the standard (DSP0134).

#include <cstdint>
#include <string>
#include <vector>

#include "RecordedTree.h"

namespace cimomd {

/// A structure of `length` formatted bytes, all 0 but its header and what is set.
class SmbiosFields {
  public:
    SmbiosFields(std::uint8_t type, std::uint8_t length, std::uint16_t handle = 0)
        : area(length, '\0') {
        byte(0, type).byte(1, length).word(2, handle);
    }

    SmbiosFields& byte(std::size_t offset, std::uint8_t value) { return set(offset, 1, value); }
    SmbiosFields& word(std::size_t offset, std::uint16_t value) { return set(offset, 2, value); }
    SmbiosFields& doubleWord(std::size_t offset, std::uint32_t value) {
        return set(offset, 4, value);
    }
    SmbiosFields& quadWord(std::size_t offset, std::uint64_t value) {
        return set(offset, 8, value);
    }
    /// Adds a text and puts its number at `offset`.
    SmbiosFields& text(std::size_t offset, const std::string& value) {
        texts += value + '\0';
        return byte(offset, ++textCount);
    }

    std::string bytes() const {
        return area + (texts.empty() ? std::string(1, '\0') : texts) + '\0';
    }

  private:
    SmbiosFields& set(std::size_t offset, std::size_t width, std::uint64_t value) {
        for (std::size_t i = 0; i < width; ++i)
            area.at(offset + i) = static_cast<char>(value >> (8 * i) & 0xFF);
        return *this;
    }

    std::string area;
    std::string texts;
    std::uint8_t textCount = 0;
};

/// The bytes of these structures, with the one that ends a table.
inline std::string smbiosTableOf(const std::vector<SmbiosFields>& structures) {
    std::string bytes;
    for (const SmbiosFields& structure : structures)
        bytes += structure.bytes();
    return bytes + SmbiosFields(127, 4, 0xFEFF).bytes();
}

/// The entry point of tables of version 3.
inline std::string smbiosEntryPoint64(std::uint8_t majorNumber, std::uint8_t minorNumber) {
    std::string bytes = "_SM3_";
    bytes += '\0';
    bytes += static_cast<char>(24);
    bytes += static_cast<char>(majorNumber);
    bytes += static_cast<char>(minorNumber);
    return bytes + std::string(15, '\0');
}

/// The entry point of tables of version 2.
inline std::string smbiosEntryPoint32(std::uint8_t majorNumber, std::uint8_t minorNumber) {
    std::string bytes = "_SM_";
    bytes += '\0';
    bytes += static_cast<char>(31);
    bytes += static_cast<char>(majorNumber);
    bytes += static_cast<char>(minorNumber);
    return bytes + std::string(23, '\0');
}

/// Puts tables of version 3.2 into a recorded tree.
inline void recordSmbios(RecordedTree& tree, const std::vector<SmbiosFields>& structures) {
    tree.file("sys/firmware/dmi/tables/smbios_entry_point", smbiosEntryPoint64(3, 2))
        .file("sys/firmware/dmi/tables/DMI", smbiosTableOf(structures));
}

}  // namespace cimomd
