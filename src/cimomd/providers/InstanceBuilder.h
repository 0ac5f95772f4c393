#pragma once

// Puts an instance together from what a reader found.

#include <Pegasus/Common/CIMInstance.h>
#include <Pegasus/Common/CIMValue.h>

#include <optional>
#include <string>
#include <string_view>
#include <vector>

namespace cimomd {

/// Each call adds one property. Nothing becomes a null of the property's type. Texts may hold any
/// bytes: what CIM-XML cannot carry becomes U+FFFD.
class InstanceBuilder {
  public:
    explicit InstanceBuilder(const char* className);

    /// A string property; only the first `maxLength` characters are kept when that is not 0.
    InstanceBuilder& text(const char* name, const std::optional<std::string>& value,
                          std::size_t maxLength = 0);
    InstanceBuilder& texts(const char* name, const std::vector<std::string>& values);

    /// A property of the scalar type T, one of the client library's types.
    template <typename T>
    InstanceBuilder& value(const char* name, const std::optional<T>& scalar) {
        return add(name, scalar ? Pegasus::CIMValue(*scalar)
                                : Pegasus::CIMValue(Pegasus::kCimTypeOf<T>, false));
    }

    /// An array property of that element type.
    template <typename T>
    InstanceBuilder& values(const char* name, const std::optional<std::vector<T>>& elements) {
        if (!elements)
            return add(name, Pegasus::CIMValue(Pegasus::kCimTypeOf<T>, true));
        Pegasus::Array<T> array;
        for (const T& element : *elements)
            array.append(element);
        return add(name, Pegasus::CIMValue(array));
    }

    Pegasus::CIMInstance take() { return std::move(instance); }

  private:
    InstanceBuilder& add(const char* name, const Pegasus::CIMValue& value);

    Pegasus::CIMInstance instance;
};

}  // namespace cimomd
