#include "support/RequestReader.h"

#include <poll.h>
#include <sys/socket.h>

#include <array>
#include <cstdlib>

namespace support {

namespace {

std::string between(const std::string& text, const std::string& before, const std::string& after,
                    std::size_t& position) {
    const std::size_t found = text.find(before, position);
    if (found == std::string::npos) {
        position = found;
        return "";
    }
    const std::size_t start = found + before.size();
    const std::size_t end = text.find(after, start);
    position = end;
    return end == std::string::npos ? "" : text.substr(start, end - start);
}

std::string firstBetween(const std::string& text, const std::string& before,
                         const std::string& after) {
    std::size_t position = 0;
    return between(text, before, after, position);
}

std::string namespaceOf(const std::string& body) {
    std::string joined;
    std::size_t position = 0;
    for (;;) {
        const std::string part = between(body, "<NAMESPACE NAME=\"", "\"", position);
        if (position == std::string::npos) {
            return joined;
        }
        joined += (joined.empty() ? "" : "/") + part;
    }
}

}  // namespace

bool RequestReader::waitForOctets() {
    if (!unread.empty()) {
        return true;
    }
    std::array<pollfd, 2> descriptors = {pollfd{connection, POLLIN, 0},
                                         pollfd{stopDescriptor, POLLIN, 0}};
    if (poll(descriptors.data(), descriptors.size(), -1) < 0 || descriptors[1].revents != 0) {
        return false;
    }
    char octet = 0;
    return recv(connection, &octet, 1, MSG_PEEK) == 1;
}

bool RequestReader::fill() {
    std::array<pollfd, 2> descriptors = {pollfd{connection, POLLIN, 0},
                                         pollfd{stopDescriptor, POLLIN, 0}};
    if (poll(descriptors.data(), descriptors.size(), -1) < 0 || descriptors[1].revents != 0) {
        return false;
    }
    std::array<char, 65536> buffer{};
    const ssize_t count = recv(connection, buffer.data(), buffer.size(), 0);
    if (count <= 0) {
        return false;
    }
    unread.append(buffer.data(), static_cast<std::size_t>(count));
    return true;
}

std::optional<RecordedRequest> RequestReader::next() {
    std::size_t headEnd = 0;
    while ((headEnd = unread.find("\r\n\r\n")) == std::string::npos) {
        if (!fill()) {
            return std::nullopt;
        }
    }
    RecordedRequest request;
    request.headers = unread.substr(0, headEnd);
    const std::size_t length = std::strtoul(request.header("Content-Length").c_str(), nullptr, 10);
    while (unread.size() < headEnd + 4 + length) {
        if (!fill()) {
            return std::nullopt;
        }
    }
    request.body = unread.substr(headEnd + 4, length);
    unread.erase(0, headEnd + 4 + length);

    request.method = firstBetween(request.body, "<IMETHODCALL NAME=\"", "\"");
    request.className = firstBetween(request.body, "<CLASSNAME NAME=\"", "\"");
    request.namespaceName = namespaceOf(request.body);
    request.messageId = firstBetween(request.body, "<MESSAGE ID=\"", "\"");
    return request;
}

}  // namespace support
