#pragma once

// A package that is installed, whatever kind it is of.

#include <cstdint>
#include <string>

#include "system/Fact.h"

namespace cimomd {

enum class PackageFormat : std::uint8_t { Debian, Rpm };

struct SoftwarePackage {
    PackageFormat format = PackageFormat::Debian;
    std::string name;
    std::string architecture;
    /// What tells it from other packages of its format.
    std::string identity;
    /// With everything the packager put around the maker's version.
    std::string version;
    /// The maker's version alone.
    std::string upstreamVersion;
    Fact<std::string> manufacturer;
    Fact<std::string> summary;
    Fact<std::string> section;
    /// In units of 1,024 bytes.
    Fact<std::uint64_t> installedKB;
    /// Seconds since 1970 UTC.
    Fact<std::int64_t> installTime;
};

}  // namespace cimomd
