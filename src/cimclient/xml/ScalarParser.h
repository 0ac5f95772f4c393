// Reads the text forms of CIM values (DSP0201, "VALUE" and "Representation of values").
//
// The functions return false when the text is no value of the type, and leave `value` as it was.
// All but the one for strings ignore white space around the value. None depends on the locale.

#pragma once

#include <Pegasus/Common/CIMDateTime.h>
#include <Pegasus/Common/Char16.h>
#include <Pegasus/Common/Config.h>
#include <Pegasus/Common/String.h>

#include <string_view>

#include "xml/ElementReader.h"

namespace Pegasus {

/// "true" or "false" in any case.
bool parseScalar(const ElementText& text, Boolean& value);

/// Decimal or, after "0x", hexadecimal digits; a sign may stand before, for unsigned types only
/// "+". False also for what is out of the type's range.
bool parseScalar(const ElementText& text, Uint8& value);
bool parseScalar(const ElementText& text, Sint8& value);
bool parseScalar(const ElementText& text, Uint16& value);
bool parseScalar(const ElementText& text, Sint16& value);
bool parseScalar(const ElementText& text, Uint32& value);
bool parseScalar(const ElementText& text, Sint32& value);
bool parseScalar(const ElementText& text, Uint64& value);
bool parseScalar(const ElementText& text, Sint64& value);

/// Decimal, with or without point and exponent. Infinities and NaN are refused, as is a number too
/// large for the type; one too small becomes zero.
bool parseScalar(const ElementText& text, Real32& value);
bool parseScalar(const ElementText& text, Real64& value);

/// Exactly one character of 16 bits, which may be white space.
bool parseScalar(const ElementText& text, Char16& value);

/// Any text: it is taken without the white space at its ends.
bool parseScalar(const ElementText& text, String& value);

/// The 25 characters of a datetime, or nothing for the interval of zero length. Asterisks may stand
/// in time stamps only.
bool parseScalar(const ElementText& text, CIMDateTime& value);

/// The text as a String; `utf8` must be UTF-8.
String makeString(std::string_view utf8);

}  // namespace Pegasus
