#include "providers/devices/HardwareTitle.h"

#include <fmt/format.h>

namespace cimomd {

Fact<std::string> hardwareIdOf(const Fact<std::uint16_t>& vendor,
                               const Fact<std::uint16_t>& product) {
    if (!vendor)
        return vendor.reason();
    return product.then(
        [&](std::uint16_t number) { return fmt::format("{:04x}:{:04x}", *vendor, number); });
}

std::string titleOf(const std::optional<std::string>& maker,
                    const std::optional<std::string>& product, const std::string& fallback) {
    if (!product)
        return maker ? *maker + " " + fallback : fallback;
    if (!maker || product->rfind(*maker, 0) == 0)
        return *product;
    return *maker + " " + *product;
}

}  // namespace cimomd
