#include "report/DescriptorBuffer.h"

#include <unistd.h>

#include <cerrno>

namespace sennetctl {

namespace {

constexpr std::size_t kBufferOctets = std::size_t{16} << 10;

}  // namespace

DescriptorBuffer::DescriptorBuffer(int theDescriptor)
    : descriptor(theDescriptor), pending(kBufferOctets) {
    setp(pending.data(), pending.data() + pending.size());
}

DescriptorBuffer::~DescriptorBuffer() {
    writeOut();
}

DescriptorBuffer::int_type DescriptorBuffer::overflow(int_type character) {
    if (!writeOut()) {
        return traits_type::eof();
    }
    return traits_type::eq_int_type(character, traits_type::eof())
               ? traits_type::not_eof(character)
               : sputc(traits_type::to_char_type(character));
}

int DescriptorBuffer::sync() {
    return writeOut() ? 0 : -1;
}

bool DescriptorBuffer::writeOut() {
    const char* next = pbase();
    while (firstError == 0 && next < pptr()) {
        const ssize_t written = ::write(descriptor, next, static_cast<std::size_t>(pptr() - next));
        if (written >= 0) {
            next += written;
        } else if (errno != EINTR) {
            firstError = errno;
        }
    }
    setp(pending.data(), pending.data() + pending.size());
    return firstError == 0;
}

}  // namespace sennetctl
