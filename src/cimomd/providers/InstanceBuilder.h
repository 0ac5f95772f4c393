#pragma once

// Puts an instance together from what a reader found.

#include <Pegasus/Common/CIMValue.h>

#include <concepts>
#include <initializer_list>
#include <string>
#include <string_view>
#include <vector>

#include "model/PackedProperties.h"
#include "providers/BuiltShapes.h"
#include "providers/ProvidedInstance.h"

namespace cimomd {

/// Each call adds one property, or the keys of a kind of element. A fact without a value becomes a
/// null of the property's type, its reason is kept. Texts may hold any bytes: what CIM-XML cannot
/// carry becomes U+FFFD.
class InstanceBuilder {
  public:
    /// The names of the class and, below, of properties are static texts.
    explicit InstanceBuilder(const char* className);

    /// The keys of CIM_LogicalDevice.
    InstanceBuilder& deviceKeys(const std::string& hostName, const std::string& deviceId);
    /// The keys of CIM_PhysicalElement.
    InstanceBuilder& physicalKeys(const std::string& tag);
    /// The keys of CIM_Service.
    InstanceBuilder& serviceKeys(const std::string& hostName, const std::string& name);
    /// Any other key that tells the instance from others of its class. A value longer than
    /// `maxLength` characters, when that is not 0, is cut there, and its last ones make room for
    /// `~` and a checksum of the whole: long values that begin alike stay apart.
    InstanceBuilder& key(const char* name, const std::string& value, std::size_t maxLength = 0);

    /// Caption and ElementName.
    InstanceBuilder& label(const std::string& title);

    /// A string property; only the first `maxLength` characters are kept when that is not 0.
    InstanceBuilder& text(const char* name, const Fact<std::string>& value,
                          std::size_t maxLength = 0);
    template <std::convertible_to<std::string_view> Text>
    InstanceBuilder& text(const char* name, const Text& value, std::size_t maxLength = 0) {
        return addText(name, value, maxLength);
    }
    InstanceBuilder& texts(const char* name, const Fact<std::vector<std::string>>& values);

    /// A property of the scalar type T, one of the client library's types.
    template <typename T>
    InstanceBuilder& value(const char* name, const Fact<T>& scalar) {
        if (!scalar)
            return addMissing(name, Pegasus::kCimTypeOf<T>, false, scalar.reason());
        return add<T>(name, *scalar);
    }

    /// A number that the schema has words for. The reason for a missing one is kept as well, but
    /// the property says `unknown`, which is the number for that: readers that know numbers only by
    /// their words have none for null.
    InstanceBuilder& enumerated(const char* name, const Fact<Pegasus::Uint16>& number,
                                Pegasus::Uint16 unknown = 0) {
        if (!number)
            provided.missing.push_back({name, number.reason()});
        return add<Pegasus::Uint16>(name, number.value_or(unknown));
    }

    /// An array property of that element type.
    template <typename T>
    InstanceBuilder& values(const char* name, const Fact<std::vector<T>>& elements) {
        if (!elements)
            return addMissing(name, Pegasus::kCimTypeOf<T>, true, elements.reason());
        return addArray<T>(name, *elements);
    }
    template <typename T>
    InstanceBuilder& values(const char* name, std::initializer_list<T> elements) {
        return addArray<T>(name, elements);
    }

    /// Raises std::logic_error when a property was added twice.
    ProvidedInstance take();

  private:
    template <typename T, typename Elements>
    InstanceBuilder& addArray(const char* name, const Elements& elements) {
        properties.push_back({name, Pegasus::kCimTypeOf<T>, true});
        packer.beginArray(static_cast<Pegasus::Uint32>(elements.size()));
        for (const T element : elements)
            packer.put(element);
        return *this;
    }

    template <typename T>
    InstanceBuilder& add(const char* name, const T& value) {
        properties.push_back({name, Pegasus::kCimTypeOf<T>, false});
        packer.beginScalar();
        packer.put(value);
        return *this;
    }
    InstanceBuilder& addText(const char* name, std::string_view value, std::size_t maxLength);
    InstanceBuilder& addMissing(const char* name, Pegasus::CIMType type, bool isArray,
                                Absence reason);
    InstanceBuilder& systemKeys(const std::string& hostName);

    const char* creationClass;
    std::vector<BuiltProperty> properties;
    /// Their values.
    Pegasus::PropertyPacker packer;
    ProvidedInstance provided;
};

}  // namespace cimomd
