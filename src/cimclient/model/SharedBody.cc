#include <Pegasus/Common/SharedBody.h>

namespace Pegasus {

// Out of line, as the rare end of release(): what is inlined everywhere stays small.
void SharedBody::destroy() const noexcept {
    delete this;
}

}  // namespace Pegasus
