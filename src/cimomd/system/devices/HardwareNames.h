#pragma once

// The names of PCI and USB hardware from the lists pci.ids and usb.ids, which have one format. The
// lists are long and the questions few, so the questions come first and each list is read once.
// libpci would know the format too, but it ends the program over a malformed list.

#include <array>
#include <compare>
#include <cstdint>
#include <map>
#include <string>
#include <string_view>

#include "system/Fact.h"
#include "system/SystemPaths.h"

namespace cimomd {

class HardwareNames {
  public:
    /// What a line of a list names.
    struct Key {
        enum class Kind : std::uint8_t { Vendor, Device, Subsystem, Class, Subclass };
        Kind kind = Kind::Vendor;
        /// Vendor, device, vendor and device of the subsystem; or class and subclass. The others
        /// are 0.
        std::array<std::uint16_t, 4> numbers{};

        // NOLINTNEXTLINE(modernize-use-nullptr): the check takes the comparison's 0 for a pointer.
        auto operator<=>(const Key&) const = default;
    };
    static Key vendor(std::uint16_t vendor);
    static Key device(std::uint16_t vendor, std::uint16_t device);
    static Key subsystem(const Key& device, std::uint16_t subsystemVendor,
                         std::uint16_t subsystemDevice);
    static Key baseClass(std::uint8_t baseClass);
    static Key subclass(std::uint8_t baseClass, std::uint8_t subclass);

    void want(const Key& key) { wanted.emplace(key, Absence::Absent); }

    /// Answers what was asked. Lines that are not understood are skipped; of two lines for one
    /// thing the first counts. A missing list leaves its reason with every name.
    void read(const Fact<std::string>& list);

    /// Missing when the list does not have it, or nobody asked.
    Fact<std::string> nameOf(const Key& key) const;

  private:
    std::map<Key, Fact<std::string>> wanted;
};

/// The text of the list `fileName` where Debian and others keep it.
Fact<std::string> readHardwareList(const SystemPaths& paths, std::string_view fileName);

}  // namespace cimomd
