#pragma once

// Whole files in and out, octet for octet.

#include <string>

namespace support {

// Throws std::runtime_error when the file cannot be read.
std::string readFile(const std::string& path);
// Makes or replaces the file; its directory must exist. Throws std::runtime_error on failure.
void writeFile(const std::string& path, const std::string& bytes);
bool fileExists(const std::string& path);

}  // namespace support
