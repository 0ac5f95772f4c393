#include <Pegasus/Common/CIMProperty.h>
#include <Pegasus/Common/CIMValue.h>
#include <Pegasus/Common/Exception.h>

#include <concepts>
#include <type_traits>
#include <variant>

#include "ValueText.h"

namespace Pegasus {

namespace {

template <class T>
concept Handle =
    std::same_as<T, CIMObjectPath> || std::same_as<T, CIMObject> || std::same_as<T, CIMInstance>;

String describeType(CIMType type, Boolean isArray) {
    return String(isArray ? "an array of " : "a scalar ") + cimTypeToString(type);
}

template <Handle T>
Boolean isOnNothing(const T& handle) {
    if constexpr (std::same_as<T, CIMObjectPath>)
        return false;
    else
        return handle.isUninitialized();
}

struct TextOf {
    String operator()(std::monostate) const { return String(); }
    template <class T>
    String operator()(const T& scalar) const {
        String text;
        appendValueText(text, scalar);
        return text;
    }
    template <class T>
    String operator()(const Array<T>& elements) const {
        String text;
        for (const T& element : elements) {
            appendValueText(text, element);
            text.append(' ');
        }
        return text;
    }
};

struct SizeOf {
    Uint32 sizeOfNull;
    Uint32 operator()(std::monostate) const { return sizeOfNull; }
    template <class T>
    Uint32 operator()(const T&) const {
        return 0;
    }
    template <class T>
    Uint32 operator()(const Array<T>& elements) const {
        return elements.size();
    }
};

struct CloneHandles {
    template <class T>
    void operator()(T&) const {}
    template <Handle T>
    void operator()(T& handle) const {
        if (!isOnNothing(handle))
            handle = handle.clone();
    }
    template <Handle T>
    void operator()(Array<T>& handles) const {
        for (Uint32 i = 0; i < handles.size(); ++i)
            (*this)(handles[i]);
    }
};

}  // namespace

CIMValue::CIMValue() : CIMValue(CIMTYPE_BOOLEAN, false) {}

CIMValue::CIMValue(CIMType nullType, Boolean nullIsArray, Uint32 arraySize)
    : type(nullType), array(nullIsArray), nullArraySize(nullIsArray ? arraySize : 0) {}

CIMValue::CIMValue(const CIMValue& other) = default;

CIMValue::CIMValue(CIMValue&& other) noexcept = default;

CIMValue& CIMValue::operator=(const CIMValue& other) = default;

CIMValue& CIMValue::operator=(CIMValue&& other) noexcept = default;

CIMValue::~CIMValue() = default;

Uint32 CIMValue::getArraySize() const {
    return visit(SizeOf{nullArraySize});
}

void CIMValue::setNullValue(CIMType nullType, Boolean nullIsArray, Uint32 arraySize) {
    *this = CIMValue(nullType, nullIsArray, arraySize);
}

CIMValue CIMValue::clone() const {
    CIMValue copy(*this);
    std::visit(CloneHandles(), copy.storage);
    return copy;
}

String CIMValue::toString() const {
    return visit(TextOf());
}

void CIMValue::requireType(CIMType wanted, Boolean wantedArray) const {
    if (type != wanted || array != wantedArray)
        throw TypeMismatchException("The value is " + describeType(type, array) +
                                    " and was asked for as " + describeType(wanted, wantedArray));
}

}  // namespace Pegasus
