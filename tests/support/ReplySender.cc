#include "support/ReplySender.h"

#include <poll.h>
#include <sys/socket.h>

#include <array>
#include <string>

namespace support {

namespace {

bool sendAll(int connection, const char* octets, std::size_t count) {
    while (count > 0) {
        const ssize_t sent = send(connection, octets, count, MSG_NOSIGNAL);
        if (sent <= 0) {
            return false;
        }
        octets += sent;
        count -= static_cast<std::size_t>(sent);
    }
    return true;
}

// True after the whole pause, false at the stop.
bool pauseFor(int stopDescriptor, unsigned milliseconds) {
    pollfd descriptor = {stopDescriptor, POLLIN, 0};
    return poll(&descriptor, 1, static_cast<int>(milliseconds)) == 0;
}

void waitForTheEnd(int connection, int stopDescriptor) {
    for (;;) {
        std::array<pollfd, 2> descriptors = {pollfd{connection, POLLIN, 0},
                                             pollfd{stopDescriptor, POLLIN, 0}};
        if (poll(descriptors.data(), descriptors.size(), -1) < 0 || descriptors[1].revents != 0) {
            return;
        }
        std::array<char, 4096> ignored{};
        if (recv(connection, ignored.data(), ignored.size(), 0) <= 0) {
            return;
        }
    }
}

}  // namespace

bool sendReply(int connection, int stopDescriptor, const Reply& reply,
               const RecordedRequest& request) {
    if (reply.staysSilent()) {
        waitForTheEnd(connection, stopDescriptor);
        return false;
    }
    const std::string octets = reply.render(request);
    if (reply.millisecondsPerByte() == 0) {
        return sendAll(connection, octets.data(), octets.size()) && !reply.closesAfterwards();
    }
    for (const char octet : octets) {
        if (!sendAll(connection, &octet, 1) ||
            !pauseFor(stopDescriptor, reply.millisecondsPerByte())) {
            return false;
        }
    }
    return !reply.closesAfterwards();
}

}  // namespace support
