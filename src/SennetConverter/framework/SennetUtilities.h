#pragma once

// The rules by which titles and property names become names that the target products accept.

#include <Pegasus/Client/CIMClient.h>

namespace Pegasus {

/// Name rules that need no converter.
class SennetUtilities {
  public:
    static constexpr int numSubstituteKeys = 62;

    /// Words that are abbreviated, lower case and ascending, and what each becomes. Of two words
    /// that begin a name the later and so the longer one counts.
    static const String substituteKeysArray[numSubstituteKeys];
    static const String substituteValuesArray[numSubstituteKeys];

    /// Abbreviation of a word that begins, ignoring case, with a key: the whole word is replaced.
    /// A word that begins with none is returned unchanged.
    static String convertString(String word);

    /// Abbreviates each word between underscores; repeated, leading and trailing underscores go.
    static String substituteValues(String name);

    /// Shortens a name of more than maxLength - 5 characters to its first maxLength - 8 characters
    /// and a base-36 hash of the whole, and writes blanks as "_". A maxLength below 5 cuts nothing.
    static String hashString(String name, unsigned int maxLength);

    /// Column name for QVE: a reserved word replaced, blanks and parentheses as "_", cut to
    /// maxLength characters.
    static String formatPropertyName4quvelle(String name, unsigned int maxLength);

    /// Writes value in the radix (2 to 36, lower case) with a terminating NUL: the sign and the
    /// lowest four digits at most, so buffer holds 6 bytes or more.
    static void itoa(int value, char* buffer, int radix);

    /// The number in decimal.
    static String toDecimal(Sint64 number);
    static String toUnsignedDecimal(Uint64 number);

    /// A column length as the QVE databases take it: "255" when the text begins with a larger
    /// number, else unchanged.
    static String limitLength(const String& length);

    /// text with every occurrence of a character replaced.
    static String replaceAll(String text, char from, char to);

    /// text without blanks, CR, TAB and LF at both ends.
    static String trim(const String& text);

    /// The name under which a column or attribute is written: name, or name with suffix when it is
    /// (exactly) in usedNames. The result is added to usedNames, not compared again.
    static String makeUnique(const String& name, const String& suffix, Array<String>& usedNames);
};

}  // namespace Pegasus
