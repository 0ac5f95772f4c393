#include "PackedProperties.h"

#include <Pegasus/Common/Exception.h>

#include <algorithm>

#include "CimTypeDispatch.h"

namespace Pegasus {

namespace {

/// Reads what a PropertyPacker put.
class Unpacker {
  public:
    explicit Unpacker(const char* from) : at(from) {}

    template <class T>
    T take() {
        T item;
        std::memcpy(&item, at, sizeof item);
        at += sizeof item;
        return item;
    }

    template <PackableScalar T>
    T takeScalar() {
        if constexpr (std::same_as<T, String>)
            return takeText();
        else if constexpr (std::same_as<T, CIMDateTime>)
            return takeDateTime();
        else
            return take<T>();
    }

    template <PackableScalar T>
    Array<T> takeArray() {
        const auto count = take<Uint32>();
        Array<T> elements;
        elements.reserveCapacity(count);
        for (Uint32 i = 0; i < count; ++i)
            elements.append(takeScalar<T>());
        return elements;
    }

  private:
    String takeText() {
        const auto size = take<Uint32>();
        const char* const text = at;
        at += size;
        return String(text, size);
    }

    CIMDateTime takeDateTime() {
        const String text = takeText();
        return text.size() == 0 ? CIMDateTime() : CIMDateTime(text);
    }

    const char* at;
};

struct Pack {
    PropertyPacker& packer;

    void put(const String& text) const {
        const CString utf8 = text.getCString();
        packer.putText(static_cast<const char*>(utf8));
    }
    template <class T>
    void put(T item) const {
        packer.put(item);
    }

    Boolean operator()(std::monostate) const {
        packer.beginNull();
        return true;
    }
    template <class T>
    Boolean operator()(const T&) const {
        return false;
    }
    template <PackableScalar T>
    Boolean operator()(const T& scalar) const {
        packer.beginScalar();
        put(scalar);
        return true;
    }
    template <PackableScalar T>
    Boolean operator()(const Array<T>& elements) const {
        packer.beginArray(elements.size());
        for (const T& element : elements)
            put(element);
        return true;
    }
};

}  // namespace

CIMProperty PackedProperties::at(Uint32 index) const {
    const PropertyDeclaration& property = declaration(index);
    return CIMProperty(property.name, value(index), property.arraySize, CIMName(),
                       property.classOrigin, property.propagated);
}

CIMValue PackedProperties::value(Uint32 index) const {
    const PropertyDeclaration& property = declaration(index);
    const auto start = Unpacker(octets() + index * sizeof(Uint32)).take<Uint32>();
    if (start == 0)
        return CIMValue(property.type, property.isArray, property.arraySize);
    Unpacker unpacker(octets() + start);
    return dispatchCimType(property.type, [&]<class T>(CimTypeTag<T>) {
        if constexpr (PackableScalar<T>)
            return property.isArray ? CIMValue(unpacker.takeArray<T>())
                                    : CIMValue(unpacker.takeScalar<T>());
        else
            return CIMValue();
    });
}

void PropertyPacker::start() {
    values.clear();
    starts.clear();
}

Boolean PropertyPacker::add(const CIMValue& value) {
    return value.visit(Pack{*this});
}

BodyRef<PackedProperties> PropertyPacker::finish(std::shared_ptr<const InstanceShape> shape) {
    const auto head = static_cast<Uint32>(starts.size() * sizeof(Uint32));
    BodyRef<PackedProperties> packed(new (head + values.size()) PackedProperties(std::move(shape)));
    char* const octets = packed.get()->octets();
    for (Uint32& begin : starts)
        begin = begin == kNull ? 0 : head + begin;
    // Without properties there is nothing at starts.data(), not even for memcpy() to copy none of.
    char* const behindHead =
        std::copy_n(reinterpret_cast<const char*>(starts.data()), head, octets);
    std::copy(values.begin(), values.end(), behindHead);
    start();
    return packed;
}

}  // namespace Pegasus
