#include "system/software/DebianPackages.h"

#include "files/FileTime.h"
#include "files/TextFields.h"
#include "system/BoundedCommand.h"
#include "system/Narrowing.h"
#include "system/software/PackageRecords.h"

namespace cimomd {
namespace {

// In the order of debianPackageFormat.
enum Field : std::size_t {
    kStatus,
    kName,
    kArchitecture,
    kVersion,
    kMaintainer,
    kSection,
    kInstalledSize,
    kSummary,
    kListTime,
    kFieldCount
};

std::string_view withoutEpoch(std::string_view version) {
    const std::size_t colon = version.find(':');
    return colon == std::string_view::npos ? version : version.substr(colon + 1);
}

std::string_view withoutRevision(std::string_view version) {
    return version.substr(0, version.rfind('-'));
}

SoftwarePackage packageOf(const std::vector<std::string_view>& fields) {
    SoftwarePackage out;
    out.format = PackageFormat::Debian;
    out.name = fields[kName];
    out.architecture = fields[kArchitecture];
    out.identity = out.name + ":" + out.architecture;
    out.version = fields[kVersion];
    out.upstreamVersion = withoutRevision(withoutEpoch(fields[kVersion]));
    out.manufacturer = packageField(fields[kMaintainer]);
    out.section = packageField(fields[kSection]);
    out.summary = packageField(fields[kSummary]);
    out.installedKB = packageField(fields[kInstalledSize]).then(parseUnsigned);
    out.installTime = packageField(fields[kListTime])
                          .then(parseUnsigned)
                          .then(narrowedTo<std::int64_t, std::uint64_t>);
    return out;
}

/// A package of which several architectures can be installed has a list for each of them.
Fact<std::int64_t> installTimeOf(const SoftwarePackage& package,
                                 const std::filesystem::path& infoDirectory) {
    const Fact<std::int64_t> time =
        modificationTimeOf(infoDirectory / (package.identity + ".list"));
    return time ? time : modificationTimeOf(infoDirectory / (package.name + ".list"));
}

}  // namespace

std::string debianPackageFormat() {
    return packageFormat("${",
                         {"db:Status-Status", "Package", "Architecture", "Version", "Maintainer",
                          "Section", "Installed-Size", "binary:Summary", "db-fsys:Last-Modified"},
                         "}");
}

std::vector<SoftwarePackage> parseDebianPackages(std::string_view listing) {
    const auto records = packageRecords(listing, kFieldCount);
    std::vector<SoftwarePackage> packages;
    packages.reserve(records.size());
    for (const auto& fields : records) {
        if (fields[kStatus] == "installed" && !fields[kName].empty())
            packages.push_back(packageOf(fields));
    }
    return packages;
}

Fact<std::vector<SoftwarePackage>> readDebianPackages(const std::filesystem::path& directory,
                                                      const std::filesystem::path& dpkgQuery) {
    if (const auto written = modificationTimeOf(directory / "status"); !written)
        return written.reason();
    const Fact<std::string> listing = outputOf(
        dpkgQuery, {"--admindir=" + directory.string(), "-W", "-f=" + debianPackageFormat()});
    if (!listing)
        return listing.reason();
    std::vector<SoftwarePackage> packages = parseDebianPackages(*listing);
    for (SoftwarePackage& package : packages) {
        // dpkg-query tells it since 1.19.3.
        if (!package.installTime)
            package.installTime = installTimeOf(package, directory / "info");
    }
    return packages;
}

}  // namespace cimomd
