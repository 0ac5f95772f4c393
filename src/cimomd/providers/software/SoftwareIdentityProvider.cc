#include "providers/software/SoftwareIdentityProvider.h"

#include <algorithm>
#include <iterator>
#include <tuple>

#include "providers/CimTime.h"
#include "providers/EnumeratedValues.h"
#include "providers/InstanceBuilder.h"
#include "providers/RecordStream.h"
#include "system/software/DebianPackages.h"
#include "system/software/RpmPackages.h"
#include "system/software/VersionNumbers.h"

namespace cimomd {
namespace {

using Pegasus::Uint16;
using Pegasus::Uint32;

constexpr Uint16 kResourceTypeRpm = 3;
constexpr Uint16 kResourceTypeDebian = 8;
constexpr Uint16 kClassificationOther = 1;
constexpr std::size_t kShortTextLength = 64;

bool isDebian(const SoftwarePackage& package) {
    return package.format == PackageFormat::Debian;
}

auto orderOf(const SoftwarePackage& package) {
    return std::tie(package.format, package.identity);
}

void sortAndUnite(std::vector<SoftwarePackage>& packages) {
    std::sort(packages.begin(), packages.end(),
              [](const auto& a, const auto& b) { return orderOf(a) < orderOf(b); });
    packages.erase(
        std::unique(packages.begin(), packages.end(),
                    [](const auto& a, const auto& b) { return orderOf(a) == orderOf(b); }),
        packages.end());
}

Fact<std::vector<Uint16>> classificationsOf(const SoftwarePackage& package) {
    return package.section.then(
        [](const std::string&) { return std::optional(std::vector{kClassificationOther}); });
}

Fact<std::vector<std::string>> classificationTextsOf(const SoftwarePackage& package) {
    return package.section.then(
        [](const std::string& section) { return std::optional(std::vector{section}); });
}

}  // namespace

Fact<std::vector<SoftwarePackage>> SoftwareIdentityProvider::read() const {
    std::vector<SoftwarePackage> packages;
    Absence reason = Absence::Absent;
    const auto take = [&](Fact<std::vector<SoftwarePackage>> found) {
        if (found)
            std::move((*found).begin(), (*found).end(), std::back_inserter(packages));
        else if (found.reason() != Absence::Absent)
            reason = found.reason();
        return found.has_value();
    };
    bool isAnyThere = take(readDebianPackages(paths.debianPackages(), tools.dpkgQuery));
    for (const auto& directory : {paths.rpmPackages(), paths.vendorRpmPackages()})
        isAnyThere = take(readRpmPackages(directory, tools.rpm)) || isAnyThere;
    if (!isAnyThere)
        return reason;
    sortAndUnite(packages);
    return packages;
}

std::unique_ptr<InstanceStream> SoftwareIdentityProvider::enumerate() const {
    Fact<std::vector<SoftwarePackage>> packages = read();
    if (!packages)
        return std::make_unique<EmptyStream>(packages.reason());
    return std::make_unique<RecordStream<SoftwarePackage>>(
        std::move(*packages), [&clock = calls](const SoftwarePackage& package) {
            const std::int64_t time = package.installTime.value_or(0);
            return publish(package, clock.utcOffsetMinutes(time));
        });
}

ProvidedInstance SoftwareIdentityProvider::publish(const SoftwarePackage& package,
                                                   int utcOffsetMinutes) {
    const VersionNumbers numbers = versionNumbersOf(package.upstreamVersion);
    InstanceBuilder builder(kClassName);
    builder.label(package.summary.value_or(package.name))
        .text("Name", package.name)
        .values<Uint16>("OperationalStatus", {kOperationalOk})
        .key("InstanceID", (isDebian(package) ? "Velmira:deb:" : "Velmira:rpm:") + package.identity)
        .value<Uint16>("MajorVersion", numbers.major)
        .value<Uint16>("MinorVersion", numbers.minor)
        .value<Uint16>("RevisionNumber", numbers.revision)
        .value<Uint16>("BuildNumber", numbers.build)
        .text("VersionString", package.version)
        .text("Manufacturer", package.manufacturer)
        .values<Uint16>("Classifications", classificationsOf(package))
        .texts("ClassificationDescriptions", classificationTextsOf(package))
        .value<Pegasus::Boolean>("IsEntity", true)
        .value<Uint16>("ExtendedResourceType",
                       isDebian(package) ? kResourceTypeDebian : kResourceTypeRpm)
        .value<Pegasus::CIMDateTime>(
            "InstallDate", package.installTime.then([utcOffsetMinutes](std::int64_t time) {
                return cimTimeOf(time, utcOffsetMinutes);
            }))
        .text("Architecture", package.architecture, kShortTextLength)
        .value<Uint32>("InstalledSizeKB", package.installedKB.then([](std::uint64_t size) {
            return size > INT32_MAX ? std::nullopt : std::optional(static_cast<Uint32>(size));
        }));
    return builder.take();
}

}  // namespace cimomd
