#include "mifreader/GroupBuilder.h"

#include <algorithm>
#include <utility>

namespace Mif {

void GroupBuilder::add(Attribute attribute) {
    if (!ids.insert(attribute.id).second) {
        throw Error(attribute.idPosition, "second attribute of this Id in the group");
    }
    if (!names.insert(attribute.name).second && !tolerances.has(Tolerance::RepeatedNames)) {
        throw Error(attribute.namePosition, "second attribute of this name in the group");
    }
    group.attributes.push_back(std::move(attribute));
}

Group GroupBuilder::finish() {
    if (group.attributes.empty()) {
        throw Error(start, "Group without attributes");
    }
    resolveKey();
    std::sort(group.attributes.begin(), group.attributes.end(),
              [](const Attribute& one, const Attribute& other) { return one.id < other.id; });
    countRequired();
    return std::move(group);
}

void GroupBuilder::resolveKey() {
    std::set<std::uint64_t> used;
    for (const Number& number : key) {
        if (ids.count(number.value) == 0) {
            throw Error(number.position,
                        "no attribute of the group has the Id " + std::to_string(number.value));
        }
        if (!used.insert(number.value).second) {
            throw Error(number.position, "the key names an attribute twice");
        }
        group.key.push_back(number.value);
    }
}

void GroupBuilder::countRequired() {
    for (std::size_t i = 0; i < group.attributes.size(); ++i) {
        if (!group.attributes[i].value) {
            group.requiredValues = i + 1;
        }
    }
}

}  // namespace Mif
