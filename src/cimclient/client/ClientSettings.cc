#include "client/ClientSettings.h"

#include "client/MemoryBoundedSource.h"

namespace Pegasus {

ClientSettings ClientSettings::standard() {
    ClientSettings settings;
    settings.places = ServerPlaces::standard();
    settings.authenticationDirectories = {"/var/tmp", "/var/opt/tog-pegasus/cache/localauth",
                                          "/var/lib/Pegasus/cache/localauth",
                                          "/run/cimomd/localauth"};
    settings.memoryLimit = memoryForOneAnswer();
    return settings;
}

}  // namespace Pegasus
