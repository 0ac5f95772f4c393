#include "script/Places.h"

#include <Velm/PlatformUtilities.h>
#include <stdlib.h>

#include <string_view>

#ifndef VELM_CONFIG_FILE
#error "VELM_CONFIG_FILE must be defined"
#endif

namespace sennetctl {

namespace {

constexpr const char* kMifKey = "mif.directory";
constexpr const char* kSqlKey = "sql.directory";

std::string directoryOf(const OutputPlace& output) {
    return std::string_view(output.generalKey) == kSqlKey
               ? Velm::PlatformUtilities::getSQLOutputDirectory(output.product)
               : Velm::PlatformUtilities::getMIFOutputDirectory(output.product);
}

}  // namespace

std::vector<OutputPlace> outputPlaces() {
    return {{kMifKey, "SMS"}, {kMifKey, "LD"}, {kMifKey, "CA"}, {kMifKey, "QVE"}, {kSqlKey, "QVE"}};
}

Places placesInUse() {
    Places places;
    const char* named = ::secure_getenv("VELM_CONFIG");
    places.isConfigured = named != nullptr && *named != '\0';
    places.configuration = places.isConfigured ? named : VELM_CONFIG_FILE;
    places.scriptDirectory = Velm::PlatformUtilities::getSennetDirectory();
    places.resources = Velm::PlatformUtilities::getSennetResourceFile();
    for (const OutputPlace& output : outputPlaces()) {
        places.outputs.emplace_back(output.key(), directoryOf(output));
    }
    return places;
}

}  // namespace sennetctl
