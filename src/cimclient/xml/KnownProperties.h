// What the properties of earlier instances of a class looked like in the answer being read.

#pragma once

#include <Pegasus/Common/Config.h>

#include <cstddef>
#include <deque>
#include <map>
#include <memory>
#include <optional>
#include <string_view>
#include <vector>

#include "model/InstanceShape.h"
#include "xml/MarkupRun.h"

namespace Pegasus {

/// The properties of one class in the order in which the server writes them. Bounded in size,
/// whatever the answer holds.
class KnownProperties {
  public:
    struct Property {
        /// The number of its declaration.
        Uint32 id;
        std::optional<MarkupRun> withValue;
        std::optional<MarkupRun> withoutValue;
    };

    std::size_t size() const { return order.size(); }
    const Property& at(std::size_t position) const { return order[position]; }
    /// Valid as long as this object.
    const PropertyDeclaration& declaration(Uint32 id) const { return declarations[id]; }

    /// Notes a property that was read where the one at `expected` might have stood, and its octets
    /// in the document, empty when they are not at hand. Gives its position, or nothing when there
    /// is no room for more.
    std::optional<std::size_t> note(const PropertyDeclaration& property, std::size_t expected,
                                    std::string_view element, bool isNull);

    /// The shape of an instance that has the properties `ids`, no two of one name.
    std::shared_ptr<const InstanceShape> shapeOf(const std::vector<Uint32>& ids);

  private:
    std::optional<std::size_t> find(const CIMName& name) const;
    bool hasRoom() const;
    Uint32 declare(const PropertyDeclaration& property);

    std::deque<PropertyDeclaration> declarations;
    std::vector<Property> order;
    std::map<std::vector<Uint32>, std::shared_ptr<const InstanceShape>> shapes;
    std::vector<Uint32> latestIds;
    std::shared_ptr<const InstanceShape> latestShape;
};

}  // namespace Pegasus
