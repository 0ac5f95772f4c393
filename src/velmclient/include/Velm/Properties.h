// A set of key/value texts, as read from a properties file.
#pragma once

#include <map>
#include <string>

namespace Velm {

// Threads may read one object at the same time; set needs the object to itself.
class Properties {
  public:
    // An empty set.
    Properties() = default;

    // The value of `key`, compared exactly, or null when the key is absent or null. The text is
    // owned by this object and valid until it is assigned to, destroyed or the key set again. A
    // value that holds a NUL byte ends there for the caller.
    const char* getPropertyValue(const char* key) const;

    // Stores a value under a key, in place of the one it had.
    void set(std::string key, std::string value);

  private:
    std::map<std::string, std::string, std::less<>> values;
};

}  // namespace Velm
