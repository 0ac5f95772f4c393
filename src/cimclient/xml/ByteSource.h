// Where the XML decoder takes its octets from, so that a message is decoded while it arrives.

#pragma once

#include <cstddef>

namespace Pegasus {

/// A stream of octets that is read once, from front to back.
class ByteSource {
  public:
    virtual ~ByteSource() = default;

    /// Fills `buffer` with between 1 and `capacity` octets and returns how many; waits for at least
    /// one. `capacity` is at least 1. Returns 0 only when the stream has ended, and then every
    /// time. May throw: the decoder lets the exception pass and does not read again.
    virtual std::size_t read(char* buffer, std::size_t capacity) = 0;

  protected:
    ByteSource() = default;
    ByteSource(const ByteSource&) = default;
    ByteSource& operator=(const ByteSource&) = default;
};

}  // namespace Pegasus
