// Parses any bytes as an inventory script and asks for everything that it may hold. Only the CIM
// library's exceptions may come out.

#include <sys/mman.h>
#include <unistd.h>

#include <cstddef>
#include <cstdint>
#include <string>

#include "CimScriptParser/CimScriptParser.h"
#include "Require.h"

namespace {

using namespace Pegasus;

template <typename Question>
void ask(Question question) {
    try {
        question();
    } catch (const Exception&) {
        // What a script may say wrongly; the caller abandons the script.
    }
}

void query(const CimScriptParser& parser) {
    const int count = static_cast<int>(parser.getNumberOfClasses());
    require(count <= 10);
    for (int slot = -1; slot <= count; ++slot) {
        const bool inside = slot >= 0 && slot < count;
        const String name = parser.getClassName(slot);
        require((name.size() != 0) == inside);
        require(!inside || parser.getClassIndex(name) <= slot);
        ask([&] { parser.getNamespace(slot); });
        ask([&] { require(parser.getPropertyList(slot).isNull() == !inside); });
    }
    require(parser.getTitle().size() != 0);
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const int file = memfd_create("script", MFD_CLOEXEC);
    require(file >= 0);
    require(write(file, data, size) == static_cast<ssize_t>(size));
    CimScriptParser parser(String(("/proc/self/fd/" + std::to_string(file)).c_str()));
    bool parsed = false;
    ask([&] {
        parser.parse();
        parsed = true;
    });
    close(file);
    if (parsed) {
        query(parser);
    }
    return 0;
}
