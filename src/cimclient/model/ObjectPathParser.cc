#include "ObjectPathParser.h"

#include <Pegasus/Common/Exception.h>

#include <algorithm>
#include <charconv>
#include <string>
#include <string_view>
#include <utility>
#include <vector>

#include "Utf16.h"

namespace Pegasus {

namespace {

Boolean isHexadecimal(std::string_view digits) {
    return !digits.empty() &&
           digits.find_first_not_of("0123456789abcdefABCDEF") == std::string_view::npos;
}

Boolean isDecimal(std::string_view text) {
    constexpr std::string_view kDigits = "0123456789";
    // Keeps out the second sign and the "inf" and "nan" that from_chars takes.
    if (text.empty() || (text[0] != '.' && kDigits.find(text[0]) == std::string_view::npos))
        return false;
    const char* const end = text.data() + text.size();
    double number = 0;
    return std::from_chars(text.data(), end, number).ptr == end;
}

/// Decimal, 0x hexadecimal or real, with an optional sign.
Boolean isNumber(const String& text) {
    const std::string utf8 = encodeUtf8(text.getChar16Data(), text.size());
    std::string_view digits(utf8);
    if (digits.starts_with('-') || digits.starts_with('+'))
        digits.remove_prefix(1);
    if (digits.starts_with("0x") || digits.starts_with("0X"))
        return isHexadecimal(digits.substr(2));
    return isDecimal(digits);
}

Boolean hasDuplicates(const Array<CIMKeyBinding>& keys) {
    std::vector<String> names;
    for (const CIMKeyBinding& key : keys)
        names.push_back(key.getName().getString());
    std::sort(names.begin(), names.end(),
              [](const String& a, const String& b) { return String::compareNoCase(a, b) < 0; });
    return std::adjacent_find(names.begin(), names.end(), String::equalNoCase) != names.end();
}

}  // namespace

void requireHost(const String& host) {
    for (Uint32 i = 0; i < host.size(); ++i) {
        if (host[i] <= ' ' || host[i] == '/' || host[i] == 0x7F)
            throw MalformedObjectNameException(
                "\"" + host +
                "\" cannot be a host: it has a \"/\", a blank or a control character");
    }
}

void ObjectPathParser::parse(ObjectPathBody& path) {
    if (text.size() == 0)
        return;
    parseHost(path);
    parseNamespace(path);
    const Uint32 dot = std::min(text.find(at, '.'), text.size());
    path.className = readName(dot);
    if (at < text.size())
        parseKeys(path);
}

void ObjectPathParser::parseHost(ObjectPathBody& path) {
    if (String::compare(text, "//", 2) != 0)
        return;
    at = 2;
    const Uint32 slash = text.find(at, '/');
    if (slash == at || slash == PEG_NOT_FOUND)
        fail("a host and \"/\"");
    path.host = readUpTo(slash);
    requireHost(path.host);
    ++at;
}

void ObjectPathParser::parseNamespace(ObjectPathBody& path) {
    const Uint32 colon = findFirstOf(':', '.');
    if (colon == text.size() || text[colon] != ':')
        return;
    const String name = text.subString(at, colon - at);
    if (!CIMNamespaceName::legal(name))
        fail("a namespace name");
    path.nameSpace = CIMNamespaceName(name);
    at = colon + 1;
}

void ObjectPathParser::parseKeys(ObjectPathBody& path) {
    do {
        ++at;
        path.keyBindings.append(parseKey());
    } while (at < text.size() && text[at] == ',');
    if (at < text.size())
        fail("\",\" or the end");
    if (hasDuplicates(path.keyBindings))
        fail("each key once");
}

CIMKeyBinding ObjectPathParser::parseKey() {
    const CIMName key = readName(std::min(text.find(at, '='), text.size()));
    if (at == text.size())
        fail("\"=\"");
    ++at;
    if (text[at] == '"')
        return CIMKeyBinding(key, parseQuoted(), CIMKeyBinding::STRING);
    return parseBare(key);
}

String ObjectPathParser::parseQuoted() {
    String value;
    for (++at; at < text.size() && text[at] != '"'; ++at) {
        if (text[at] == '\\')
            ++at;
        if (at == text.size())
            break;
        value.append(text[at]);
    }
    if (at == text.size())
        fail("a closing quote");
    ++at;
    return value;
}

CIMKeyBinding ObjectPathParser::parseBare(const CIMName& key) {
    const String value = text.subString(at, std::min(text.find(at, ','), text.size()) - at);
    const Boolean isBoolean =
        String::equalNoCase(value, "TRUE") || String::equalNoCase(value, "FALSE");
    if (!isBoolean && !isNumber(value))
        fail("a quoted string, a number, TRUE or FALSE");
    at += value.size();
    return CIMKeyBinding(key, value, isBoolean ? CIMKeyBinding::BOOLEAN : CIMKeyBinding::NUMERIC);
}

CIMName ObjectPathParser::readName(Uint32 end) {
    const String name = text.subString(at, end - at);
    if (!CIMName::legal(name))
        fail("a name");
    at = end;
    return CIMName(name);
}

String ObjectPathParser::readUpTo(Uint32 end) {
    String part = text.subString(at, end - at);
    at = end;
    return part;
}

Uint32 ObjectPathParser::findFirstOf(Char16 a, Char16 b) const {
    return std::min({text.find(at, a), text.find(at, b), text.size()});
}

void ObjectPathParser::fail(const char* expected) const {
    throw MalformedObjectNameException("\"" + text + "\" is not an object path: expected " +
                                       String(expected) + " at position " +
                                       String(std::to_string(at).c_str()));
}

}  // namespace Pegasus
