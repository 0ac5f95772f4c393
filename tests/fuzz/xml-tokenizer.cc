// Fuzzes the XML tokenizer: any octets end in tokens or an XmlError, and in the same ones whether
// they arrive at once or one by one.

#include "xml/XmlTokenizer.h"

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <string>
#include <string_view>

#include "xml/MemorySource.h"

namespace {

using Pegasus::XmlTokenizer;

std::string outcome(std::string_view document, std::size_t pieceSize) {
    Pegasus::MemorySource source(document, pieceSize);
    // Small limits, so that they are met.
    XmlTokenizer::Limits limits;
    limits.tokenSize = 200;
    limits.depth = 8;
    limits.attributes = 5;
    XmlTokenizer tokenizer(source, limits);
    std::string tokens;
    try {
        XmlTokenizer::Token token = tokenizer.next();
        while (token != XmlTokenizer::Token::End) {
            tokens += std::to_string(static_cast<int>(token)) + "@";
            tokens += std::to_string(tokenizer.offset()) + ":";
            if (token == XmlTokenizer::Token::Text || token == XmlTokenizer::Token::CData) {
                tokens += tokenizer.text();
            } else {
                tokens += tokenizer.name();
            }
            if (token == XmlTokenizer::Token::StartElement) {
                for (const XmlTokenizer::Attribute& attribute : tokenizer.attributes()) {
                    tokens.append(" ").append(attribute.name).append("=").append(attribute.value);
                }
            }
            token = tokenizer.next();
        }
    } catch (const Pegasus::XmlError& error) {
        tokens += error.message;
    }
    return tokens;
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const std::string_view document(reinterpret_cast<const char*>(data), size);
    if (outcome(document, size + 1) != outcome(document, 1)) {
        std::abort();
    }
    return 0;
}
