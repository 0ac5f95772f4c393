// Any bytes are a key/value file, and the key of a line put before them is found whatever follows.

#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <string>
#include <string_view>

#include "velmclient/PropertiesParser.h"

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const std::string_view input(reinterpret_cast<const char*>(data), size);
    Velm::PropertiesParser(input).parse();

    const std::string text = "a \\= key = value\n" + std::string(input);
    if (Velm::PropertiesParser(text).parse().getPropertyValue("a = key") == nullptr) {
        std::abort();
    }
    return 0;
}
