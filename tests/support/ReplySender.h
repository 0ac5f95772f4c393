#pragma once

// Sends a scripted reply on a connection.

#include "support/RecordedRequest.h"
#include "support/Reply.h"

namespace support {

// Returns whether the connection stays open for another request. A silent reply waits for the peer
// to close. Waiting ends when stopDescriptor becomes readable; -1: never.
bool sendReply(int connection, int stopDescriptor, const Reply& reply,
               const RecordedRequest& request);

}  // namespace support
