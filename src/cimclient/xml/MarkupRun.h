// The markup around the texts of an element that was read, by which its likes are recognised.
//
// In an answer with many instances all but the values repeats. Octets that are equal to octets that
// were read, in the same place of the grammar, mean the same: comparing them takes the place of
// reading them.

#pragma once

#include <cstddef>
#include <optional>
#include <string>
#include <string_view>

namespace Pegasus {

struct MarkupRun {
    /// Up to the first text; everything when there is none.
    std::string before;
    /// From one text to the next; empty where not more than one text was seen.
    std::string between;
    std::string after;
    bool hasText = false;
    /// Octets of the start tag before each text.
    std::size_t textTagSize = 0;

    /// The markup of `element`, the octets of one well-formed element whose texts, if any, are
    /// those of VALUE elements. Nothing when it is too long to be worth keeping, or when it has
    /// comments, instructions or CDATA sections.
    static std::optional<MarkupRun> of(std::string_view element, bool hasText);

    /// As of(), for an element with one text, which is that of a `leaf` element.
    static std::optional<MarkupRun> ofOneText(std::string_view element, std::string_view leaf);
};

}  // namespace Pegasus
