#include "bench/synthetic/ReadyAnswer.h"

#include <array>
#include <cstdio>

#include "bench/synthetic/SyntheticXml.h"

namespace bench {

namespace {

constexpr std::size_t kChunkSize = 65536;

std::string chunkSize(std::size_t size) {
    std::array<char, 20> line{};
    std::snprintf(line.data(), line.size(), "%zx\r\n", size);
    return line.data();
}

}  // namespace

void ReadyAnswer::append(std::string_view xml) {
    pending += xml;
    while (pending.size() >= kChunkSize) {
        writeChunk(kChunkSize);
    }
}

void ReadyAnswer::finish() {
    append(answerEnd());
    if (!pending.empty()) {
        writeChunk(pending.size());
    }
    chunks += "0\r\n\r\n";
}

void ReadyAnswer::writeChunk(std::size_t size) {
    chunks += chunkSize(size);
    chunks.append(pending, 0, size);
    chunks += "\r\n";
    pending.erase(0, size);
}

std::string ReadyAnswer::beginning(std::string_view messageId) const {
    const std::string opening = answerOpening(messageId, method);
    return "HTTP/1.1 200 OK\r\nContent-Type: application/xml; charset=utf-8\r\n"
           "transfer-encoding: chunked\r\nCIMOperation: MethodResponse\r\n"
           "Trailer: CIMStatusCode, CIMStatusCodeDescription, Content-Language\r\n\r\n" +
           chunkSize(opening.size()) + opening + "\r\n";
}

}  // namespace bench
