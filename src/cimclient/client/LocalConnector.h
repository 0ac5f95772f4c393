// Finds the CIM server of this machine and connects to it.

#pragma once

#include <sys/types.h>

#include <memory>

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

/// Connects to the socket that CIM_LOCAL_SOCKET names or, without it, to the first of the places
/// that answers or, when the machine has none of the places' sockets and programs, to an object
/// manager started as a child. CIM_EMBEDDED=never forbids the last, CIM_COMMAND names the program
/// to start. Sockets and peers of other users than root and the effective user are not trusted.
///
/// Throws CannotConnectException when there is no such server, ConnectionTimeoutException when
/// connecting took until the deadline.
ServerConnection connectToLocalServer(const ServerPlaces& places, const Deadline& deadline);

}  // namespace Pegasus
