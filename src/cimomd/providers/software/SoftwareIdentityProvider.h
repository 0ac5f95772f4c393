#pragma once

// The packages that are installed. Reads the databases of dpkg and of RPM with their own tools.

#include "providers/Provider.h"
#include "system/SystemCalls.h"
#include "system/SystemPaths.h"
#include "system/software/SoftwarePackage.h"

namespace cimomd {

/// The programs that list packages.
struct PackageTools {
    std::filesystem::path dpkgQuery = "/usr/bin/dpkg-query";
    std::filesystem::path rpm = "/usr/bin/rpm";
};

class SoftwareIdentityProvider : public Provider {
  public:
    static constexpr const char* kClassName = "Velmira_SoftwareIdentity";

    /// `systemCalls` must outlive the provider.
    SoftwareIdentityProvider(SystemPaths systemPaths, const SystemCalls& systemCalls,
                             PackageTools packageTools = {})
        : paths(std::move(systemPaths)), calls(systemCalls), tools(std::move(packageTools)) {}

    const char* className() const override { return kClassName; }
    /// Without instances when no database can be read.
    std::unique_ptr<InstanceStream> enumerate() const override;

    /// `utcOffsetMinutes` is that of the package's install time.
    static ProvidedInstance publish(const SoftwarePackage& package, int utcOffsetMinutes);

  private:
    struct Listing {
        std::vector<SoftwarePackage> packages;
        /// Set when a database could not be read, or there is none.
        std::optional<Absence> whyNotAll;
    };
    Listing read() const;

    SystemPaths paths;
    const SystemCalls& calls;
    PackageTools tools;
};

}  // namespace cimomd
