// Reads any octets as a file. The first octet chooses the tolerances. A refusal must name a place
// within the file; in a file that is accepted every row must fit its group.

#include <algorithm>
#include <cstddef>
#include <cstdint>
#include <cstdlib>
#include <string>
#include <string_view>

#include "Require.h"
#include "mifreader/MifReader.h"

namespace {

Mif::Tolerances tolerances(std::uint8_t bits) {
    Mif::Tolerances result;
    for (unsigned int i = 0; i < 8; ++i) {
        if ((bits >> i & 1U) != 0) {
            result.add(static_cast<Mif::Tolerance>(i));
        }
    }
    return result;
}

void requireWholeRows(const Mif::Component& component) {
    for (const Mif::Table& table : component.tables) {
        const Mif::Group& group = component.groups.at(table.group);
        require(group.isTemplate() && group.className == table.className);
        for (const Mif::Row& row : table.rows) {
            require(row.values.size() <= group.attributes.size());
            require(row.values.size() >= group.requiredValues);
            require(row.at(group, 0).kind != Mif::Value::Kind::Omitted);
        }
    }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    if (size == 0) {
        return 0;
    }
    const std::string_view text(reinterpret_cast<const char*>(data) + 1, size - 1);
    try {
        requireWholeRows(Mif::MifReader(tolerances(data[0])).read(text));
    } catch (const Mif::Error& error) {
        const auto lines = 1 + std::count(text.begin(), text.end(), '\n');
        const long line = std::strtol(error.what(), nullptr, 10);
        require(line >= 1 && line <= lines);
    }
    return 0;
}
