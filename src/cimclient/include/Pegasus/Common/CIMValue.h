// A value of a CIM type: a scalar, an array or null (DSP0004, "intrinsic data types").
#pragma once

#include <Pegasus/Common/CIMDateTime.h>
#include <Pegasus/Common/CIMInstance.h>
#include <Pegasus/Common/CIMObject.h>
#include <Pegasus/Common/CIMObjectPath.h>
#include <Pegasus/Common/CIMTypeTraits.h>
#include <Pegasus/Common/Char16.h>
#include <Pegasus/Common/String.h>

#include <utility>
#include <variant>

namespace Pegasus {

/// Copies are values of their own, but the embedded objects, instances and paths in them are
/// handles and stay shared. In the templates T is one of Boolean, Uint8 to Sint64, Real32, Real64,
/// Char16, String, CIMDateTime, CIMObjectPath, CIMObject, CIMInstance, or an Array of one of these.
class CIMValue {
  public:
    /// A null boolean.
    CIMValue();
    /// A null of the given type. `arraySize` is what getArraySize() then tells.
    CIMValue(CIMType nullType, Boolean nullIsArray, Uint32 arraySize = 0);
    template <CimData T>
    explicit CIMValue(T data)
        : storage(std::in_place_type<T>, std::move(data)),
          type(kCimTypeOf<T>),
          array(CimTypeTraits<T>::kIsArray) {}

    CIMValue(const CIMValue& other);
    CIMValue(CIMValue&& other) noexcept;
    CIMValue& operator=(const CIMValue& other);
    CIMValue& operator=(CIMValue&& other) noexcept;
    ~CIMValue();

    Boolean isNull() const { return storage.index() == 0; }
    Boolean isArray() const { return array; }
    CIMType getType() const { return type; }
    /// The number of elements; 0 for a scalar.
    Uint32 getArraySize() const;

    /// Makes the value `data`, whatever type it had before.
    template <CimData T>
    void set(T data) {
        *this = CIMValue(std::move(data));
    }
    /// Makes the value a null of the given type.
    void setNullValue(CIMType nullType, Boolean nullIsArray, Uint32 arraySize = 0);

    /// Puts the value into `out`. A null leaves a scalar as it was and empties an array. Raises
    /// TypeMismatchException when the value, null or not, is of another type than `out`, or a
    /// scalar where that is an array, or the reverse; `out` is unchanged then.
    template <CimData T>
    void get(T& out) const {
        requireType(kCimTypeOf<T>, CimTypeTraits<T>::kIsArray);
        if (const T* held = std::get_if<T>(&storage))
            out = *held;
        else if constexpr (CimTypeTraits<T>::kIsArray)
            out.clear();
    }

    /// Calls `visitor` with the data in their own type, or with std::monostate for null.
    template <class Visitor>
    decltype(auto) visit(Visitor&& visitor) const {
        return std::visit(std::forward<Visitor>(visitor), storage);
    }

    /// A copy that shares no embedded object, instance or path either.
    CIMValue clone() const;

    /// The value as text, empty for null. Booleans are TRUE or FALSE; reals have the form of
    /// "%.16e" in any locale; a char16 outside 1 to 127 is \x and four hexadecimal digits;
    /// embedded classes and instances are their CIM-XML element (DSP0201). Each element of an
    /// array is followed by one blank.
    String toString() const;

  private:
    void requireType(CIMType wanted, Boolean wantedArray) const;

    CimTypes::Storage storage;
    CIMType type;
    Boolean array;
    Uint32 nullArraySize = 0;
};

}  // namespace Pegasus
