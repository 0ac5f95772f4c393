#include "system/network/InterfaceAddress.h"

#include "files/TextFields.h"
#include "system/Narrowing.h"

namespace cimomd {
namespace {

template <typename Number>
std::optional<Number> narrowed(const std::optional<std::uint64_t>& wide) {
    return wide ? narrowedTo<Number>(*wide) : std::nullopt;
}

std::optional<InterfaceAddress> addressOf(std::string_view line) {
    constexpr std::size_t kFieldCount = 6;
    const std::vector<std::string_view> fields = fieldsOf(line);
    if (fields.size() != kFieldCount && fields.size() != kFieldCount + 1)
        return std::nullopt;
    const auto local = IpAddress::parse(fields[1]);
    const auto peer = IpAddress::parse(fields[2]);
    const auto prefix = narrowed<std::uint8_t>(parseUnsigned(fields[3]));
    const auto flags = narrowed<std::uint32_t>(parseHexadecimal(fields[4]));
    const auto seconds = narrowed<std::uint32_t>(parseUnsigned(fields[5]));
    const auto origin = fields.size() == kFieldCount
                            ? std::optional<std::uint8_t>(0)
                            : narrowed<std::uint8_t>(parseUnsigned(fields[kFieldCount]));
    if (!local || !prefix || *prefix > local->bits() || !flags || !origin)
        return std::nullopt;
    if ((!peer && fields[2] != "-") || (!seconds && fields[5] != "forever"))
        return std::nullopt;
    return InterfaceAddress{
        std::string(fields[0]), *local, peer, *prefix, *flags, seconds, *origin};
}

}  // namespace

std::vector<InterfaceAddress> parseRecordedAddresses(std::string_view text) {
    std::vector<InterfaceAddress> out;
    for (const std::string_view line : linesOf(text)) {
        if (const auto address = addressOf(line))
            out.push_back(*address);
    }
    return out;
}

}  // namespace cimomd
