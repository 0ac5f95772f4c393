#pragma once

// What a child of a threaded program may do between fork and exec.

namespace cimomd {

/// Closes all descriptors from `first` on but `kept`.
void closeOthers(unsigned int first, unsigned int kept);

}  // namespace cimomd
