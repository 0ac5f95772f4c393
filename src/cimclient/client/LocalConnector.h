// Finds the CIM server of this machine and connects to it.

#pragma once

#include <sys/types.h>

#include <memory>
#include <optional>
#include <string>
#include <vector>

#include "client/ChildProcess.h"
#include "client/Deadline.h"
#include "client/FileDescriptor.h"
#include "client/ServerPlaces.h"

namespace Pegasus {

/// An open connection to a trusted server.
struct ServerConnection {
    /// The server, when it was started for this connection. Declared before the socket: a child
    /// is waited for, and it ends when the socket is closed.
    std::unique_ptr<ChildProcess> child;
    FileDescriptor socket;
    uid_t serverUser = 0;

    void close() {
        socket.reset();
        child.reset();
    }
};

/// What became of one place where a server was looked for.
struct TriedPlace {
    std::string path;            ///< a socket or a program
    std::optional<uid_t> owner;  ///< of what stands there, as far as it can be seen
    std::string result;          ///< for people; begins without a capital
    bool chosen = false;
};

/// Connects to the socket that CIM_LOCAL_SOCKET names or, without it, to the first of the places
/// that answers or, when the machine has none of the places' sockets and programs, to an object
/// manager started as a child. CIM_EMBEDDED=never forbids the last, CIM_COMMAND names the program
/// to start. Sockets and peers of other users than root and the effective user are not trusted.
///
/// Throws CannotConnectException when there is no such server, ConnectionTimeoutException when
/// connecting took until the deadline. With `tried`, which may be null, all places that were looked
/// at are appended to it, also when the function throws.
ServerConnection connectToLocalServer(const ServerPlaces& places, const Deadline& deadline,
                                      std::vector<TriedPlace>* tried = nullptr);

}  // namespace Pegasus
