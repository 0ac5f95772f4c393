#include "mof/MofParser.h"

#include <fmt/format.h>

#include <array>
#include <utility>

#include "text/Utf8.h"
#include "utf8/Utf8.h"

namespace cimomd {
namespace {

constexpr std::size_t kMaxShownText = 40;

struct NamedType {
    std::string_view name;
    Pegasus::CIMType type;
};

constexpr std::array<NamedType, 14> kTypes{{
    {"boolean", Pegasus::CIMTYPE_BOOLEAN},
    {"uint8", Pegasus::CIMTYPE_UINT8},
    {"sint8", Pegasus::CIMTYPE_SINT8},
    {"uint16", Pegasus::CIMTYPE_UINT16},
    {"sint16", Pegasus::CIMTYPE_SINT16},
    {"uint32", Pegasus::CIMTYPE_UINT32},
    {"sint32", Pegasus::CIMTYPE_SINT32},
    {"uint64", Pegasus::CIMTYPE_UINT64},
    {"sint64", Pegasus::CIMTYPE_SINT64},
    {"real32", Pegasus::CIMTYPE_REAL32},
    {"real64", Pegasus::CIMTYPE_REAL64},
    {"char16", Pegasus::CIMTYPE_CHAR16},
    {"string", Pegasus::CIMTYPE_STRING},
    {"datetime", Pegasus::CIMTYPE_DATETIME},
}};

struct NamedScope {
    std::string_view name;
    QualifierScopes scope;
};

constexpr std::array<NamedScope, 10> kScopes{{
    {"class", kScopeClass},
    {"association", kScopeAssociation},
    {"indication", kScopeIndication},
    {"property", kScopeProperty},
    {"reference", kScopeReference},
    {"method", kScopeMethod},
    {"parameter", kScopeParameter},
    {"schema", kScopeSchema},
    {"qualifier", kScopeQualifier},
    {"any", kScopeAny},
}};

struct NamedFlavor {
    std::string_view name;
    FlavorWord word;
};

constexpr std::array<NamedFlavor, 5> kFlavors{{
    {"EnableOverride", FlavorWord::EnableOverride},
    {"DisableOverride", FlavorWord::DisableOverride},
    {"ToSubclass", FlavorWord::ToSubclass},
    {"Restricted", FlavorWord::Restricted},
    {"Translatable", FlavorWord::Translatable},
}};

/// The entry of that name in one of the tables above, or null.
template <typename Table>
auto findNamed(const Table& table, std::string_view name) -> const typename Table::value_type* {
    for (const auto& entry : table) {
        if (equalsIgnoringCase(entry.name, name))
            return &entry;
    }
    return nullptr;
}

std::string describe(const MofToken& token) {
    if (token.kind == MofTokenKind::End)
        return "the end of the file";
    if (token.text.size() > kMaxShownText)
        return cleanText(token.text.substr(0, kMaxShownText)) + "...";
    return cleanText(token.text);
}

}  // namespace

MofParser::MofParser(std::string_view text, std::string_view fileName)
    : lexer(text, fileName), file(fileName) {}

std::vector<MofDeclaration> MofParser::parse() {
    std::vector<MofDeclaration> out;
    token = lexer.next();
    while (token.kind != MofTokenKind::End) {
        if (token.kind == MofTokenKind::Pragma)
            parsePragma(out);
        else if (atWord("qualifier"))
            out.emplace_back(parseQualifierDeclaration());
        else
            out.emplace_back(parseClass());
    }
    return out;
}

void MofParser::parsePragma(std::vector<MofDeclaration>& out) {
    take();
    const MofName directive = parseName("a directive");
    expect("(");
    if (token.kind != MofTokenKind::String)
        fail("a text in quotes");
    const MofToken argument = take();
    expect(")");
    MofName name{argument.characters, argument.position};
    if (equalsIgnoringCase(directive.text, "include"))
        out.emplace_back(MofInclude{std::move(name)});
    else if (equalsIgnoringCase(directive.text, "namespace"))
        out.emplace_back(MofNamespace{std::move(name)});
}

MofQualifierDeclaration MofParser::parseQualifierDeclaration() {
    MofQualifierDeclaration declaration;
    take();
    declaration.name = parseName("a qualifier's name");
    expect(":");
    declaration.type = parseType();
    parseArrayBounds(declaration.type);
    if (accept("="))
        declaration.defaultValue = parseLiteral();
    expect(",");
    if (!atWord("scope"))
        fail("Scope");
    declaration.scopes = parseScopes();
    if (accept(","))
        declaration.flavors = parseFlavorClause();
    expect(";");
    return declaration;
}

QualifierScopes MofParser::parseScopes() {
    take();
    expect("(");
    QualifierScopes scopes = parseScope();
    while (accept(","))
        scopes |= parseScope();
    expect(")");
    return scopes;
}

QualifierScopes MofParser::parseScope() {
    const NamedScope* scope = findNamed(kScopes, token.text);
    if (token.kind != MofTokenKind::Identifier || scope == nullptr)
        fail("a scope such as class or property");
    take();
    return scope->scope;
}

std::vector<MofFlavor> MofParser::parseFlavorClause() {
    if (!atWord("flavor"))
        fail("Flavor");
    take();
    expect("(");
    std::vector<MofFlavor> flavors{parseFlavor()};
    while (accept(","))
        flavors.push_back(parseFlavor());
    expect(")");
    return flavors;
}

MofClass MofParser::parseClass() {
    MofClass declaration;
    declaration.qualifiers = parseQualifierList();
    if (!atWord("class"))
        fail(declaration.qualifiers.empty() ? "class, qualifier or #pragma" : "class");
    take();
    declaration.name = parseName("a class name");
    if (accept(":"))
        declaration.superClass = parseName("a class name");
    expect("{");
    while (!atPunctuation("}"))
        declaration.properties.push_back(parseProperty());
    take();
    expect(";");
    return declaration;
}

std::vector<MofQualifier> MofParser::parseQualifierList() {
    std::vector<MofQualifier> qualifiers;
    if (!accept("["))
        return qualifiers;
    qualifiers.push_back(parseQualifier());
    while (accept(","))
        qualifiers.push_back(parseQualifier());
    if (!accept("]"))
        fail("',' or ']'");
    return qualifiers;
}

MofQualifier MofParser::parseQualifier() {
    MofQualifier qualifier;
    qualifier.name = parseName("a qualifier's name");
    if (accept("(")) {
        MofLiteral literal;
        literal.position = token.position;
        literal.elements.push_back(parseElement());
        expect(")");
        qualifier.value = std::move(literal);
    } else if (atPunctuation("{")) {
        qualifier.value = parseLiteral();
    }
    if (accept(":")) {
        qualifier.flavors.push_back(parseFlavor());
        while (token.kind == MofTokenKind::Identifier)
            qualifier.flavors.push_back(parseFlavor());
    }
    return qualifier;
}

MofFlavor MofParser::parseFlavor() {
    const NamedFlavor* flavor = findNamed(kFlavors, token.text);
    if (token.kind != MofTokenKind::Identifier || flavor == nullptr)
        fail("a flavor such as ToSubclass");
    return {flavor->word, take().position};
}

MofProperty MofParser::parseProperty() {
    MofProperty property;
    property.qualifiers = parseQualifierList();
    property.type = parseType();
    property.name = parseName("a property name");
    if (property.type.type != Pegasus::CIMTYPE_REFERENCE)
        parseArrayBounds(property.type);
    if (accept("="))
        property.defaultValue = parseLiteral();
    expect(";");
    return property;
}

MofType MofParser::parseType() {
    MofType type;
    if (token.kind != MofTokenKind::Identifier)
        fail("a type");
    const NamedType* known = findNamed(kTypes, token.text);
    if (known != nullptr) {
        type.type = known->type;
        take();
        return type;
    }
    const MofToken className = take();
    if (!atWord("ref"))
        throw MofError(file, className.position, describe(className), "a type");
    take();
    type.type = Pegasus::CIMTYPE_REFERENCE;
    type.referenceClass = utf8::clean(className.text);
    return type;
}

void MofParser::parseArrayBounds(MofType& type) {
    if (!accept("["))
        return;
    type.isArray = true;
    if (token.kind == MofTokenKind::Integer) {
        if (token.negative || token.magnitude == 0 || token.magnitude > UINT32_MAX)
            fail("an array size from 1 to 4294967295");
        type.arraySize = static_cast<std::uint32_t>(take().magnitude);
    }
    expect("]");
}

MofLiteral MofParser::parseLiteral() {
    MofLiteral literal;
    literal.position = token.position;
    if (!accept("{")) {
        literal.elements.push_back(parseElement());
        return literal;
    }
    literal.isArray = true;
    if (accept("}"))
        return literal;
    literal.elements.push_back(parseElement());
    while (accept(","))
        literal.elements.push_back(parseElement());
    if (!accept("}"))
        fail("',' or '}'");
    return literal;
}

MofElement MofParser::parseElement() {
    MofElement element;
    element.position = token.position;
    element.text = describe(token);
    if (token.kind == MofTokenKind::String) {
        parseString(element);
        return element;
    }
    if (token.kind == MofTokenKind::Integer)
        element.value = MofInteger{token.negative, token.magnitude};
    else if (token.kind == MofTokenKind::Real)
        element.value = token.real;
    else if (token.kind == MofTokenKind::Char)
        element.value = MofChar{token.characters};
    else if (atWord("true") || atWord("false"))
        element.value = atWord("true");
    else if (!atWord("null"))
        fail("a value");
    take();
    return element;
}

void MofParser::parseString(MofElement& element) {
    std::string text;
    while (token.kind == MofTokenKind::String)
        text += take().characters;
    element.value = std::move(text);
}

MofName MofParser::parseName(std::string_view expected) {
    if (token.kind != MofTokenKind::Identifier)
        fail(expected);
    const MofToken name = take();
    return {utf8::clean(name.text), name.position};
}

bool MofParser::atPunctuation(std::string_view mark) const {
    return token.kind == MofTokenKind::Punctuation && token.text == mark;
}

bool MofParser::atWord(std::string_view word) const {
    return token.kind == MofTokenKind::Identifier && equalsIgnoringCase(token.text, word);
}

bool MofParser::accept(std::string_view mark) {
    if (!atPunctuation(mark))
        return false;
    take();
    return true;
}

void MofParser::expect(std::string_view mark) {
    if (!accept(mark))
        fail(fmt::format("'{}'", mark));
}

MofToken MofParser::take() {
    return std::exchange(token, lexer.next());
}

void MofParser::fail(std::string_view expected) const {
    throw MofError(file, token.position, describe(token), expected);
}

}  // namespace cimomd
