// The text form of single values.
#pragma once

#include <Pegasus/Common/CIMValue.h>

namespace Pegasus {

void appendValueText(String& out, Boolean value);
void appendValueText(String& out, Uint64 value);
void appendValueText(String& out, Sint64 value);
void appendValueText(String& out, Real64 value);
void appendValueText(String& out, Char16 value);
void appendValueText(String& out, const String& value);
void appendValueText(String& out, const CIMDateTime& value);
void appendValueText(String& out, const CIMObjectPath& value);
void appendValueText(String& out, const CIMObject& value);
void appendValueText(String& out, const CIMInstance& value);

inline void appendValueText(String& out, Uint8 value) {
    appendValueText(out, Uint64{value});
}
inline void appendValueText(String& out, Uint16 value) {
    appendValueText(out, Uint64{value});
}
inline void appendValueText(String& out, Uint32 value) {
    appendValueText(out, Uint64{value});
}
inline void appendValueText(String& out, Sint8 value) {
    appendValueText(out, Sint64{value});
}
inline void appendValueText(String& out, Sint16 value) {
    appendValueText(out, Sint64{value});
}
inline void appendValueText(String& out, Sint32 value) {
    appendValueText(out, Sint64{value});
}
inline void appendValueText(String& out, Real32 value) {
    appendValueText(out, Real64{value});
}

}  // namespace Pegasus
