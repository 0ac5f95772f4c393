// Answers of which no more is read than there is memory for their objects.

#pragma once

#include <Pegasus/Common/Config.h>

#include <cstddef>
#include <optional>
#include <string>

#include "xml/ByteSource.h"

namespace Pegasus {

/// The memory that the process may come to use by all answers of a client together: the caller may
/// keep the objects of several.
class MemoryBudget {
  public:
    /// Octets of answers between two looks at the memory.
    static constexpr std::size_t kStep = std::size_t{16} << 20;

    /// With memoryForAnswers() as its limit, which is asked for when it is wanted.
    MemoryBudget() = default;
    /// `limit` is in octets of resident memory more than at the first look.
    explicit MemoryBudget(Uint64 limit) : limit(limit) {}

    /// Tells that so many octets of an answer were read. Raises CIMClientMalformedHTTPException
    /// when the limit is exceeded.
    void take(std::size_t octets);

  private:
    void look();
    bool isExceeded() const;

    std::optional<Uint64> limit;
    std::size_t sinceLook = 0;
    Uint64 firstUse = 0;  // 0 before the first look
};

class MemoryBoundedSource : public ByteSource {
  public:
    /// Both must outlive this.
    MemoryBoundedSource(ByteSource& answer, MemoryBudget& budget)
        : answer(answer), budget(budget) {}

    std::size_t read(char* buffer, std::size_t capacity) override {
        const std::size_t count = answer.read(buffer, capacity);
        budget.take(count);
        return count;
    }

  private:
    ByteSource& answer;
    MemoryBudget& budget;
};

/// The octets of address space that this process may have: RLIMIT_AS, the greatest Uint64 where
/// there is no limit.
Uint64 addressSpaceLimit();

/// A quarter of what the machine has, or of what the control groups of this process or its
/// `addressSpace` allow where that is less, in octets. Not more, for an array that grows needs up
/// to three times its memory for a moment. `root` stands before the paths of the files that tell of
/// the control groups.
Uint64 memoryForAnswers(const std::string& root = {}, Uint64 addressSpace = addressSpaceLimit());

}  // namespace Pegasus
