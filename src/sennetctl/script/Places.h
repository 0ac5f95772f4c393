#pragma once

// Where sennet reads what an administrator writes, and writes what it makes.

#include <string>
#include <utility>
#include <vector>

namespace sennetctl {

struct Places {
    std::string configuration;    ///< velm.properties
    bool isConfigured = false;    ///< VELM_CONFIG names it, so that it ought to be there
    std::string scriptDirectory;  ///< as the configuration has it, or its default
    std::string resources;        ///< likewise, sennet.properties
    /// Keys of the configuration and the directories of output files that they, or what stands in
    /// for them, come to.
    std::vector<std::pair<std::string, std::string>> outputs = {};
};

/// A kind of output files of one product.
struct OutputPlace {
    const char* generalKey;  ///< in the configuration, for all products
    const char* product;     ///< without its slash

    /// The one of this product, which wins.
    std::string key() const { return std::string(generalKey) + '.' + product; }
};

/// All there are.
std::vector<OutputPlace> outputPlaces();

/// Those of this process.
Places placesInUse();

}  // namespace sennetctl
