#include "velmclient/PropertiesParser.h"

#include <optional>
#include <utility>

namespace Velm {

Properties PropertiesParser::parse() {
    Properties properties;
    while (std::optional<PropertiesEntry> entry = entries.next()) {
        properties.set(std::move(entry->key), std::move(entry->value));
    }
    return properties;
}

}  // namespace Velm
