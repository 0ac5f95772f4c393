#include "xml/KnownProperties.h"

#include <utility>

namespace Pegasus {

namespace {

constexpr std::size_t kMostProperties = 512;
constexpr std::size_t kMostDeclarations = 4096;
constexpr std::size_t kMostShapes = 256;

// One that was seen with a single text says nothing of what stands between two.
void keepBetween(const MarkupRun& earlier, MarkupRun& run) {
    if (run.between.empty() && run.before == earlier.before && run.after == earlier.after) {
        run.between = earlier.between;
    }
}

}  // namespace

std::optional<std::size_t> KnownProperties::note(const PropertyDeclaration& property,
                                                 std::size_t expected, std::string_view element,
                                                 bool isNull) {
    if (!hasRoom()) {
        return std::nullopt;
    }
    std::size_t position = expected;
    if (const std::optional<std::size_t> found = find(property.name)) {
        position = *found;
        if (!(declarations[order[position].id] == property)) {
            order[position] = {declare(property), std::nullopt, std::nullopt};
        }
    } else {
        order.insert(order.begin() + static_cast<std::ptrdiff_t>(position),
                     {declare(property), std::nullopt, std::nullopt});
    }
    if (std::optional<MarkupRun> run = MarkupRun::of(element, !isNull); run && !element.empty()) {
        std::optional<MarkupRun>& known =
            isNull ? order[position].withoutValue : order[position].withValue;
        if (known) {
            keepBetween(*known, *run);
        }
        known = std::move(run);
    }
    return position;
}

std::optional<std::size_t> KnownProperties::find(const CIMName& name) const {
    for (std::size_t i = 0; i < order.size(); ++i) {
        if (declarations[order[i].id].name.equal(name)) {
            return i;
        }
    }
    return std::nullopt;
}

bool KnownProperties::hasRoom() const {
    return order.size() < kMostProperties && declarations.size() < kMostDeclarations;
}

Uint32 KnownProperties::declare(const PropertyDeclaration& property) {
    declarations.push_back(property);
    return static_cast<Uint32>(declarations.size() - 1);
}

std::shared_ptr<const InstanceShape> KnownProperties::shapeOf(const std::vector<Uint32>& ids) {
    if (latestShape != nullptr && ids == latestIds) {
        return latestShape;
    }
    if (shapes.size() == kMostShapes) {
        shapes.clear();
    }
    std::shared_ptr<const InstanceShape>& shape = shapes[ids];
    if (shape == nullptr) {
        std::vector<PropertyDeclaration> properties;
        properties.reserve(ids.size());
        for (const Uint32 id : ids) {
            properties.push_back(declarations[id]);
        }
        shape = std::make_shared<const InstanceShape>(std::move(properties));
    }
    latestIds = ids;
    latestShape = shape;
    return shape;
}

}  // namespace Pegasus
