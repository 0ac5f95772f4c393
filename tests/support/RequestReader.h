#pragma once

// Reads HTTP requests from a connection, on the server's side of a test.

#include <optional>
#include <string>

#include "support/RecordedRequest.h"

namespace support {

class RequestReader {
  public:
    // Neither descriptor is owned. Waiting ends when stopDescriptor becomes readable; -1: never.
    RequestReader(int connection, int stopDescriptor)
        : connection(connection), stopDescriptor(stopDescriptor) {}

    // Waits until the peer has sent something. False when it closed, or at the stop.
    bool waitForOctets();
    // The next request; none when the connection ended before its end, or at the stop.
    std::optional<RecordedRequest> next();

  private:
    bool fill();

    int connection;
    int stopDescriptor;
    std::string unread;
};

}  // namespace support
