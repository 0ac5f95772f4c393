#pragma once

// Orders names so that those which differ only by case are one.

#include <Pegasus/Common/CIMName.h>

namespace cimomd {

/// Compares texts only where the hashes are the same.
struct NameOrder {
    bool operator()(const Pegasus::CIMName& a, const Pegasus::CIMName& b) const {
        if (a.hash() != b.hash())
            return a.hash() < b.hash();
        return Pegasus::String::compareNoCase(a.getString(), b.getString()) < 0;
    }
};

}  // namespace cimomd
