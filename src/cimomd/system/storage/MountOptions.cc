#include "system/storage/MountOptions.h"

namespace cimomd {
namespace {

/// The first option that `isWanted` takes; nothing when none is.
template <typename Predicate>
std::optional<std::string_view> find(std::string_view options, Predicate isWanted) {
    while (!options.empty()) {
        const std::size_t comma = options.find(',');
        const std::string_view option = options.substr(0, comma);
        if (isWanted(option))
            return option;
        options.remove_prefix(comma == std::string_view::npos ? options.size() : comma + 1);
    }
    return std::nullopt;
}

}  // namespace

bool MountOptions::has(std::string_view name) const {
    return find(options, [name](std::string_view option) { return option == name; }).has_value();
}

std::optional<std::string_view> MountOptions::valueOf(std::string_view name) const {
    const auto option = find(options, [name](std::string_view text) {
        return text.substr(0, name.size()) == name && text.substr(name.size(), 1) == "=";
    });
    if (!option)
        return std::nullopt;
    return option->substr(name.size() + 1);
}

}  // namespace cimomd
