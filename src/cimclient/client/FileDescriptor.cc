#include "client/FileDescriptor.h"

#include <unistd.h>

namespace Pegasus {

FileDescriptor& FileDescriptor::operator=(FileDescriptor&& other) noexcept {
    if (this != &other) {
        reset();
        number = std::exchange(other.number, -1);
    }
    return *this;
}

void FileDescriptor::reset() {
    if (number >= 0) {
        ::close(number);
        number = -1;
    }
}

}  // namespace Pegasus
