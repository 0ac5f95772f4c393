// Which C++ type carries which CIM type.
#pragma once

#include <Pegasus/Common/Array.h>
#include <Pegasus/Common/CIMType.h>

#include <cstddef>
#include <type_traits>
#include <utility>
#include <variant>

namespace Pegasus {

class Char16;
class CIMDateTime;
class CIMInstance;
class CIMObject;
class CIMObjectPath;
class String;

/// The C++ types in the order of CIMType, so that a type's position is its CIMType.
template <template <class...> class List>
using CimScalarTypes =
    List<Boolean, Uint8, Sint8, Uint16, Sint16, Uint32, Sint32, Uint64, Sint64, Real32, Real64,
         Char16, String, CIMDateTime, CIMObjectPath, CIMObject, CIMInstance>;

template <class... Scalars>
struct CimTypeList {
    /// Nothing, one scalar, or one array.
    using Storage = std::variant<std::monostate, Scalars..., Array<Scalars>...>;

    template <class T>
    static constexpr std::size_t positionOf() {
        std::size_t position = 0;
        static_cast<void>(((std::is_same_v<T, Scalars> || (++position, false)) || ...));
        return position;
    }
    static constexpr std::size_t kCount = sizeof...(Scalars);
};

using CimTypes = CimScalarTypes<CimTypeList>;

template <class T>
struct CimTypeTraits {
    using Scalar = T;
    static constexpr bool kIsArray = false;
};

template <class T>
struct CimTypeTraits<Array<T>> {
    using Scalar = T;
    static constexpr bool kIsArray = true;
};

/// Exactly the types that a value holds: what merely converts to one of them, as a pointer does to
/// Boolean, is refused by the compiler.
template <class T>
concept CimData = CimTypes::positionOf<typename CimTypeTraits<T>::Scalar>()
< CimTypes::kCount;

template <CimData T>
inline constexpr CIMType kCimTypeOf =
    static_cast<CIMType>(CimTypes::positionOf<typename CimTypeTraits<T>::Scalar>());

}  // namespace Pegasus
