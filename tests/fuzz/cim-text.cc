// The readers of text in the CIM object model: UTF-8, names, datetimes and object paths.
//
// Whatever is accepted must come out again as it went in.
#include <Pegasus/Common/CIMDateTime.h>
#include <Pegasus/Common/CIMName.h>
#include <Pegasus/Common/CIMObjectPath.h>
#include <Pegasus/Common/CIMValue.h>
#include <Pegasus/Common/Exception.h>

#include <cstddef>
#include <cstdint>
#include <string>

#include "Require.h"

using namespace Pegasus;

namespace {

void checkUtf8(const String& text, const std::string& bytes) {
    const std::string back = static_cast<const char*>(text.getCString());
    require(back == bytes.substr(0, bytes.find('\0')));
}

void checkNames(const String& text) {
    if (CIMName::legal(text))
        require(CIMName(text).getString() == text);
    if (CIMNamespaceName::legal(text))
        require(CIMNamespaceName(text) == CIMNamespaceName(CIMNamespaceName(text).getString()));
}

void checkDateTime(const String& text) {
    try {
        require(CIMDateTime(text).toString() == text);
    } catch (const InvalidDateTimeFormatException&) {
    } catch (const DateTimeOutOfRangeException&) {
    }
}

void checkObjectPath(const String& text) {
    try {
        const CIMObjectPath path(text);
        const CIMObjectPath again(path.toString());
        require(again.identical(path));
        require(again.toString() == path.toString());
        CIMInstance owner("C");
        owner.addProperty(CIMProperty("P", CIMValue(path)));
        require(CIMValue(owner).toString().size() > path.getClassName().getString().size());
    } catch (const MalformedObjectNameException&) {
    }
}

}  // namespace

extern "C" int LLVMFuzzerTestOneInput(const std::uint8_t* data, std::size_t size) {
    const std::string bytes(reinterpret_cast<const char*>(data), size);
    String text;
    try {
        text = String(bytes.data(), static_cast<Uint32>(size));
    } catch (const Exception&) {
        return 0;
    }
    checkUtf8(text, bytes);
    checkNames(text);
    checkDateTime(text);
    checkObjectPath(text);
    return 0;
}
