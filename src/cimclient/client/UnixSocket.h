// Client ends of Unix domain stream sockets.

#pragma once

#include <sys/types.h>

#include <chrono>
#include <optional>
#include <string>

#include "client/Deadline.h"
#include "client/FileDescriptor.h"

namespace Pegasus {

/// Whether a path that is a symbolic link itself may be connected to.
enum class FinalLink { Follow, Refuse };

/// The result of an attempt to connect: a descriptor that does not block, or the reason why not.
struct ConnectResult {
    FileDescriptor socket;
    int error = 0;  // errno, ETIMEDOUT at the deadline; 0 when connected
};

/// Connects to the socket at `path`, which may be longer than a socket address holds. A queue of
/// the server that is full is tried again until the deadline.
ConnectResult connectUnixSocket(const std::string& path, FinalLink finalLink,
                                const Deadline& deadline);

/// The user that the process at the other end had when it began to listen; none when unknown.
std::optional<uid_t> peerUserOf(const FileDescriptor& socket);

/// Whether the connection is open with nothing to read, and stays so for the time of grace (below a
/// second): nothing was lost, nothing is left over.
bool isIdle(const FileDescriptor& socket,
            std::chrono::microseconds grace = std::chrono::microseconds::zero());

}  // namespace Pegasus
