// What a client takes for granted about its surroundings; tests put other values in its place.

#pragma once

#include <Pegasus/Common/Config.h>

#include <cstddef>
#include <string>
#include <vector>

#include "client/ServerPlaces.h"

namespace Pegasus {

struct ClientSettings {
    ServerPlaces places;
    /// Directories in which a server may leave a secret for local authentication.
    std::vector<std::string> authenticationDirectories;
    /// Octets of one answer's body after decoding of the transfer coding.
    Uint64 bodyLimit = Uint64(4) << 30;
    /// The same of an answer that describes one class; real ones have some 60,000.
    Uint64 classBodyLimit = Uint64(16) << 20;
    /// Octets of one answer's header and trailer lines together.
    std::size_t headLimit = std::size_t{64} << 10;

    static ClientSettings standard();
};

}  // namespace Pegasus
