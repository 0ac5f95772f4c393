#include "bench/programs/AnswerReader.h"

#include <algorithm>
#include <cstdlib>
#include <stdexcept>

namespace bench {

namespace {

constexpr std::size_t kPieceSize = 65536;

std::string request(std::string_view method, std::string_view className) {
    const std::string body =
        "<?xml version=\"1.0\" encoding=\"utf-8\"?><CIM CIMVERSION=\"2.0\" DTDVERSION=\"2.0\">"
        "<MESSAGE ID=\"1\" PROTOCOLVERSION=\"1.0\"><SIMPLEREQ><IMETHODCALL NAME=\"" +
        std::string(method) +
        "\"><LOCALNAMESPACEPATH><NAMESPACE NAME=\"root\"/><NAMESPACE NAME=\"cimv2\"/>"
        "</LOCALNAMESPACEPATH><IPARAMVALUE NAME=\"ClassName\"><CLASSNAME NAME=\"" +
        std::string(className) +
        "\"/></IPARAMVALUE><IPARAMVALUE NAME=\"LocalOnly\"><VALUE>FALSE</VALUE></IPARAMVALUE>"
        "</IMETHODCALL></SIMPLEREQ></MESSAGE></CIM>";
    return "POST /cimom HTTP/1.1\r\nHost: localhost\r\nContent-Type: application/xml\r\n"
           "CIMOperation: MethodCall\r\nContent-Length: " +
           std::to_string(body.size()) + "\r\n\r\n" + body;
}

}  // namespace

AnswerReader::AnswerReader(const std::string& socketPath)
    : socket(LocalSocket::connectTo(socketPath)), buffer(kPieceSize) {}

void AnswerReader::ask(std::string_view method, std::string_view className, const BodySink& sink) {
    if (!socket.send(request(method, className)) || takeLine() != "HTTP/1.1 200 OK") {
        throw std::runtime_error("the server refuses " + std::string(className));
    }
    while (!takeLine().empty()) {
    }
    for (;;) {
        const std::size_t size = std::strtoul(std::string(takeLine()).c_str(), nullptr, 16);
        if (size != 0) {
            passChunk(size, sink);
        }
        if (!takeLine().empty()) {
            throw std::runtime_error("the answer's chunks are broken");
        }
        if (size == 0) {
            return;
        }
    }
}

void AnswerReader::passChunk(std::size_t size, const BodySink& sink) {
    while (size != 0) {
        if (unread.empty()) {
            receive();
        }
        const std::string_view piece = unread.substr(0, std::min(size, unread.size()));
        sink(piece);
        size -= piece.size();
        unread.remove_prefix(piece.size());
    }
}

void AnswerReader::receive() {
    unread = {buffer.data(), socket.receive(buffer.data(), buffer.size())};
    if (unread.empty()) {
        throw std::runtime_error("the answer ends early");
    }
}

// Without its end. Valid until the next call.
std::string_view AnswerReader::takeLine() {
    line.clear();
    while (line.empty() || line.back() != '\n') {
        if (unread.empty()) {
            receive();
        }
        line += unread.front();
        unread.remove_prefix(1);
    }
    line.resize(line.size() - 2);
    return line;
}

}  // namespace bench
