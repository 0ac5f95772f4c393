#pragma once

// The packages of dpkg's database, as dpkg-query lists them.

#include <filesystem>
#include <string_view>
#include <vector>

#include "system/software/SoftwarePackage.h"

namespace cimomd {

/// The installed ones of a listing by `debianPackageFormat`, in its order. Versions
/// of dpkg-query before 1.19.3 leave the install times out.
std::vector<SoftwarePackage> parseDebianPackages(std::string_view listing);

/// What dpkg-query is asked to write of each package.
std::string debianPackageFormat();

/// The installed packages of the database in `directory`, listed by the program `dpkgQuery`, which
/// runs only when there is a database. The time of its list of files is a package's install time.
Fact<std::vector<SoftwarePackage>> readDebianPackages(const std::filesystem::path& directory,
                                                      const std::filesystem::path& dpkgQuery);

}  // namespace cimomd
