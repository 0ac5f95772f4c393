#include "client/MemoryBudget.h"

#include <Pegasus/Client/ClientExceptions.h>
#include <gtest/gtest.h>
#include <sys/resource.h>

#include <algorithm>
#include <limits>
#include <string>
#include <vector>

namespace Pegasus {
namespace {

constexpr std::size_t kMib = std::size_t{1} << 20;
constexpr std::size_t kPiece = kMib;

/// The letter x, so many times.
class Letters : public ByteSource {
  public:
    explicit Letters(std::size_t count) : left(count) {}

    std::size_t read(char* buffer, std::size_t capacity) override {
        const std::size_t count = std::min(left, capacity);
        std::fill_n(buffer, count, 'x');
        left -= count;
        return count;
    }

  private:
    std::size_t left;
};

/// Reads all of it, keeps what it reads when told to, and returns how much that was.
std::size_t readAll(ByteSource& source, bool kept) {
    std::vector<std::string> pieces;
    std::string piece(kPiece, '\0');
    std::size_t total = 0;
    while (const std::size_t count = source.read(piece.data(), piece.size())) {
        total += count;
        if (kept) {
            pieces.push_back(piece);
        }
    }
    return total;
}

TEST(MemoryBoundedSource, GivesAllOfALongAnswerThatNeedsLittle) {
    Letters letters(200 * kMib + 7);
    MemoryBudget budget(32 * kMib);
    MemoryBoundedSource source(letters, budget);
    EXPECT_EQ(readAll(source, false), 200 * kMib + 7);
}

TEST(MemoryBoundedSource, RefusesAnAnswerThatNeedsMoreThanTheLimit) {
    Letters letters(1024 * kMib);
    MemoryBudget budget(64 * kMib);
    MemoryBoundedSource source(letters, budget);
    EXPECT_THROW(readAll(source, true), CIMClientMalformedHTTPException);
}

TEST(MemoryBoundedSource, LetsAnAnswerHaveAsMuchAsTheLimit) {
    Letters letters(96 * kMib);
    MemoryBudget budget(256 * kMib);
    MemoryBoundedSource source(letters, budget);
    EXPECT_EQ(readAll(source, true), 96 * kMib);
}

// A script may have ten classes, and all their instances are held until it is written.
TEST(MemoryBoundedSource, CountsWhatIsKeptOfEarlierAnswers) {
    MemoryBudget budget(64 * kMib);
    std::vector<std::string> kept;
    const auto readAnother = [&] {
        Letters letters(24 * kMib);
        MemoryBoundedSource source(letters, budget);
        kept.emplace_back(24 * kMib, '\0');
        while (source.read(kept.back().data(), kept.back().size()) != 0) {
        }
    };
    readAnother();
    readAnother();
    readAnother();
    EXPECT_THROW(
        {
            readAnother();
            readAnother();
            readAnother();
        },
        CIMClientMalformedHTTPException);
}

// Nothing may be allocated below the limit: under a sanitizer it is exceeded from the start.
TEST(MemoryForAnswers, AsksForTheLimitOfTheAddressSpace) {
    rlimit before{};
    ASSERT_EQ(::getrlimit(RLIMIT_AS, &before), 0);
    rlimit less = before;
    less.rlim_cur = 512 * kMib;
    ASSERT_EQ(::setrlimit(RLIMIT_AS, &less), 0);
    const Uint64 limited = addressSpaceLimit();
    ASSERT_EQ(::setrlimit(RLIMIT_AS, &before), 0);
    EXPECT_EQ(limited, 512 * kMib);
}

TEST(MemoryForAnswers, IsAQuarterOfWhatTheProcessMayHave) {
    const Uint64 usual = memoryForAnswers();
    EXPECT_GT(usual, 16 * kMib);
    EXPECT_EQ(memoryForAnswers({}, usual), usual / 4);
    EXPECT_EQ(memoryForAnswers({}, std::numeric_limits<Uint64>::max()), usual);
}

}  // namespace
}  // namespace Pegasus
