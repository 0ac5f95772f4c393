// An answer of which no more is read than there is memory for its objects.

#pragma once

#include <Pegasus/Common/Config.h>

#include <cstddef>

#include "xml/ByteSource.h"

namespace Pegasus {

/// Looks now and then at how much memory the process has come to use since the answer was found to
/// be a long one.
class MemoryBoundedSource : public ByteSource {
  public:
    /// Octets between two looks; shorter answers are not looked at.
    static constexpr std::size_t kStep = std::size_t{16} << 20;

    /// `answer` must outlive this. `limit` is in octets of resident memory.
    MemoryBoundedSource(ByteSource& answer, Uint64 limit) : answer(answer), limit(limit) {}

    /// Raises CIMClientMalformedHTTPException when the limit is exceeded.
    std::size_t read(char* buffer, std::size_t capacity) override;

  private:
    void look();

    ByteSource& answer;
    Uint64 limit;
    Uint64 octets = 0;
    Uint64 nextLook = kStep;
    Uint64 firstUse = 0;  // 0 before the first look
};

/// A quarter of what the machine has, or of what this process may have where that is less, in
/// octets. Not more, for an array that grows needs up to three times its memory for a moment.
Uint64 memoryForOneAnswer();

}  // namespace Pegasus
