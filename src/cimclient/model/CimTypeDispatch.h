// From a CIM type that is known at run time to the C++ type that carries it.
#pragma once

#include <Pegasus/Common/CIMDateTime.h>
#include <Pegasus/Common/CIMInstance.h>
#include <Pegasus/Common/CIMObject.h>
#include <Pegasus/Common/CIMObjectPath.h>
#include <Pegasus/Common/CIMType.h>
#include <Pegasus/Common/Char16.h>
#include <Pegasus/Common/String.h>

namespace Pegasus {

template <typename T>
struct CimTypeTag {};

/// Calls `action` with the CimTypeTag of the C++ type that carries `type`.
template <typename Action>
decltype(auto) dispatchCimType(CIMType type, Action action) {
    switch (type) {
        case CIMTYPE_BOOLEAN:
            return action(CimTypeTag<Boolean>());
        case CIMTYPE_UINT8:
            return action(CimTypeTag<Uint8>());
        case CIMTYPE_SINT8:
            return action(CimTypeTag<Sint8>());
        case CIMTYPE_UINT16:
            return action(CimTypeTag<Uint16>());
        case CIMTYPE_SINT16:
            return action(CimTypeTag<Sint16>());
        case CIMTYPE_UINT32:
            return action(CimTypeTag<Uint32>());
        case CIMTYPE_SINT32:
            return action(CimTypeTag<Sint32>());
        case CIMTYPE_UINT64:
            return action(CimTypeTag<Uint64>());
        case CIMTYPE_SINT64:
            return action(CimTypeTag<Sint64>());
        case CIMTYPE_REAL32:
            return action(CimTypeTag<Real32>());
        case CIMTYPE_REAL64:
            return action(CimTypeTag<Real64>());
        case CIMTYPE_CHAR16:
            return action(CimTypeTag<Char16>());
        case CIMTYPE_STRING:
            return action(CimTypeTag<String>());
        case CIMTYPE_DATETIME:
            return action(CimTypeTag<CIMDateTime>());
        case CIMTYPE_REFERENCE:
            return action(CimTypeTag<CIMObjectPath>());
        case CIMTYPE_OBJECT:
            return action(CimTypeTag<CIMObject>());
        default:
            return action(CimTypeTag<CIMInstance>());
    }
}

}  // namespace Pegasus
