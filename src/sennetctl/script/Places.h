#pragma once

// Where sennet reads what an administrator writes.

#include <string>

namespace sennetctl {

struct Places {
    std::string configuration;    ///< velm.properties
    bool isConfigured = false;    ///< VELM_CONFIG names it, so that it ought to be there
    std::string scriptDirectory;  ///< as the configuration has it, or its default
    std::string resources;        ///< likewise, sennet.properties
};

/// Those of this process.
Places placesInUse();

}  // namespace sennetctl
