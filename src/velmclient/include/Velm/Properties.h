// A set of key/value texts, as read from a properties file.
#pragma once

#include <map>
#include <memory>
#include <string>

namespace Velm {

// Copies share their content until one of them is changed. Threads may read one object at the same
// time; set needs the object to itself.
class Properties {
  public:
    // An empty set.
    Properties() = default;

    // The value of `key`, compared exactly, or null when the key is absent or null. The text is
    // valid until the last copy that shares it is assigned to, destroyed or changed by set. A value
    // that holds a NUL byte ends there for the caller.
    const char* getPropertyValue(const char* key) const;

    // Stores a value under a key, in place of the one it had.
    void set(std::string key, std::string value);

  private:
    using Values = std::map<std::string, std::string, std::less<>>;

    std::shared_ptr<Values> values;
};

}  // namespace Velm
