#include "client/ClientSettings.h"

namespace Pegasus {

ClientSettings ClientSettings::standard() {
    ClientSettings settings;
    settings.places = ServerPlaces::standard();
    settings.authenticationDirectories = {"/var/tmp", "/var/opt/tog-pegasus/cache/localauth",
                                          "/var/lib/Pegasus/cache/localauth",
                                          "/run/cimomd/localauth"};
    return settings;
}

}  // namespace Pegasus
