#include "xml/InstanceAssembly.h"

#include <algorithm>
#include <optional>
#include <utility>

namespace Pegasus {

namespace {

constexpr std::size_t kMostClasses = 64;

}  // namespace

void InstanceAssembly::start(const CIMName& className, bool learning) {
    body = std::make_unique<InstanceBody>(className);
    packing.start();
    ids.clear();
    next = 0;
    known = nullptr;
    if (learning) {
        if (classes.size() == kMostClasses && !classes.contains(&className)) {
            classes.clear();
        }
        known = &classes[&className];
    }
}

const KnownProperties::Property* InstanceAssembly::expected(std::size_t ahead) const {
    const bool isThere = known != nullptr && next + ahead < known->size() && packing.hasRoom();
    return isThere ? &known->at(next + ahead) : nullptr;
}

void InstanceAssembly::tookExpected(std::size_t ahead) {
    next += ahead;
    ids.push_back(known->at(next).id);
    ++next;
}

void InstanceAssembly::addProperty(const CIMProperty& property, std::string_view element) {
    if (pack(property, element)) {
        return;
    }
    unpack();
    body->addProperty(property);
}

// False when the property can only be had in an unpacked instance.
bool InstanceAssembly::pack(const CIMProperty& property, std::string_view element) {
    const CIMConstProperty& read = property;
    if (known == nullptr || !canBePacked(read) || !packing.hasRoom() || hasPacked(read.getName())) {
        return false;
    }
    const CIMValue value = read.getValue();
    const std::optional<std::size_t> position =
        known->note(declarationOf(read), next, element, value.isNull());
    if (!position) {
        return false;
    }
    packing.add(value);
    ids.push_back(known->at(*position).id);
    next = std::max(next, *position + 1);
    return true;
}

bool InstanceAssembly::hasPacked(const CIMName& name) const {
    for (const Uint32 id : ids) {
        if (known->declaration(id).name.equal(name)) {
            return true;
        }
    }
    return false;
}

void InstanceAssembly::unpack() {
    if (known != nullptr) {
        body->properties = PropertyStore(packing.finish(known->shapeOf(ids)));
        known = nullptr;
    }
}

CIMInstance InstanceAssembly::finish() {
    unpack();
    return makeInstance(std::move(body));
}

}  // namespace Pegasus
