#pragma once

// The attributes of a script's groups, as far as they are the same in all of them.

#include <Pegasus/Client/CIMClient.h>

#include <string>
#include <vector>

#include "SennetConverter/framework/PropertyLookup.h"

namespace Pegasus {

/// Filled while the first group is written: what goes wrong with a later attribute then comes after
/// the earlier ones were written.
struct GroupAttributes {
    struct Attribute {
        Uint32 classIndex;
        PropertyLookup lookup;
        /// As the product accepts it.
        String name;
        String numberText;
        /// The lines up to the value, for an attribute of this type; none while empty.
        std::string head;
        CIMType type = CIMTYPE_STRING;
        bool isArray = false;
    };

    std::vector<Attribute> attributes;
    bool complete = false;
};

}  // namespace Pegasus
