// Where CIM servers are known to be on a machine.

#pragma once

#include <string>
#include <vector>

namespace Pegasus {

struct ServerPlaces {
    /// Sockets that servers listen at, in the order in which they are tried.
    std::vector<std::string> sockets;
    /// Programs whose presence tells that a server is installed, running or not.
    std::vector<std::string> programs;
    /// The object managers that may be started as a child; the first that exists is.
    std::vector<std::string> embeddedPrograms;

    /// The places of this machine and of this installation.
    static ServerPlaces standard();
};

}  // namespace Pegasus
