#include "system/software/RpmPackages.h"

#include <array>

#include "files/FileTime.h"
#include "files/TextFields.h"
#include "system/BoundedCommand.h"
#include "system/software/PackageRecords.h"

namespace cimomd {
namespace {

// In the order of rpmPackageFormat.
enum Field : std::size_t {
    kName,
    kEpoch,
    kVersion,
    kRelease,
    kArchitecture,
    kVendor,
    kPackager,
    kGroup,
    kSizeBytes,
    kInstallTime,
    kSummary,
    kFieldCount
};

constexpr std::string_view kSigningKey = "gpg-pubkey";
constexpr std::uint64_t kBytesPerKB = 1024;

std::string fullVersion(const std::vector<std::string_view>& fields) {
    const Fact<std::string> epoch = packageField(fields[kEpoch]);
    return (epoch ? *epoch + ":" : "") + std::string(fields[kVersion]) + "-" +
           std::string(fields[kRelease]);
}

SoftwarePackage packageOf(const std::vector<std::string_view>& fields) {
    SoftwarePackage out;
    out.format = PackageFormat::Rpm;
    out.name = fields[kName];
    out.architecture = fields[kArchitecture];
    out.version = fullVersion(fields);
    // Several versions of one package can be installed, kernels for example.
    out.identity = out.name + "-" + out.version + "." + out.architecture;
    out.upstreamVersion = fields[kVersion];
    out.manufacturer = packageField(fields[kVendor]);
    if (!out.manufacturer)
        out.manufacturer = packageField(fields[kPackager]);
    out.section = packageField(fields[kGroup]);
    out.summary = packageField(fields[kSummary]);
    out.installedKB = packageField(fields[kSizeBytes]).then([](const std::string& text) {
        const auto bytes = parseUnsigned(text);
        return bytes ? std::optional(*bytes / kBytesPerKB) : std::nullopt;
    });
    out.installTime = packageField(fields[kInstallTime]).then([](const std::string& text) {
        return parseSigned(text);
    });
    return out;
}

/// The database's main file, whichever of its kinds it is.
Fact<std::int64_t> databaseTimeOf(const std::filesystem::path& directory) {
    Fact<std::int64_t> time;
    for (const char* name : {"rpmdb.sqlite", "Packages.db", "Packages"}) {
        if (!time)
            time = modificationTimeOf(directory / name);
    }
    return time;
}

}  // namespace

std::string rpmPackageFormat() {
    return packageFormat("%{",
                         {"NAME", "EPOCH", "VERSION", "RELEASE", "ARCH", "VENDOR", "PACKAGER",
                          "GROUP", "LONGSIZE", "INSTALLTIME", "SUMMARY"},
                         "}");
}

std::vector<SoftwarePackage> parseRpmPackages(std::string_view listing) {
    std::vector<SoftwarePackage> packages;
    for (const auto& fields : packageRecords(listing, kFieldCount)) {
        if (!fields[kName].empty() && fields[kName] != kSigningKey)
            packages.push_back(packageOf(fields));
    }
    return packages;
}

Fact<std::vector<SoftwarePackage>> readRpmPackages(const std::filesystem::path& directory,
                                                   const std::filesystem::path& rpm) {
    if (const auto written = databaseTimeOf(directory); !written)
        return written.reason();
    return outputOf(rpm, {"--dbpath", std::filesystem::absolute(directory).string(), "-qa",
                          "--queryformat", rpmPackageFormat()})
        .then([](const std::string& listing) { return std::optional(parseRpmPackages(listing)); });
}

}  // namespace cimomd
