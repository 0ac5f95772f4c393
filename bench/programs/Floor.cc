// The least that reading an inventory can cost.
//
//   floor copy|parse CLASS...
//
// Asks the server at CIM_LOCAL_SOCKET for the class and the instances of each CLASS. `copy` drops
// the bytes; `parse` has expat parse them and does nothing about what it finds. Prints how many
// bytes the answers had.

#include <expat.h>

#include <cstdio>
#include <cstdlib>
#include <memory>
#include <stdexcept>
#include <string>
#include <string_view>

#include "bench/programs/AnswerReader.h"

namespace {

using bench::AnswerReader;

void onStart(void*, const XML_Char*, const XML_Char**) {}
void onEnd(void*, const XML_Char*) {}
void onText(void*, const XML_Char*, int) {}

std::size_t copyAnswer(AnswerReader& reader, const char* method, const char* className) {
    std::size_t bytes = 0;
    reader.ask(method, className, [&](std::string_view piece) { bytes += piece.size(); });
    return bytes;
}

std::size_t parseAnswer(AnswerReader& reader, const char* method, const char* className) {
    const std::unique_ptr<XML_ParserStruct, decltype(&XML_ParserFree)> parser(
        XML_ParserCreate(nullptr), &XML_ParserFree);
    XML_SetElementHandler(parser.get(), onStart, onEnd);
    XML_SetCharacterDataHandler(parser.get(), onText);
    std::size_t bytes = 0;
    const auto parse = [&](std::string_view piece, int isLast) {
        bytes += piece.size();
        if (XML_Parse(parser.get(), piece.data(), static_cast<int>(piece.size()), isLast) !=
            XML_STATUS_OK) {
            throw std::runtime_error("the answer is not well-formed");
        }
    };
    reader.ask(method, className, [&](std::string_view piece) { parse(piece, XML_FALSE); });
    parse("", XML_TRUE);
    return bytes;
}

}  // namespace

int main(int argc, char** argv) {
    try {
        const std::string_view way = argc > 2 ? argv[1] : "";
        const char* socketPath = std::getenv("CIM_LOCAL_SOCKET");
        if ((way != "copy" && way != "parse") || socketPath == nullptr) {
            throw std::runtime_error("usage: CIM_LOCAL_SOCKET=PATH floor copy|parse CLASS...");
        }
        const auto read = way == "copy" ? copyAnswer : parseAnswer;
        AnswerReader reader(socketPath);
        std::size_t bytes = 0;
        for (int i = 2; i < argc; ++i) {
            bytes += read(reader, "GetClass", argv[i]);
            bytes += read(reader, "EnumerateInstances", argv[i]);
        }
        std::printf("%zu bytes\n", bytes);
        return 0;
    } catch (const std::exception& error) {
        std::fprintf(stderr, "floor: %s\n", error.what());
        return 1;
    }
}
