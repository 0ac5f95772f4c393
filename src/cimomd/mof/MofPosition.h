#pragma once

// Where something stands in a MOF text.

namespace cimomd {

/// A place in one MOF file; both numbers count from 1, columns count characters.
struct MofPosition {
    unsigned line = 1;
    unsigned column = 1;
};

}  // namespace cimomd
