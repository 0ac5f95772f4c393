#include "velmclient/Configuration.h"

#include <stdlib.h>

#include <string>

#include "Velm/PropertiesFile.h"

namespace Velm {

namespace {

struct PlaceEntry {
    const char* key;
    const char* defaultPath;
};

PlaceEntry entryOf(Configuration::Place place) {
    switch (place) {
        case Configuration::Place::kSennetDirectory:
            return {"sennet.directory", VELM_SENNET_DIRECTORY};
        case Configuration::Place::kSennetResources:
            return {"sennet.resources", VELM_SENNET_RESOURCES};
        case Configuration::Place::kMifDirectory:
            return {"mif.directory", VELM_MIF_DIRECTORY};
        case Configuration::Place::kSqlDirectory:
            break;
    }
    return {"sql.directory", VELM_SQL_DIRECTORY};
}

bool isGiven(const char* text) {
    return text != nullptr && *text != '\0';
}

Properties loadConfiguration() {
    const char* named = ::secure_getenv("VELM_CONFIG");
    PropertiesFile file(isGiven(named) ? named : VELM_CONFIG_FILE);
    file.load();
    return file.getProperties();
}

}  // namespace

Configuration::Configuration() : properties(loadConfiguration()) {}

const Configuration& Configuration::instance() {
    // Never destroyed: the paths are valid to the end of the process.
    static const Configuration& configuration = *new Configuration;
    return configuration;
}

const char* Configuration::path(Place place, const char* type) const {
    const PlaceEntry entry = entryOf(place);
    if (isGiven(type)) {
        const std::string product = type[0] == '/' ? type + 1 : type;
        const char* value =
            properties.getPropertyValue((std::string(entry.key) + '.' + product).c_str());
        if (isGiven(value)) {
            return value;
        }
    }
    const char* value = properties.getPropertyValue(entry.key);
    return isGiven(value) ? value : entry.defaultPath;
}

}  // namespace Velm
