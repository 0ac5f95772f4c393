#include <Pegasus/Common/CIMName.h>
#include <Pegasus/Common/Exception.h>

#include "AsciiCase.h"

namespace Pegasus {

namespace {

Boolean isLetter(Uint16 code) {
    const Uint16 lower = toAsciiLower(code);
    return (lower >= 'a' && lower <= 'z') || code == '_' || code > 127;
}

Boolean isDigit(Uint16 code) {
    return code >= '0' && code <= '9';
}

/// FNV-1a of the name in lower case.
Uint32 hashOf(const String& name) {
    Uint32 hash = 2166136261U;
    const Char16* const text = name.getChar16Data();
    for (Uint32 i = 0; i < name.size(); ++i)
        hash = (hash ^ toAsciiLower(text[i])) * 16777619U;
    return hash;
}

}  // namespace

CIMName::CIMName(const String& name) : name(name), foldedHash(hashOf(name)) {
    if (!legal(name))
        throw InvalidNameException("\"" + name +
                                   "\" is not a CIM name: expected a letter or \"_\", then "
                                   "letters, digits and \"_\"");
}

CIMName::CIMName(const char* name) : CIMName(String(name)) {}

Boolean CIMName::legal(const String& name) {
    const Char16* const text = name.getChar16Data();
    if (!isLetter(text[0]))
        return false;
    for (Uint32 i = 1; i < name.size(); ++i) {
        if (!isLetter(text[i]) && !isDigit(text[i]))
            return false;
    }
    return true;
}

void CIMName::clear() {
    *this = CIMName();
}

}  // namespace Pegasus
