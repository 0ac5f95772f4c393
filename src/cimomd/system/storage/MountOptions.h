#pragma once

// Options of a mount as its table lists them: "rw,vers=4.2,hard".

#include <optional>
#include <string>
#include <string_view>

namespace cimomd {

class MountOptions {
  public:
    MountOptions() = default;
    explicit MountOptions(std::string_view commaSeparated) : options(commaSeparated) {}

    /// Whether the option stands there without a value.
    bool has(std::string_view name) const;
    /// What stands behind `name` and "="; looks into this object.
    std::optional<std::string_view> valueOf(std::string_view name) const;

  private:
    std::string options;
};

}  // namespace cimomd
