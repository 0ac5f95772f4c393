#include "system/storage/NfsOptions.h"

#include <limits>
#include <optional>

#include "files/TextFields.h"

namespace cimomd {
namespace {

Fact<std::string> textOf(const MountOptions& options, std::string_view name) {
    const auto value = options.valueOf(name);
    return value && !value->empty() ? Fact<std::string>(std::string(*value)) : Fact<std::string>();
}

/// A number that T holds; any other value is filtered.
template <typename T>
Fact<T> numberOf(const MountOptions& options, std::string_view name) {
    return textOf(options, name).then([](const std::string& text) {
        const auto number = parseUnsigned(text);
        const bool fits = number && *number <= std::numeric_limits<T>::max();
        return fits ? std::optional(static_cast<T>(*number)) : std::nullopt;
    });
}

Fact<bool> hardnessOf(const MountOptions& options) {
    if (options.has("hard"))
        return true;
    return options.has("soft") || options.has("softerr") ? Fact<bool>(false) : Fact<bool>();
}

}  // namespace

NfsOptions nfsOptionsOf(const MountOptions& options) {
    NfsOptions out;
    out.version = textOf(options, "vers");
    out.protocol = textOf(options, "proto");
    out.isHard = hardnessOf(options);
    out.retransmissions = numberOf<std::uint16_t>(options, "retrans");
    out.timeoutTenths = numberOf<std::uint32_t>(options, "timeo");
    out.readBytes = numberOf<std::uint64_t>(options, "rsize");
    out.writeBytes = numberOf<std::uint64_t>(options, "wsize");
    out.port = numberOf<std::uint32_t>(options, "port");
    out.cachesAttributes = !options.has("noac");
    out.fileCacheMinSeconds = numberOf<std::uint16_t>(options, "acregmin");
    out.fileCacheMaxSeconds = numberOf<std::uint16_t>(options, "acregmax");
    out.directoryCacheMinSeconds = numberOf<std::uint16_t>(options, "acdirmin");
    out.directoryCacheMaxSeconds = numberOf<std::uint16_t>(options, "acdirmax");
    return out;
}

}  // namespace cimomd
