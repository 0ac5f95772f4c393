#include "PackedProperties.h"

#include <Pegasus/Common/Exception.h>

#include <algorithm>

#include "CimTypeDispatch.h"
#include "Utf16.h"

namespace Pegasus {

namespace {

struct Pack {
    PropertyPacker& packer;

    void put(const String& text) const {
        packer.putText(encodeUtf8(text.getChar16Data(), text.size()));
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
    std::optional<Unpacker> unpacker = unpack(index);
    if (!unpacker)
        return CIMValue(property.type, property.isArray, property.arraySize);
    return dispatchCimType(property.type, [&]<class T>(CimTypeTag<T>) {
        if constexpr (PackableScalar<T>)
            return property.isArray ? CIMValue(unpacker->takeArray<T>())
                                    : CIMValue(unpacker->takeScalar<T>());
        else
            return CIMValue();
    });
}

std::optional<Unpacker> PackedProperties::unpack(Uint32 index) const {
    const auto start = Unpacker(octets() + index * sizeof(Uint32)).take<Uint32>();
    return start == 0 ? std::nullopt : std::optional(Unpacker(octets() + start));
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
