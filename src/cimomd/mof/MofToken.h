#pragma once

// The words of a MOF text.

#include <cstdint>
#include <string>
#include <string_view>

#include "mof/MofPosition.h"

namespace cimomd {

enum class MofTokenKind {
    Identifier,
    Integer,
    Real,
    String,
    Char,
    Punctuation,
    Pragma,
    Alias,
    End
};

/// One word. `text` looks into the lexed text and lives as long as that.
struct MofToken {
    MofTokenKind kind = MofTokenKind::End;
    std::string_view text;
    MofPosition position;
    /// Integer: the sign and the magnitude.
    bool negative = false;
    std::uint64_t magnitude = 0;
    /// Real: the value.
    double real = 0;
    /// String and Char: the characters meant, in UTF-8, escapes resolved. Alias: its name without
    /// the dollar sign.
    std::string characters;
};

/// A token's text as messages show it: cut when it is long, without bytes that are no UTF-8.
std::string shownText(std::string_view text);

/// The same between single quotes, unless quotes begin it already.
std::string quotedText(std::string_view text);

}  // namespace cimomd
