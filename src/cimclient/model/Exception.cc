#include <Pegasus/Common/Array.h>
#include <Pegasus/Common/Exception.h>

#include <string>
#include <utility>

namespace Pegasus {

Exception::Exception(String message) : message(std::move(message)) {}

Exception::~Exception() = default;

IndexOutOfBoundsException::IndexOutOfBoundsException(Uint32 index, Uint32 size)
    : Exception(("Position " + std::to_string(index) + " is out of bounds: there are " +
                 std::to_string(size) + " elements")
                    .c_str()) {}

CIMException::CIMException(CIMStatusCode code, String message)
    : Exception(std::move(message)), code(code) {}

void throwIndexOutOfBounds(Uint32 index, Uint32 size) {
    throw IndexOutOfBoundsException(index, size);
}

}  // namespace Pegasus
