// The properties of an instance in little memory: a shape that it shares with others of its class,
// and its values one behind the other in one piece.
//
// An inventory has hundred thousands of values, most of which are looked at once. A CIMProperty of
// its own for each of them would take ten times their size.
#pragma once

#include <Pegasus/Common/BodyRef.h>
#include <Pegasus/Common/CIMDateTime.h>
#include <Pegasus/Common/CIMProperty.h>
#include <Pegasus/Common/CIMValue.h>
#include <Pegasus/Common/Char16.h>
#include <Pegasus/Common/SharedBody.h>

#include <cstring>
#include <memory>
#include <optional>
#include <string>
#include <string_view>
#include <type_traits>
#include <utility>
#include <vector>

#include "InstanceShape.h"
#include "Unpacker.h"

namespace Pegasus {

/// Their values never change, so that copies of an instance can share them.
class PackedProperties : public SharedBody {
  public:
    Uint32 size() const { return shape->size(); }
    /// The position, or PEG_NOT_FOUND.
    Uint32 find(const CIMName& name) const { return shape->find(name); }

    /// Of an index below size().
    const PropertyDeclaration& declaration(Uint32 index) const { return shape->at(index); }
    CIMValue value(Uint32 index) const;
    /// Where the value is read from; nothing for null.
    std::optional<Unpacker> unpack(Uint32 index) const;
    /// A property of its own.
    CIMProperty at(Uint32 index) const;

    const std::shared_ptr<const InstanceShape>& getShape() const { return shape; }
    /// `other` has properties of the same names and types as the present shape.
    void setShape(std::shared_ptr<const InstanceShape> other) { shape = std::move(other); }

    static void operator delete(void* memory) { ::operator delete(memory); }

  private:
    friend class PropertyPacker;
    explicit PackedProperties(std::shared_ptr<const InstanceShape> shape)
        : shape(std::move(shape)) {}
    /// The octets stand behind the object in the same piece of memory. For each property they say
    /// where in them its value begins, 0 for null; then come the values.
    static void* operator new(std::size_t size, std::size_t octetCount) {
        return ::operator new(size + octetCount);
    }
    static void operator delete(void* memory, std::size_t /*octetCount*/) {
        ::operator delete(memory);
    }

    char* octets() { return reinterpret_cast<char*>(this + 1); }
    const char* octets() const { return reinterpret_cast<const char*>(this + 1); }

    std::shared_ptr<const InstanceShape> shape;
};

/// Whether packing keeps all of the property.
inline Boolean canBePacked(const CIMConstProperty& property) {
    return property.getQualifierCount() == 0 && property.getReferenceClassName().isNull() &&
           property.getType() < CIMTYPE_REFERENCE;
}

/// Makes the packed properties of one instance after the other.
///
/// Between start() and finish() each property is begun with beginNull(), beginScalar() or
/// beginArray(); the latter two are followed by one putText() or put() for each element.
class PropertyPacker {
  public:
    /// Forgets what was packed since the last finish().
    void start();
    void beginNull() { starts.push_back(kNull); }
    void beginScalar() { starts.push_back(static_cast<Uint32>(values.size())); }
    void beginArray(Uint32 elements) {
        beginScalar();
        put(elements);
    }

    /// A number, boolean or char16.
    template <class T>
    requires(std::is_arithmetic_v<T> || std::same_as<T, Char16>) void put(T item) {
        values.append(reinterpret_cast<const char*>(&item), sizeof item);
    }
    void put(const CIMDateTime& time) {
        const String& text = time.toString();
        put(text.size());
        // All of it ASCII.
        for (Uint32 i = 0; i < text.size(); ++i)
            values += static_cast<char>(Uint16{text.getChar16Data()[i]});
    }
    /// A string, in UTF-8.
    void putText(std::string_view utf8) {
        put(static_cast<Uint32>(utf8.size()));
        values += utf8;
    }
    /// The next property as a whole. False, and nothing happens, when its value cannot be packed.
    Boolean add(const CIMValue& value);

    /// Makes room for so many octets of values.
    void reserve(std::size_t octets) { values.reserve(octets); }
    /// The number of properties begun.
    Uint32 size() const { return static_cast<Uint32>(starts.size()); }
    /// False when so much was packed that positions in it might overflow with the next property.
    Boolean hasRoom() const { return values.size() < kMostOctets; }

    /// `shape` has as many declarations, and of the types that were put. Raises std::bad_alloc.
    BodyRef<PackedProperties> finish(std::shared_ptr<const InstanceShape> shape);

  private:
    static constexpr Uint32 kNull = 0xFFFFFFFF;
    static constexpr std::size_t kMostOctets = std::size_t{512} * 1024 * 1024;

    std::string values;
    std::vector<Uint32> starts;
};

}  // namespace Pegasus
