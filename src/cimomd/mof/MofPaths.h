#pragma once

// The paths in MOF pragmas, which are written on many systems.

#include <filesystem>
#include <string>
#include <string_view>

namespace cimomd {

/// The file that an include in a file of `directory` names. Backslashes divide names as slashes do.
/// Where there is no such file, one whose name differs only by case is taken.
std::filesystem::path includedFile(const std::filesystem::path& directory, std::string_view text);

/// The namespace in a text such as root/cimv2, \\.\root\cimv2 or http://host/root/cimv2, with
/// slashes; what comes out of other texts is no namespace name.
std::string namespaceIn(std::string_view text);

}  // namespace cimomd
