#include <Pegasus/Common/StringBody.h>

namespace Pegasus {

// Out of line, as the rare end of release(): what is inlined everywhere stays small.
void StringBody::destroy() noexcept {
    ::operator delete(this);
}

}  // namespace Pegasus
