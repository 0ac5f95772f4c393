// Tells where CIMClient::connectLocal looks for a server, and what it finds there: for programs
// that help an administrator. Only the bundled client library has it.

#pragma once

#include <optional>
#include <string>
#include <vector>

namespace Pegasus {

/// One place that was looked at.
struct LocalServerPlace {
    std::string path;               ///< a socket, or a program that is started
    std::optional<unsigned> owner;  ///< user number of what stands there; none when nothing does
    std::string result;             ///< what became of it, for people
    bool chosen = false;            ///< this is the server that connectLocal reaches
};

/// All places in the order in which they are tried, up to the one that is reached.
struct LocalServerSearch {
    std::vector<LocalServerPlace> places;
    std::string failure;  ///< why no server is reached; empty when one is
};

/// Connects as connectLocal does with this time-out, and closes the connection again. Raises
/// nothing but what the lack of memory raises.
LocalServerSearch searchLocalServer(unsigned timeoutMilliseconds);

}  // namespace Pegasus
