#include "providers/storage/StorageSizes.h"

#include "system/Narrowing.h"
#include "system/storage/BlockDevice.h"

namespace cimomd {
namespace {

constexpr std::uint64_t kBinaryMegabyte = std::uint64_t{1} << 20;
constexpr std::uint64_t kDecimalMegabyte = 1000000;

Fact<std::uint32_t> inUnitsOf(std::uint64_t unit, const Fact<std::uint64_t>& number) {
    return number.then([unit](std::uint64_t value) { return narrowedToCount(value / unit); });
}

}  // namespace

Fact<std::uint32_t> mebibytesOf(const Fact<std::uint64_t>& bytes) {
    return inUnitsOf(kBinaryMegabyte, bytes);
}

Fact<std::uint32_t> decimalMegabytesOf(const Fact<std::uint64_t>& bytes) {
    return inUnitsOf(kDecimalMegabyte, bytes);
}

Fact<std::uint64_t> bytesOfSectors(const Fact<std::uint64_t>& sectors) {
    return sectors.then([](std::uint64_t count) { return std::optional(count * kSectorBytes); });
}

Fact<std::uint32_t> narrowed(const Fact<std::uint64_t>& number) {
    return inUnitsOf(1, number);
}

}  // namespace cimomd
