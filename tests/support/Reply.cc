#include "support/Reply.h"

#include <strings.h>

#include <algorithm>
#include <array>
#include <cstdio>
#include <string_view>

namespace support {

namespace {

const char* reasonOf(int status) {
    switch (status) {
        case 200:
            return "OK";
        case 400:
            return "Bad Request";
        case 401:
            return "Unauthorized";
        case 403:
            return "Forbidden";
        case 404:
            return "Not Found";
        case 500:
            return "Internal Server Error";
        case 501:
            return "Not Implemented";
        case 503:
            return "Service Unavailable";
        default:
            return "Other";
    }
}

std::string percentEncoded(std::string_view text) {
    std::string out;
    for (const char c : text) {
        const bool plain = (c >= 'a' && c <= 'z') || (c >= 'A' && c <= 'Z') ||
                           (c >= '0' && c <= '9') || c == '-' || c == '.' || c == '_';
        if (plain) {
            out += c;
        } else {
            std::array<char, 4> code{};
            std::snprintf(code.data(), code.size(), "%%%02X", static_cast<unsigned char>(c));
            out += code.data();
        }
    }
    return out;
}

std::string xmlEscaped(std::string_view text) {
    std::string out;
    for (const char c : text) {
        switch (c) {
            case '&':
                out += "&amp;";
                break;
            case '<':
                out += "&lt;";
                break;
            case '"':
                out += "&quot;";
                break;
            default:
                out += c;
        }
    }
    return out;
}

void replaceAll(std::string& text, std::string_view from, std::string_view to) {
    for (std::size_t at = text.find(from); at != std::string::npos;
         at = text.find(from, at + to.size())) {
        text.replace(at, from.size(), to);
    }
}

std::string message(const std::string& content) {
    return "<?xml version=\"1.0\" encoding=\"utf-8\"?>\n"
           "<CIM CIMVERSION=\"2.0\" DTDVERSION=\"2.0\"><MESSAGE ID=\"@ID@\" "
           "PROTOCOLVERSION=\"1.0\"><SIMPLERSP><IMETHODRESPONSE NAME=\"@METHOD@\">" +
           content + "</IMETHODRESPONSE></SIMPLERSP></MESSAGE></CIM>\n";
}

}  // namespace

Reply Reply::ok(std::string returnValueXml) {
    return document(message("<IRETURNVALUE>" + returnValueXml + "</IRETURNVALUE>"));
}

Reply Reply::empty() {
    return document(message(""));
}

Reply Reply::cimError(unsigned code, std::string description) {
    Reply reply = empty();
    reply.trailers.emplace_back("CIMStatusCode", std::to_string(code));
    reply.trailers.emplace_back("CIMStatusCodeDescription", percentEncoded(description));
    return reply;
}

Reply Reply::cimErrorElement(unsigned code, std::string description) {
    return document(message("<ERROR CODE=\"" + std::to_string(code) + "\" DESCRIPTION=\"" +
                            xmlEscaped(description) + "\"/>"));
}

Reply Reply::document(std::string xml) {
    Reply reply;
    reply.status = 200;
    reply.framing = Framing::Chunked;
    reply.headers = {{"Content-Type", "application/xml; charset=utf-8"},
                     {"CIMOperation", "MethodResponse"}};
    reply.body = std::move(xml);
    return reply;
}

Reply Reply::http(int status, Fields headers, std::string body) {
    Reply reply;
    reply.status = status;
    reply.framing = Framing::ContentLength;
    reply.headers = std::move(headers);
    reply.body = std::move(body);
    return reply;
}

Reply Reply::raw(std::string bytes) {
    Reply reply;
    reply.body = std::move(bytes);
    reply.close = true;
    return reply;
}

Reply Reply::closeAtOnce() {
    return raw("");
}

Reply Reply::reset() {
    Reply reply;
    reply.behaviour = Behaviour::Reset;
    return reply;
}

Reply Reply::silence() {
    Reply reply;
    reply.behaviour = Behaviour::Silence;
    return reply;
}

Reply Reply::drip(std::string bytes, unsigned millisecondsPerByte) {
    Reply reply = raw(std::move(bytes));
    reply.dripMilliseconds = millisecondsPerByte;
    return reply;
}

Reply Reply::chunkSize(std::size_t octets) const {
    Reply reply = *this;
    reply.octetsPerChunk = octets;
    return reply;
}

Reply Reply::contentLength() const {
    Reply reply = *this;
    reply.framing = Framing::ContentLength;
    return reply;
}

Reply Reply::withoutLength() const {
    Reply reply = *this;
    reply.framing = Framing::None;
    return reply;
}

Reply Reply::trailer(std::string name, std::string value) const {
    Reply reply = *this;
    reply.trailers.emplace_back(std::move(name), std::move(value));
    return reply;
}

Reply Reply::header(std::string name, std::string value) const {
    Reply reply = *this;
    std::erase_if(reply.headers, [&](const auto& field) {
        return strcasecmp(field.first.c_str(), name.c_str()) == 0;
    });
    reply.headers.emplace_back(std::move(name), std::move(value));
    return reply;
}

Reply Reply::messageId(std::string id) const {
    Reply reply = *this;
    reply.forcedMessageId = std::move(id);
    return reply;
}

Reply Reply::cutAfter(std::size_t octets) const {
    Reply reply = *this;
    reply.cut = octets;
    return reply;
}

Reply Reply::followedBy(std::string bytes) const {
    Reply reply = *this;
    reply.after = std::move(bytes);
    return reply;
}

Reply Reply::thenClose() const {
    Reply reply = *this;
    reply.close = true;
    return reply;
}

std::string Reply::head() const {
    std::string out = "HTTP/1.1 " + std::to_string(status) + " " + reasonOf(status) + "\r\n";
    for (const auto& [name, value] : headers) {
        out += name + ": " + value + "\r\n";
    }
    return out;
}

void Reply::appendChunks(std::string& out, const std::string& bytes) const {
    const std::size_t size = octetsPerChunk == 0 ? bytes.size() : octetsPerChunk;
    for (std::size_t at = 0; at < bytes.size(); at += size) {
        const std::size_t count = std::min(size, bytes.size() - at);
        std::array<char, 24> length{};
        std::snprintf(length.data(), length.size(), "%zx\r\n", count);
        out += length.data();
        out.append(bytes, at, count);
        out += "\r\n";
    }
    out += "0\r\n";
    for (const auto& [name, value] : trailers) {
        out += name + ": " + value + "\r\n";
    }
    out += "\r\n";
}

std::string Reply::render(const RecordedRequest& request) const {
    std::string content = body;
    replaceAll(content, "@ID@", forcedMessageId.empty() ? request.messageId : forcedMessageId);
    replaceAll(content, "@METHOD@", request.method);

    std::string out;
    if (status != 0) {
        out = head();
        if (framing == Framing::Chunked) {
            out += "Transfer-Encoding: chunked\r\n";
        } else if (framing == Framing::ContentLength) {
            out += "Content-Length: " + std::to_string(content.size()) + "\r\n";
        }
        out += "\r\n";
    }
    if (framing == Framing::Chunked) {
        appendChunks(out, content);
    } else {
        out += content;
    }
    out += after;
    if (cut < out.size()) {
        out.resize(cut);
    }
    return out;
}

}  // namespace support
