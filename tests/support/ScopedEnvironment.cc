#include "support/ScopedEnvironment.h"

#include <cstdlib>
#include <utility>

namespace support {

ScopedEnvironment::ScopedEnvironment(std::string name, std::optional<std::string> value)
    : name(std::move(name)) {
    if (const char* present = std::getenv(this->name.c_str())) {
        before = present;
    }
    set(value);
}

ScopedEnvironment::~ScopedEnvironment() {
    set(before);
}

void ScopedEnvironment::set(const std::optional<std::string>& value) {
    if (value.has_value()) {
        setenv(name.c_str(), value->c_str(), 1);
    } else {
        unsetenv(name.c_str());
    }
}

}  // namespace support
