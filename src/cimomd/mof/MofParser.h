#pragma once

// Parses one MOF text (DSP0004) into its declarations: qualifier declarations, classes, instances
// and the pragmas include and namespace (all others are ignored).

#include <functional>
#include <optional>
#include <string_view>
#include <vector>

#include "mof/MofDeclarations.h"
#include "mof/MofErrorLog.h"
#include "mof/MofTokens.h"

namespace cimomd {

/// Recursive descent over one text, one function per production; looks one token ahead. After a
/// mistake it goes on with the next feature or declaration.
class MofParser {
  public:
    static constexpr std::size_t kMaxArrayElements = 1'000'000;
    static constexpr std::size_t kMaxQualifiers = 1000;
    static constexpr std::size_t kMaxParameters = 1000;

    /// `text` must stay alive while the parser and what it returned do, `log` while the parser
    /// does. `file` names the text in errors.
    MofParser(std::string_view text, std::string_view file, MofErrorLog& log);

    /// The next declaration, nothing at the end of the text. Mistakes go to the log.
    std::optional<MofDeclaration> next();

  private:
    std::optional<MofDeclaration> parseDeclaration();
    std::optional<MofDeclaration> parsePragma();
    std::optional<MofDeclaration> parseDirective();
    MofQualifierDeclaration parseQualifierDeclaration();
    QualifierScopes parseScopes();
    QualifierScopes parseScope();
    std::vector<MofFlavor> parseFlavorClause();
    MofClass parseClass(std::vector<MofQualifier> qualifiers);
    void parseFeature(MofClass& out);
    std::vector<MofParameter> parseParameters();
    MofParameter parseParameter();
    MofInstance parseInstance(std::vector<MofQualifier> qualifiers);
    std::optional<MofName> parseAlias();
    MofPropertyValue parsePropertyValue();
    bool parseBody(const std::function<void()>& parseOne);
    void parseEndOfDeclaration();
    std::vector<MofQualifier> parseQualifierList();
    std::vector<MofQualifier> parseQualifiers();
    MofQualifier parseQualifier();
    std::vector<MofFlavor> parseQualifierFlavors();
    MofFlavor parseFlavor();
    MofType parseType();
    void parseArrayBounds(MofType& type);
    MofLiteral parseLiteral();
    void parseElements(MofLiteral& literal);
    MofElement parseElement();
    void parseString(MofElement& element);
    MofName parseName(std::string_view expected);

    void report(const MofError& error);
    bool startsDeclaration() const;
    void skipDeclaration();
    void skipFeature();
    bool skipTo(std::string_view closing);

    MofTokens tokens;
    MofErrorLog& log;
    std::string_view file;
};

}  // namespace cimomd
