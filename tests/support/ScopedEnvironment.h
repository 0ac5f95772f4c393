#pragma once

// An environment variable of this process for the length of a scope.

#include <optional>
#include <string>

namespace support {

class ScopedEnvironment {
  public:
    // Without a value the variable is taken away.
    explicit ScopedEnvironment(std::string name, std::optional<std::string> value = std::nullopt);
    // Gives back what was there before.
    ~ScopedEnvironment();
    ScopedEnvironment(const ScopedEnvironment&) = delete;
    ScopedEnvironment& operator=(const ScopedEnvironment&) = delete;

  private:
    void set(const std::optional<std::string>& value);

    std::string name;
    std::optional<std::string> before;
};

}  // namespace support
