// Reads any octets as a MIF file or as an inventory script, whichever the first octet says, with
// the eyes of the administrator's program. Every finding must name a place within the file.

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <string_view>

#include "mif/MifLint.h"
#include "script/ScriptLint.h"
#include "script/ScriptReader.h"

namespace {

std::vector<sennetctl::Finding> findingsIn(unsigned kind, std::string_view text) {
    std::vector<sennetctl::Finding> findings;
    if (kind > 3) {
        sennetctl::ScriptModel model = sennetctl::ScriptReader("f.script.inv", findings).read(text);
        sennetctl::checkScript(model, findings);
        return findings;
    }
    sennetctl::LintOptions options;
    options.profile = static_cast<sennetctl::MifProfile>(kind);
    return sennetctl::MifLint(options).check("f.mif", text);
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    if (size == 0) {
        return 0;
    }
    const std::string_view text(reinterpret_cast<const char*>(data) + 1, size - 1);
    const auto lines = static_cast<std::size_t>(1 + std::count(text.begin(), text.end(), '\n'));
    for (const sennetctl::Finding& finding : findingsIn(data[0] & 7U, text)) {
        if (finding.line > lines || finding.message.empty()) {
            std::abort();
        }
    }
    return 0;
}
