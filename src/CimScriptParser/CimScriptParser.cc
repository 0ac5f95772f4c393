#include "CimScriptParser/CimScriptParser.h"

#include <Velm/PlatformUtilities.h>
#include <Velm/TextFile.h>

#include <cstdlib>
#include <cstring>

namespace Pegasus {

namespace {

constexpr int kOpenForReading = 0;
constexpr int kLineLimit = 1024;
constexpr char kDefaultSeparators[] = "\t=";
constexpr char kCimSeparators[] = "\t[]=";
constexpr char kPropertySeparators[] = ", ";
constexpr char kScriptSuffix[] = ".SCRIPT.INV";
constexpr Uint32 kScriptSuffixLength = sizeof kScriptSuffix - 1;

bool endsInScriptSuffix(const String& path) {
    return path.size() > kScriptSuffixLength &&
           String::equalNoCase(path.subString(path.size() - kScriptSuffixLength), kScriptSuffix);
}

// A number that no array reaches stands for all that are too large, so that the array's own bounds
// check refuses them too.
Uint32 toIndex(long slot) {
    constexpr long kBeyondAnyArray = 0x7FFFFFFF;
    return static_cast<Uint32>(slot < kBeyondAnyArray ? slot : kBeyondAnyArray);
}

}  // namespace

CimScriptParser::CimScriptParser(const String& scriptFileName)
    : fileName(scriptFileName),
      defaultNamespace("root/velmira"),
      namespaces(kSlots),
      classNames(kSlots),
      propertyLists(kSlots) {}

void CimScriptParser::parse() {
    Velm::TextFile file(fileName.getCString());
    file.open(kOpenForReading);

    char buffer[kLineLimit + 1] = {};
    bool inDefault = false;
    bool inCim = false;
    int length = 0;
    while ((length = file.readLine(buffer, kLineLimit)) >= 0) {
        if (length == 0) {
            continue;
        }
        buffer[length] = '\0';
        const String line(buffer);
        if (String::equal(line, "[DEFAULT]")) {
            inDefault = true;
            inCim = false;
        } else if (String::equal(line, "[CIM]")) {
            inCim = true;
            inDefault = false;
        } else if (inDefault) {
            parseDefault(line);
        } else if (inCim) {
            parseCim(line);
        }
        std::memset(buffer, 0, sizeof buffer);
    }
    fixUpArrays();
    file.close();
}

Uint32 CimScriptParser::getNumberOfClasses() const {
    return classNames.size();
}

String CimScriptParser::getClassName(int k) const {
    return hasSlot(k) ? classNames[static_cast<Uint32>(k)] : String();
}

CIMNamespaceName CimScriptParser::getNamespace(int k) const {
    if (hasSlot(k) && namespaces[static_cast<Uint32>(k)].size() > 0) {
        return CIMNamespaceName(namespaces[static_cast<Uint32>(k)]);
    }
    return CIMNamespaceName(defaultNamespace);
}

int CimScriptParser::getClassIndex(String className) const {
    for (Uint32 k = 0; k < classNames.size(); ++k) {
        if (String::equalNoCase(classNames[k], className)) {
            return static_cast<int>(k);
        }
    }
    return -1;
}

CIMPropertyList CimScriptParser::getPropertyList(int k) const {
    CIMPropertyList list;
    if (hasSlot(k)) {
        const Array<String> tokens =
            parseTokens(propertyLists[static_cast<Uint32>(k)], kPropertySeparators);
        Array<CIMName> names;
        for (Uint32 i = 0; i < tokens.size(); ++i) {
            names.append(CIMName(tokens[i]));
        }
        list.set(names);
    }
    return list;
}

String CimScriptParser::getTitle() const {
    if (title.size() > 0) {
        return title;
    }
    if (!endsInScriptSuffix(fileName)) {
        return fileName;
    }
    const String path = fileName.subString(0, fileName.size() - kScriptSuffixLength);
    const auto separator = static_cast<unsigned char>(Velm::PlatformUtilities::getSeparator());
    const Uint32 last = path.reverseFind(Char16(separator));
    return last == PEG_NOT_FOUND ? path : path.subString(last + 1);
}

int CimScriptParser::isSeparator(char c, const char* separators) {
    for (const char* separator = separators; *separator != '\0'; ++separator) {
        if (*separator == c) {
            return 1;
        }
    }
    return 0;
}

Array<String> CimScriptParser::parseTokens(const String& text, const char* separators) {
    const auto separates = [&](Uint32 i) {
        const Uint16 character = text[i];
        return isSeparator(static_cast<char>(character & 0xFF), separators) != 0;
    };
    Array<String> tokens;
    const Uint32 size = text.size();
    Uint32 start = 0;
    for (Uint32 i = 0; i < size; ++i) {
        const bool last = i == size - 1;
        if (!last && !separates(i)) {
            continue;
        }
        const Uint32 length = i - start + (last ? 1 : 0);
        const bool loneSeparator = length == 1 && separates(start);
        if (length > 0 && !loneSeparator) {
            tokens.append(text.subString(start, length));
        }
        start = i + 1;
    }
    return tokens;
}

void CimScriptParser::parseDefault(const String& line) {
    const Array<String> tokens = parseTokens(line, kDefaultSeparators);
    if (tokens.size() < 2) {
        return;
    }
    if (String::equalNoCase(tokens[0], "title")) {
        title = tokens[1];
    } else if (String::equalNoCase(tokens[0], "defaultnamespace")) {
        defaultNamespace = tokens[1];
    }
}

void CimScriptParser::parseCim(const String& line) {
    const Array<String> tokens = parseTokens(line, kCimSeparators);
    if (tokens.size() < 3) {
        return;
    }
    const long slot = std::strtol(tokens[1].getCString(), nullptr, 10);
    if (slot < 0) {
        return;
    }
    if (Array<String>* field = fieldOf(tokens[0])) {
        (*field)[toIndex(slot)] = tokens[2];
    }
}

void CimScriptParser::fixUpArrays() {
    Uint32 k = 0;
    while (k < classNames.size()) {
        if (classNames[k].size() > 0) {
            ++k;
            continue;
        }
        classNames.remove(k);
        namespaces.remove(k);
        propertyLists.remove(k);
    }
}

bool CimScriptParser::hasSlot(int k) const {
    return k >= 0 && static_cast<Uint32>(k) < classNames.size();
}

Array<String>* CimScriptParser::fieldOf(const String& letter) {
    if (String::equalNoCase(letter, "G")) {
        return &classNames;
    }
    if (String::equalNoCase(letter, "N")) {
        return &namespaces;
    }
    if (String::equalNoCase(letter, "A")) {
        return &propertyLists;
    }
    return nullptr;
}

}  // namespace Pegasus
