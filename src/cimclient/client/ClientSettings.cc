#include "client/ClientSettings.h"

#include "client/MemoryBudget.h"

namespace Pegasus {

ClientSettings ClientSettings::standard() {
    ClientSettings settings;
    settings.places = ServerPlaces::standard();
    settings.authenticationDirectories = {"/var/tmp", "/var/opt/tog-pegasus/cache/localauth",
                                          "/var/lib/Pegasus/cache/localauth",
                                          "/run/cimomd/localauth"};
    settings.memoryLimit = memoryForAnswers();
    return settings;
}

}  // namespace Pegasus
