#include "providers/software/SoftwareIdentityProvider.h"

#include <algorithm>
#include <iterator>
#include <tuple>

#include "providers/CimTime.h"
#include "providers/EnumeratedValues.h"
#include "providers/InstanceBuilder.h"
#include "providers/RecordStream.h"
#include "system/Narrowing.h"
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
    // The packages are large: each is moved once.
    std::vector<SoftwarePackage*> order;
    order.reserve(packages.size());
    for (SoftwarePackage& package : packages)
        order.push_back(&package);
    std::sort(order.begin(), order.end(),
              [](const auto* a, const auto* b) { return orderOf(*a) < orderOf(*b); });
    order.erase(
        std::unique(order.begin(), order.end(),
                    [](const auto* a, const auto* b) { return orderOf(*a) == orderOf(*b); }),
        order.end());
    std::vector<SoftwarePackage> sorted;
    sorted.reserve(order.size());
    for (SoftwarePackage* package : order)
        sorted.push_back(std::move(*package));
    packages = std::move(sorted);
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

SoftwareIdentityProvider::Listing SoftwareIdentityProvider::read() const {
    Listing listing;
    bool isAnyThere = false;
    const auto take = [&](Fact<std::vector<SoftwarePackage>> found) {
        isAnyThere = isAnyThere || found.has_value();
        if (found && listing.packages.empty())
            listing.packages = std::move(*found);
        else if (found)
            std::move((*found).begin(), (*found).end(), std::back_inserter(listing.packages));
        else if (found.reason() != Absence::Absent)
            listing.whyNotAll = found.reason();
    };
    take(readDebianPackages(paths.debianPackages(), tools.dpkgQuery));
    for (const auto& directory : {paths.rpmPackages(), paths.vendorRpmPackages()})
        take(readRpmPackages(directory, tools.rpm));
    if (!isAnyThere && !listing.whyNotAll)
        listing.whyNotAll = Absence::Absent;
    sortAndUnite(listing.packages);
    return listing;
}

std::unique_ptr<InstanceStream> SoftwareIdentityProvider::enumerate() const {
    Listing listing = read();
    return std::make_unique<RecordStream<SoftwarePackage>>(
        std::move(listing.packages),
        [&clock = calls](const SoftwarePackage& package) {
            const std::int64_t time = package.installTime.value_or(0);
            return publish(package, clock.utcOffsetMinutes(time));
        },
        listing.whyNotAll);
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
        .value<Uint32>("InstalledSizeKB", package.installedKB.then(narrowedToCount<std::uint64_t>));
    return builder.take();
}

}  // namespace cimomd
