#pragma once

// The packages of an RPM database, as rpm lists them.

#include <filesystem>
#include <string_view>
#include <vector>

#include "system/software/SoftwarePackage.h"

namespace cimomd {

/// The packages of a listing by `rpmPackageFormat`, in its order. Imported signing keys, which the
/// database keeps among the packages, are left out.
std::vector<SoftwarePackage> parseRpmPackages(std::string_view listing);

/// What rpm is asked to write of each package.
std::string rpmPackageFormat();

/// The packages of the database in `directory`, listed by the program `rpm`, which runs only when
/// there is a database.
Fact<std::vector<SoftwarePackage>> readRpmPackages(const std::filesystem::path& directory,
                                                   const std::filesystem::path& rpm);

}  // namespace cimomd
