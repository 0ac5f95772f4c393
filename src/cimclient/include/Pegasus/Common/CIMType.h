// The data types of CIM values (DSP0004, "intrinsic data types", and embedded objects).
#pragma once

#include <Pegasus/Common/Config.h>

namespace Pegasus {

/// The underlying type is fixed so that a number that is no type can be carried and refused.
enum CIMType : Uint32 {
    CIMTYPE_BOOLEAN,
    CIMTYPE_UINT8,
    CIMTYPE_SINT8,
    CIMTYPE_UINT16,
    CIMTYPE_SINT16,
    CIMTYPE_UINT32,
    CIMTYPE_SINT32,
    CIMTYPE_UINT64,
    CIMTYPE_SINT64,
    CIMTYPE_REAL32,
    CIMTYPE_REAL64,
    CIMTYPE_CHAR16,
    CIMTYPE_STRING,
    CIMTYPE_DATETIME,
    CIMTYPE_REFERENCE,
    CIMTYPE_OBJECT,
    CIMTYPE_INSTANCE
};

/// The name DSP0004 gives the type ("uint8", "datetime"); "object" and "instance" for embedded
/// ones, "unknown" for a number that is no type. The text is static.
const char* cimTypeToString(CIMType type);

}  // namespace Pegasus
