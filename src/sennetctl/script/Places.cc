#include "script/Places.h"

#include <Velm/PlatformUtilities.h>
#include <stdlib.h>

#ifndef VELM_CONFIG_FILE
#error "VELM_CONFIG_FILE must be defined"
#endif

namespace sennetctl {

Places placesInUse() {
    Places places;
    const char* named = ::secure_getenv("VELM_CONFIG");
    places.isConfigured = named != nullptr && *named != '\0';
    places.configuration = places.isConfigured ? named : VELM_CONFIG_FILE;
    places.scriptDirectory = Velm::PlatformUtilities::getSennetDirectory();
    places.resources = Velm::PlatformUtilities::getSennetResourceFile();
    return places;
}

}  // namespace sennetctl
