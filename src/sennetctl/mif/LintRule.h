#pragma once

// What is looked for in a MIF file, and how much it matters to which reader.

#include <optional>
#include <string>

#include "report/Finding.h"

namespace sennetctl {

/// Whose eyes a file is read with: the standard's, or those of an importing product.
enum class MifProfile { Dmi, Sms, Ca, LanDesk };

/// "dmi", "sms", "ca" or "landesk"; none for other texts.
std::optional<MifProfile> parseMifProfile(const std::string& name);

enum class LintRule {
    Structure,      ///< the grammar, Ids, keys, widths of rows
    TextAsInteger,  ///< a literal where the type is an integer
    IntegerAsText,  ///< a bare integer where the type is a string
    WideInteger,    ///< beyond 32 bits with sign where the type is Integer
    LongLiteral,    ///< longer than its type says
    NoKey,          ///< a class of several instances without a key
    RepeatedKey,    ///< two rows with one key
    ReservedName,   ///< a class that would alter the machine's own record
    FragileName,    ///< a trailing blank or a double quote, which old readers stumble over
    Unsupported,    ///< the word in place of a value
    CutText,        ///< longer than what the product keeps
    Encoding,       ///< octets beyond ASCII
    LargeFile,
    LostAttribute,  ///< missing, while an earlier file of the class had it
    RawLineEnd,     ///< in a literal
    ClassForm,      ///< not "body|name|version"
    NoComponentId,
    InvalidDate,
    EmptyDate,
    UnusedTemplate,  ///< a group that only describes rows, and no table has any
};

/// None when the profile does not mind.
std::optional<Severity> severityOf(LintRule rule, MifProfile profile);

}  // namespace sennetctl
