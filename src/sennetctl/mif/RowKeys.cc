#include "mif/RowKeys.h"

#include <cstddef>
#include <cstdint>

namespace sennetctl {

namespace {

std::string textOf(const Mif::Value& value) {
    return value.kind == Mif::Value::Kind::Integer
               ? (value.negative ? "-" : "") + std::to_string(value.magnitude)
               : value.text;
}

}  // namespace

RowKeys::RowKeys(const Mif::Group& group) {
    const std::set<std::uint64_t> ids(group.key.begin(), group.key.end());
    for (const Mif::Attribute& attribute : group.attributes) {
        Place place;
        place.isKey = ids.count(attribute.id) > 0;
        if (place.isKey && attribute.value) {
            place.usual = textOf(*attribute.value);
        }
        places.push_back(std::move(place));
    }
}

// Of two rows with one key both have the same unusual values, so the others need not be held.
bool RowKeys::isRepeated(const Mif::Row& row) {
    std::string key;
    for (std::size_t i = 0; i < row.values.size(); ++i) {
        if (!places[i].isKey || row.values[i].kind == Mif::Value::Kind::Omitted) {
            continue;
        }
        const std::string text = textOf(row.values[i]);
        if (text != places[i].usual) {
            key += std::to_string(i) + ":" + std::to_string(text.size()) + ":" + text;
        }
    }
    return !keys.insert(std::move(key)).second;
}

}  // namespace sennetctl
