#include "mof/MofParser.h"

#include <fmt/format.h>

#include <utility>

#include "mof/MofWords.h"
#include "text/Utf8.h"
#include "utf8/Utf8.h"

namespace cimomd {

MofParser::MofParser(std::string_view text, std::string_view fileName, MofErrorLog& errorLog)
    : tokens(text, fileName, errorLog), log(errorLog), file(fileName) {}

std::optional<MofDeclaration> MofParser::next() {
    while (!tokens.atEnd()) {
        tokens.forgetBrokenText();
        if (tokens.accept(";"))
            continue;
        try {
            if (std::optional<MofDeclaration> declaration = parseDeclaration())
                return declaration;
        } catch (const MofError& error) {
            report(error);
            skipDeclaration();
        }
    }
    return std::nullopt;
}

std::optional<MofDeclaration> MofParser::parseDeclaration() {
    if (tokens.at(MofTokenKind::Pragma))
        return parsePragma();
    if (tokens.atWord("qualifier"))
        return parseQualifierDeclaration();
    std::vector<MofQualifier> qualifiers = parseQualifierList();
    if (tokens.atWord("instance"))
        return parseInstance(std::move(qualifiers));
    if (tokens.atWord("class"))
        return parseClass(std::move(qualifiers));
    tokens.fail(qualifiers.empty() ? "'class', 'instance', 'qualifier' or '#pragma'"
                                   : "'class' or 'instance'");
}

/// A mistake ends with its line: pragmas have no semicolon to skip to.
std::optional<MofDeclaration> MofParser::parsePragma() {
    try {
        return parseDirective();
    } catch (const MofError& error) {
        report(error);
        while (!tokens.atEnd() && !tokens.atNewLine())
            tokens.take();
        return std::nullopt;
    }
}

std::optional<MofDeclaration> MofParser::parseDirective() {
    tokens.take();
    const MofName directive = parseName("a directive");
    const bool isInclude = equalsIgnoringCase(directive.text, "include");
    const bool isNamespace = equalsIgnoringCase(directive.text, "namespace");
    // Pragmas of other compilers need not have a parameter.
    if (!isInclude && !isNamespace && !tokens.atMark("("))
        return std::nullopt;
    tokens.expect("(");
    if (!isInclude && !isNamespace) {
        while (!tokens.atEnd() && !tokens.atMark(")") && !tokens.at(MofTokenKind::Pragma))
            tokens.take();
        tokens.expect(")");
        return std::nullopt;
    }
    if (!tokens.at(MofTokenKind::String))
        tokens.fail("a text in quotes");
    const MofToken argument = tokens.take();
    tokens.expect(")");
    MofName name{argument.characters, argument.position};
    if (isInclude)
        return MofInclude{std::move(name)};
    return MofNamespace{std::move(name)};
}

MofQualifierDeclaration MofParser::parseQualifierDeclaration() {
    MofQualifierDeclaration declaration;
    tokens.take();
    declaration.name = parseName("a qualifier's name");
    tokens.expect(":");
    declaration.type = parseType();
    parseArrayBounds(declaration.type);
    if (tokens.accept("="))
        declaration.defaultValue = parseLiteral();
    tokens.expect(",");
    if (!tokens.atWord("scope"))
        tokens.fail("'Scope'");
    declaration.scopes = parseScopes();
    if (tokens.accept(","))
        declaration.flavors = parseFlavorClause();
    parseEndOfDeclaration();
    return declaration;
}

QualifierScopes MofParser::parseScopes() {
    tokens.take();
    tokens.expect("(");
    QualifierScopes scopes = parseScope();
    while (tokens.accept(","))
        scopes |= parseScope();
    tokens.expect(")");
    return scopes;
}

QualifierScopes MofParser::parseScope() {
    const std::optional<QualifierScopes> scope = scopeNamed(tokens.current().text);
    if (!scope)
        tokens.fail("a scope such as class or property");
    tokens.take();
    return *scope;
}

std::vector<MofFlavor> MofParser::parseFlavorClause() {
    if (!tokens.atWord("flavor"))
        tokens.fail("'Flavor'");
    tokens.take();
    tokens.expect("(");
    std::vector<MofFlavor> flavors{parseFlavor()};
    while (tokens.accept(","))
        flavors.push_back(parseFlavor());
    tokens.expect(")");
    return flavors;
}

MofClass MofParser::parseClass(std::vector<MofQualifier> qualifiers) {
    MofClass out;
    out.qualifiers = std::move(qualifiers);
    tokens.take();
    out.name = parseName("a class name");
    parseAlias();
    if (tokens.accept(":"))
        out.superClass = parseName("a class name");
    out.isComplete = parseBody([&] { parseFeature(out); });
    return out;
}

void MofParser::parseFeature(MofClass& out) {
    MofProperty property;
    property.qualifiers = parseQualifierList();
    property.type = parseType();
    const bool isReference = property.type.type == Pegasus::CIMTYPE_REFERENCE;
    property.name = parseName(isReference ? "a reference name" : "a property name");
    if (!isReference && tokens.accept("(")) {
        out.methods.push_back({std::move(property.qualifiers), std::move(property.name),
                               std::move(property.type), parseParameters()});
        parseEndOfDeclaration();
        return;
    }
    if (!isReference)
        parseArrayBounds(property.type);
    if (tokens.accept("="))
        property.defaultValue = parseLiteral();
    out.properties.push_back(std::move(property));
    parseEndOfDeclaration();
}

std::vector<MofParameter> MofParser::parseParameters() {
    std::vector<MofParameter> parameters;
    if (tokens.accept(")"))
        return parameters;
    parameters.push_back(parseParameter());
    while (tokens.atMark(",")) {
        if (parameters.size() == kMaxParameters)
            tokens.fail(fmt::format("at most {} parameters", kMaxParameters));
        tokens.take();
        parameters.push_back(parseParameter());
    }
    if (!tokens.accept(")"))
        tokens.fail("',' or ')'");
    return parameters;
}

MofParameter MofParser::parseParameter() {
    MofParameter parameter;
    parameter.qualifiers = parseQualifierList();
    parameter.type = parseType();
    parameter.name = parseName("a parameter name");
    parseArrayBounds(parameter.type);
    return parameter;
}

MofInstance MofParser::parseInstance(std::vector<MofQualifier> qualifiers) {
    MofInstance out;
    out.qualifiers = std::move(qualifiers);
    tokens.take();
    if (!tokens.atWord("of"))
        tokens.fail("'of'");
    tokens.take();
    out.className = parseName("a class name");
    out.alias = parseAlias();
    out.isComplete = parseBody([&] { out.values.push_back(parsePropertyValue()); });
    return out;
}

std::optional<MofName> MofParser::parseAlias() {
    if (!tokens.atWord("as"))
        return std::nullopt;
    tokens.take();
    if (!tokens.at(MofTokenKind::Alias))
        tokens.fail("an alias such as $name");
    const MofToken alias = tokens.take();
    return MofName{alias.characters, alias.position};
}

MofPropertyValue MofParser::parsePropertyValue() {
    MofPropertyValue out;
    out.qualifiers = parseQualifierList();
    out.name = parseName("a property name");
    tokens.expect("=");
    out.value = parseLiteral();
    parseEndOfDeclaration();
    return out;
}

/// The part of a class or an instance between braces and the semicolon after it. False when a
/// mistake made it leave something out.
bool MofParser::parseBody(const std::function<void()>& parseOne) {
    bool isComplete = true;
    tokens.expect("{");
    while (!tokens.atMark("}")) {
        tokens.forgetBrokenText();
        if (tokens.accept(";"))
            continue;
        try {
            if (tokens.atEnd() || startsDeclaration())
                tokens.fail("'}'");
            parseOne();
        } catch (const MofError& error) {
            report(error);
            isComplete = false;
            skipFeature();
            if (tokens.atEnd() || startsDeclaration())
                return false;
        }
    }
    tokens.take();
    parseEndOfDeclaration();
    return isComplete;
}

/// A semicolon. Where it was forgotten at the end of a line, nothing needs to be skipped.
void MofParser::parseEndOfDeclaration() {
    if (tokens.accept(";"))
        return;
    if (!tokens.atNewLine() && !tokens.atMark("}") && !tokens.atEnd() && !startsDeclaration())
        tokens.fail("';'");
    report(MofError(file, tokens.current().position, tokens.shown(), "';'"));
}

std::vector<MofQualifier> MofParser::parseQualifierList() {
    if (!tokens.accept("["))
        return {};
    try {
        return parseQualifiers();
    } catch (const MofError& error) {
        if (!skipTo("]"))
            throw;
        report(error);
        return {};
    }
}

std::vector<MofQualifier> MofParser::parseQualifiers() {
    std::vector<MofQualifier> qualifiers{parseQualifier()};
    while (tokens.accept(",")) {
        if (qualifiers.size() == kMaxQualifiers)
            tokens.fail(fmt::format("at most {} qualifiers", kMaxQualifiers));
        // Some write commas between flavors too.
        if (!qualifiers.back().flavors.empty() && flavorNamed(tokens.current().text))
            qualifiers.back().flavors.push_back(parseFlavor());
        else
            qualifiers.push_back(parseQualifier());
    }
    if (!tokens.accept("]"))
        tokens.fail("',' or ']'");
    return qualifiers;
}

MofQualifier MofParser::parseQualifier() {
    MofQualifier qualifier;
    qualifier.name = parseName("a qualifier's name");
    if (tokens.accept("(")) {
        MofLiteral literal;
        literal.position = tokens.current().position;
        literal.elements.push_back(parseElement());
        tokens.expect(")");
        qualifier.value = std::move(literal);
    } else if (tokens.atMark("{")) {
        qualifier.value = parseLiteral();
    }
    if (tokens.accept(":"))
        qualifier.flavors = parseQualifierFlavors();
    return qualifier;
}

std::vector<MofFlavor> MofParser::parseQualifierFlavors() {
    std::vector<MofFlavor> flavors{parseFlavor()};
    while (tokens.at(MofTokenKind::Identifier)) {
        if (flavors.size() == kMaxQualifiers)
            tokens.fail(fmt::format("at most {} flavors", kMaxQualifiers));
        flavors.push_back(parseFlavor());
    }
    return flavors;
}

MofFlavor MofParser::parseFlavor() {
    const std::optional<FlavorWord> flavor = flavorNamed(tokens.current().text);
    if (!flavor)
        tokens.fail("a flavor such as ToSubclass");
    return {*flavor, tokens.take().position};
}

MofType MofParser::parseType() {
    MofType type;
    if (!tokens.at(MofTokenKind::Identifier))
        tokens.fail("a type");
    if (const std::optional<Pegasus::CIMType> known = typeNamed(tokens.current().text)) {
        type.type = *known;
        tokens.take();
        return type;
    }
    const MofToken className = tokens.take();
    if (!tokens.atWord("ref"))
        throw MofError(file, className.position, quotedText(className.text), "a type");
    tokens.take();
    type.type = Pegasus::CIMTYPE_REFERENCE;
    type.referenceClass = {utf8::clean(className.text), className.position};
    return type;
}

void MofParser::parseArrayBounds(MofType& type) {
    if (!tokens.accept("["))
        return;
    type.isArray = true;
    if (tokens.at(MofTokenKind::Integer)) {
        const MofToken& size = tokens.current();
        if (size.negative || size.magnitude == 0 || size.magnitude > UINT32_MAX)
            tokens.fail("an array size from 1 to 4294967295");
        type.arraySize = static_cast<std::uint32_t>(size.magnitude);
        tokens.take();
    }
    tokens.expect("]");
}

MofLiteral MofParser::parseLiteral() {
    MofLiteral literal;
    literal.position = tokens.current().position;
    if (!tokens.accept("{")) {
        literal.elements.push_back(parseElement());
        return literal;
    }
    literal.isArray = true;
    try {
        parseElements(literal);
    } catch (const MofError& error) {
        if (!skipTo("}"))
            throw;
        report(error);
    }
    return literal;
}

void MofParser::parseElements(MofLiteral& literal) {
    if (tokens.accept("}"))
        return;
    literal.elements.push_back(parseElement());
    while (tokens.accept(",")) {
        if (literal.elements.size() == kMaxArrayElements)
            tokens.fail(fmt::format("at most {} elements", kMaxArrayElements));
        // Some write a comma behind the last element too.
        if (tokens.atMark("}"))
            break;
        literal.elements.push_back(parseElement());
    }
    if (!tokens.accept("}"))
        tokens.fail("',' or '}'");
}

MofElement MofParser::parseElement() {
    const MofToken& token = tokens.current();
    MofElement element;
    element.position = token.position;
    element.text = token.text;
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
    else if (token.kind == MofTokenKind::Alias)
        element.value = MofAlias{token.characters};
    else if (tokens.atWord("true") || tokens.atWord("false"))
        element.value = tokens.atWord("true");
    else if (!tokens.atWord("null"))
        tokens.fail("a value");
    tokens.take();
    return element;
}

void MofParser::parseString(MofElement& element) {
    std::string text = tokens.take().characters;
    while (tokens.at(MofTokenKind::String))
        text += tokens.take().characters;
    element.value = std::move(text);
}

MofName MofParser::parseName(std::string_view expected) {
    if (!tokens.at(MofTokenKind::Identifier))
        tokens.fail(expected);
    const MofToken name = tokens.take();
    return {utf8::clean(name.text), name.position};
}

/// Behind a text without an end nothing fits, and only the text is at fault.
void MofParser::report(const MofError& error) {
    if (!tokens.isBehindBrokenText())
        log.add(file, error);
}

/// Whether a declaration begins here for certain, whatever braces are still open.
bool MofParser::startsDeclaration() const {
    return tokens.at(MofTokenKind::Pragma) ||
           (tokens.current().position.column == 1 &&
            (tokens.atWord("class") || tokens.atWord("instance") || tokens.atWord("qualifier")));
}

/// After a mistake: to the end of the declaration.
void MofParser::skipDeclaration() {
    std::size_t depth = 0;
    while (!tokens.atEnd() && !startsDeclaration()) {
        if (tokens.atMark("{"))
            ++depth;
        else if (tokens.atMark("}") && depth > 0)
            --depth;
        const bool isLast = depth == 0 && tokens.atMark(";");
        tokens.take();
        if (isLast)
            return;
    }
}

/// After a mistake: to the end of the feature, or to the end of what it is in.
void MofParser::skipFeature() {
    std::size_t depth = 0;
    while (!tokens.atEnd() && !startsDeclaration()) {
        if (depth == 0 && tokens.atMark("}"))
            return;
        if (tokens.atMark("{"))
            ++depth;
        else if (tokens.atMark("}"))
            --depth;
        const bool isLast = depth == 0 && tokens.atMark(";");
        tokens.take();
        if (isLast)
            return;
    }
}

/// After a mistake in a list: past its closing mark. False when it seems to have none.
bool MofParser::skipTo(std::string_view closing) {
    while (!tokens.atEnd() && !startsDeclaration() && !tokens.atMark(";")) {
        if (tokens.accept(closing))
            return true;
        tokens.take();
    }
    return false;
}

}  // namespace cimomd
