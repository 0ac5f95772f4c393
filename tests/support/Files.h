#pragma once

// Whole files in and out, octet for octet.

#include <string>
#include <string_view>
#include <vector>

namespace support {

// Throws std::runtime_error when the file cannot be read.
std::string readFile(const std::string& path);
// Makes or replaces the file; its directory must exist. Throws std::runtime_error on failure.
void writeFile(const std::string& path, std::string_view bytes);
bool fileExists(const std::string& path);
// All names in a directory, hidden ones too, in byte order; none when there is no such directory.
std::vector<std::string> namesIn(const std::string& directory);

}  // namespace support
