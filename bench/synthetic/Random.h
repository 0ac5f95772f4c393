// Numbers that look random and are the same on every machine and in every run.

#pragma once

#include <cstdint>

namespace bench {

/// SplitMix64. Two of the same seed give the same sequence.
class Random {
  public:
    explicit Random(std::uint64_t seed) : state(seed) {}

    std::uint64_t next() {
        state += 0x9e3779b97f4a7c15U;
        std::uint64_t mixed = state;
        mixed = (mixed ^ (mixed >> 30U)) * 0xbf58476d1ce4e5b9U;
        mixed = (mixed ^ (mixed >> 27U)) * 0x94d049bb133111ebU;
        return mixed ^ (mixed >> 31U);
    }

    /// From 0 to `bound` - 1; `bound` is at least 1.
    std::uint64_t below(std::uint64_t bound) { return next() % bound; }

  private:
    std::uint64_t state;
};

}  // namespace bench
